/**
 * What the picture shows: lanes with marks on an axis of milliseconds, either of session time or of media time.
 *
 * @typedef {import('./recording.js').Entry} Entry
 * @typedef {import('./recording.js').Recording} Recording
 * @typedef {import('./slices.js').Slice} Slice
 * @typedef {import('./standby.js').Fold} Fold
 *
 * @typedef {'session' | 'media'} TimeBase
 *
 * @typedef {object} Analysis a recording and what follows from it
 * @property {Recording} recording
 * @property {Slice[]} slices
 * @property {(bigint | null)[]} media the media time of each entry
 * @property {Fold[]} folds
 * @property {Map<string, number>} counts number of slices or instants of each track
 *
 * @typedef {object} Mark a slice, a piece of a slice or an instant
 * @property {number} start in milliseconds from the origin of the scene
 * @property {number} end the same as start for an instant
 * @property {string} label
 * @property {Entry} entry the instant, or what began the slice
 * @property {Slice | null} slice
 *
 * @typedef {object} Lane a track of one recording
 * @property {string} id
 * @property {string} track
 * @property {number} side 0 for the first recording, 1 for the second
 * @property {boolean} slices whether its marks are slices
 * @property {number} count of slices or instants
 * @property {Mark[]} marks in order of their start
 *
 * @typedef {object} Span a gap or a fold
 * @property {number} start in milliseconds from the origin of the scene
 * @property {number} end
 * @property {number} side
 *
 * @typedef {object} Scene
 * @property {TimeBase} base
 * @property {bigint} origin in ticks
 * @property {number} end of the last mark
 * @property {Lane[]} lanes from top to bottom
 * @property {Span[]} gaps
 * @property {Span[]} folds
 * @property {number} unplaced number of entries without a media time that can be drawn
 */

import { mediaTimes, piecesOf } from './mediatime.js';
import { countTracks, slicesOf } from './slices.js';
import { foldsOf } from './standby.js';
import { TicksPerMillisecond, TicksPerSecond } from './ticks.js';
import { InstantTracks, SliceTracks } from './tracks.js';

/** The timeline library works with dates. Later times are drawn at this one, about a hundred years. */
const MostMilliseconds = 3e12;

/** No play list is longer; a later position, such as one from a damaged log, would leave no room for the others. */
const LastPosition = 100n * 3600n * TicksPerSecond;

/**
 * @param {Recording} recording
 * @returns {Analysis}
 */
export function analyse(recording) {
  const { entries } = recording;
  const slices = slicesOf(entries);
  return {
    recording,
    slices,
    media: mediaTimes(entries),
    folds: foldsOf(entries, slices),
    counts: countTracks(entries, slices),
  };
}

/** @param {Entry} entry */
export function labelOf(entry) {
  if (entry.kind === 'gap') {
    const { lost, cause } = entry.values;
    return lost === undefined ? `${cause}` : `${cause}: ${lost} missing`;
  }
  return entry.kind === 'start' ? `${entry.values.wallClock}` : entry.name;
}

/**
 * @param {Analysis[]} analyses
 * @param {TimeBase} base
 * @returns {Scene}
 */
export function sceneOf(analyses, base) {
  const origin = base === 'media' ? 0n : originOf(analyses);
  const toMilliseconds = (/** @type {bigint} */ ticks) => (
    Math.min(Number((ticks - origin) / TicksPerMillisecond), MostMilliseconds));
  /** @type {Scene} */
  const scene = { base, origin, end: 0, lanes: [], gaps: [], folds: [], unplaced: 0 };

  analyses.forEach((analysis, side) => {
    const { entries } = analysis.recording;
    const media = analysis.media.map((time) => (time !== null && time <= LastPosition ? time : null));
    /** @type {Map<string, Lane>} */
    const lanes = new Map();
    for (const [track, count] of analysis.counts) {
      const slices = SliceTracks.includes(track);
      lanes.set(track, { id: `${track} ${side}`, track, side, slices, count, marks: [] });
    }
    const add = (/** @type {string} */ track, /** @type {Mark} */ mark) => {
      lanes.get(track)?.marks.push(mark);
      scene.end = Math.max(scene.end, mark.end);
    };
    for (const slice of analysis.slices) {
      const pieces = base === 'media' ? piecesOf(slice, entries, media) : [slice];
      for (const { start, end } of pieces) {
        add(slice.track, {
          start: toMilliseconds(start),
          end: toMilliseconds(end),
          label: slice.name,
          entry: entries[slice.first],
          slice,
        });
      }
    }
    for (const entry of entries) {
      const time = base === 'media' ? media[entry.index] : entry.ticks;
      if (time === null) {
        scene.unplaced += 1;
        continue;
      }
      const start = toMilliseconds(time);
      add(entry.track, { start, end: start, label: labelOf(entry), entry, slice: null });
      if (entry.kind === 'gap') {
        const before = base === 'media' || entry.index === 0 ? start : toMilliseconds(entries[entry.index - 1].ticks);
        scene.gaps.push({ start: before, end: start, side });
      }
    }
    for (const lane of lanes.values()) {
      lane.marks.sort((one, other) => one.start - other.start);
      scene.lanes.push(lane);
    }
  });
  sortByTrack(scene.lanes);
  if (base === 'session') {
    scene.folds = commonFolds(analyses).map(({ start, end }) => (
      { start: toMilliseconds(start), end: toMilliseconds(end), side: 0 }));
  }
  return scene;
}

/**
 * What is folded in all recordings.
 * @param {Analysis[]} analyses
 * @returns {Fold[]}
 */
function commonFolds(analyses) {
  return analyses.map(({ folds }) => folds).reduce((common, folds) => common.flatMap((one) => (
    folds.map((other) => ({
      start: one.start > other.start ? one.start : other.start,
      end: one.end < other.end ? one.end : other.end,
    })).filter(({ start, end }) => start < end))));
}

/**
 * The full second at or before the first entry, so that the axis shows session time, however late it begins.
 * @param {Analysis[]} analyses
 */
function originOf(analyses) {
  const firsts = analyses.flatMap(({ recording }) => recording.entries.slice(0, 1).map(({ ticks }) => ticks));
  const first = firsts.reduce((least, ticks) => (ticks < least ? ticks : least), firsts[0] ?? 0n);
  return first - (first % TicksPerSecond);
}

/**
 * Places the lanes of one track next to each other, in the order of the tracks.
 * @param {Lane[]} lanes
 */
function sortByTrack(lanes) {
  const seen = [...new Set(lanes.map(({ track }) => track))];
  const order = [...SliceTracks, ...InstantTracks, ...seen];
  lanes.sort((one, other) => order.indexOf(one.track) - order.indexOf(other.track) || one.side - other.side);
}
