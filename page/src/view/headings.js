/**
 * The texts above and below the picture.
 *
 * @typedef {import('../model/scene.js').Analysis} Analysis
 * @typedef {import('../model/scene.js').Lane} Lane
 * @typedef {import('../model/scene.js').Mark} Mark
 * @typedef {import('../model/scene.js').Scene} Scene
 * @typedef {import('../model/rows.js').Row} Row
 */

import { countDifferences } from '../model/compare.js';
import { formatDuration, formatTime } from '../model/ticks.js';
import { create, get, plural } from './dom.js';
import { Symbols } from './items.js';

/** @param {Analysis} analysis */
function summaryOf({ recording: { entries } }) {
  const count = (/** @type {string} */ kind) => entries.filter((entry) => entry.kind === kind).length;
  const gaps = count('gap');
  const duration = entries.length > 0 ? entries[entries.length - 1].ticks - entries[0].ticks : 0n;
  return [
    plural(count('callback'), 'callback'),
    formatDuration(duration),
    ...(gaps > 0 ? [plural(gaps, 'gap')] : []),
  ].join(', ');
}

/** @param {readonly Analysis[]} analyses */
export function showHeader(analyses) {
  const names = analyses.map(({ recording }) => recording.name);
  document.title = `${names.join(' and ')} – Timeline`;
  const summary = get('summary', HTMLParagraphElement);
  if (analyses.length === 1) {
    get('title', HTMLHeadingElement).textContent = names[0];
    summary.textContent = summaryOf(analyses[0]);
    return;
  }
  get('title', HTMLHeadingElement).textContent = 'Comparison';
  summary.replaceChildren(...analyses.flatMap((analysis, side) => [
    create('span', { class: 'side' }, create('b', {}, 'AB'[side]), ` ${names[side]}: ${summaryOf(analysis)}`),
  ]));
}

/** @param {readonly Row[]} rows */
export function showDifferenceCounts(rows) {
  const counts = countDifferences(rows);
  const all = Object.values(counts).reduce((sum, count) => sum + count, 0);
  const kinds = /** @type {(keyof typeof counts)[]} */ (Object.keys(counts)).filter((kind) => counts[kind] > 0);
  get('difference-counts', HTMLSpanElement).replaceChildren(
    create('b', {}, all === 0 ? 'No differences' : plural(all, 'difference')),
    ...kinds.map((kind) => (
      create('span', { class: `difference ${kind}` }, `${Symbols[kind]} ${counts[kind]} ${kind}`))));
}

/**
 * @param {Set<number> | null} matches null without a search
 * @param {number} selected row
 * @param {number} all number of rows
 */
export function showMatches(matches, selected, all) {
  const output = get('matches', HTMLOutputElement);
  let text = '';
  if (matches) {
    const place = [...matches].indexOf(selected);
    text = matches.size === 0 ? 'No matches'
      : place < 0 ? `${matches.size} of ${all} match` : `Match ${place + 1} of ${matches.size}`;
  }
  if (output.textContent !== text) {
    output.textContent = text;
  }
}

/** @param {Scene} scene */
export function showNote({ base, unplaced }) {
  get('picture-note', HTMLParagraphElement).textContent = base === 'media' && unplaced > 0
    ? `${plural(unplaced, 'callback')} without a media time ${unplaced === 1 ? 'is' : 'are'} only in the table.`
    : '';
}

/**
 * @param {Lane} lane
 * @param {Mark} mark
 */
export function describeMark(lane, mark) {
  const place = `${lane.marks.indexOf(mark) + 1} of ${lane.marks.length}`;
  const time = mark.slice ? `from ${formatTime(mark.slice.start)} to ${formatTime(mark.slice.end)}`
    : `at ${formatTime(mark.entry.ticks)}`;
  return `${lane.track}: ${mark.label} ${time}, ${place}`;
}
