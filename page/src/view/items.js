/**
 * Elements of the picture as the timeline library takes them.
 *
 * @typedef {import('../model/layout.js').Shape} Shape
 * @typedef {import('../model/scene.js').Lane} Lane
 * @typedef {import('../model/scene.js').Mark} Mark
 * @typedef {import('../model/scene.js').Span} Span
 * @typedef {import('../model/compare.js').Difference} Difference
 *
 * @typedef {object} Flags what the picture shows about an entry besides its time
 * @property {boolean} selected
 * @property {boolean} match
 * @property {boolean} dimmed a search is active, and this does not match
 * @property {Difference | null} difference
 *
 * @typedef {object} Item
 * @property {string} id
 * @property {string | undefined} group
 * @property {number} start
 * @property {number} end
 * @property {'range' | 'background'} type
 * @property {string} className
 * @property {HTMLElement | string} content
 * @property {string} [title]
 * @property {string} track for tests and styles
 * @property {number} count of slices or instants
 * @property {string} look changes if and only if the item must be drawn anew
 */

import { create } from './dom.js';

/** Slices and clusters of slices below these widths, in pixels, have no label. */
const LabelledSlice = 26;
const LabelledCluster = 15;

/** Tracks of instants with so few of them that there is room for labels. */
const Labelled = new Set(['gaps', 'starts']);

/** Symbols of differences, so that they do not depend on colour. */
export const Symbols = { added: '+', missing: '−', changed: '≠', moved: '→' };

/**
 * @param {Lane} lane
 * @param {Shape} shape
 * @param {number} scale milliseconds per pixel
 * @param {(mark: Mark, lane: Lane) => Flags} flagsOf
 * @returns {Item}
 */
export function toItem(lane, shape, scale, flagsOf) {
  const { marks } = shape;
  const [first] = marks;
  const flags = marks.map((mark) => flagsOf(mark, lane));
  const difference = flags.find((flag) => flag.difference)?.difference ?? null;
  const single = marks.length === 1;
  const classes = [
    lane.slices ? 'slice' : 'instant',
    `on-${lane.track.replaceAll(' ', '-')}`,
    single && lane.track === 'playback' ? `state-${first.label}` : '',
    single ? '' : 'cluster',
    flags.some((flag) => flag.selected) ? 'selected' : '',
    flags.some((flag) => flag.match) ? 'match' : '',
    flags.every((flag) => flag.dimmed) ? 'dimmed' : '',
    difference ? `difference ${difference}` : '',
  ];
  const width = (shape.end - shape.start) / scale;
  const hasLabel = lane.slices ? width >= (single ? LabelledSlice : LabelledCluster)
    : !single || Labelled.has(lane.track);
  const symbol = difference && (hasLabel || !lane.slices) ? Symbols[difference] : '';
  const label = hasLabel && (single || !symbol) ? (single ? first.label : String(marks.length)) : '';
  const text = [symbol, label].filter(Boolean).join(' ');
  const className = classes.filter(Boolean).join(' ');
  const start = Math.round(shape.start);
  const end = Math.max(Math.round(shape.end), start + 1);
  return {
    id: `${lane.id} ${first.entry.index} ${start}`,
    group: lane.id,
    start,
    end,
    type: 'range',
    className,
    content: create('span', {}, text),
    title: single ? escapeMarkup(first.label) : `${marks.length} ${lane.slices ? 'slices' : 'callbacks'}`,
    track: lane.track,
    count: marks.length,
    look: `${end} ${className} ${text}`,
  };
}

/** The library takes titles as markup. @param {string} text */
const escapeMarkup = (text) => text.replaceAll('&', '&amp;').replaceAll('<', '&lt;');

/**
 * @param {readonly Span[]} spans in order of their start
 * @param {number} least width in milliseconds
 * @returns {Span[]} those that would overlap as one
 */
export function mergeSpans(spans, least) {
  /** @type {Span[]} */
  const merged = [];
  for (const span of spans) {
    const end = Math.max(span.end, span.start + least);
    const before = merged.at(-1);
    if (before && before.side === span.side && span.start < before.end) {
      before.end = Math.max(before.end, end);
    } else {
      merged.push({ ...span, end });
    }
  }
  return merged;
}

/**
 * @param {string} name
 * @param {Span} span
 * @param {string} [group] without it the background spans all lanes
 * @returns {Item}
 */
export function toBackground(name, span, group) {
  const start = Math.round(span.start);
  const end = Math.round(span.end);
  return {
    id: `${name} ${group ?? ''} ${start}`,
    group,
    start,
    end,
    type: 'background',
    className: name,
    content: '',
    track: '',
    count: 0,
    look: String(end),
  };
}
