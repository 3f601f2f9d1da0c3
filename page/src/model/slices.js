/**
 * The lasting states of a recording.
 *
 * @typedef {import('./recording.js').Entry} Entry
 *
 * @typedef {object} Slice
 * @property {string} track
 * @property {string} name
 * @property {bigint} start in ticks
 * @property {bigint} end in ticks
 * @property {number} first index of the entry that began it
 * @property {number | null} last index of the entry that ended it; null if the recording ended first
 */

import { Effects, InstantTracks, SliceTracks, tracksOf } from './tracks.js';

/**
 * @param {readonly Entry[]} entries
 * @returns {Slice[]} in order of their beginning
 */
export function slicesOf(entries) {
  /** @type {Slice[]} */
  const slices = [];
  /** @type {Map<string, Slice>} */
  const open = new Map();
  const state = {
    current: (/** @type {string} */ track) => open.get(track)?.name,
    beforeSuspension: 'Playing',
  };

  /** @param {string} track @param {Entry} entry */
  const end = (track, entry) => {
    const slice = open.get(track);
    if (slice) {
      slice.end = entry.ticks;
      slice.last = entry.index;
      open.delete(track);
    }
  };

  for (const entry of entries) {
    if (entry.kind === 'gap') {
      // Any state may have changed in it.
      [...open.keys()].forEach((track) => end(track, entry));
      continue;
    }
    const effect = entry.kind === 'callback' && Object.hasOwn(Effects, entry.name) ? Effects[entry.name] : undefined;
    if (!effect) {
      continue;
    }
    const name = effect.begins ? effect.begins(entry, state) : null;
    if (name === undefined) {
      continue;
    }
    if (entry.name === 'Suspended') {
      state.beforeSuspension = state.current('playback') ?? 'Playing';
    }
    for (const track of tracksOf(effect, name)) {
      end(track, entry);
      if (name !== null) {
        const slice = { track, name, start: entry.ticks, end: entry.ticks, first: entry.index, last: null };
        open.set(track, slice);
        slices.push(slice);
      }
    }
  }
  const lastTime = entries.at(-1)?.ticks ?? 0n;
  open.forEach((slice) => {
    slice.end = lastTime;
  });
  return slices;
}

/**
 * The tracks that a recording uses, from top to bottom, with the number of their slices or instants.
 * @param {readonly Entry[]} entries
 * @param {readonly Slice[]} slices
 * @returns {Map<string, number>}
 */
export function countTracks(entries, slices) {
  /** @type {Map<string, number>} */
  const counts = new Map();
  for (const { track } of [...slices, ...entries]) {
    counts.set(track, (counts.get(track) ?? 0) + 1);
  }
  const known = [...SliceTracks, ...InstantTracks];
  const order = (/** @type {string} */ track) => (known.includes(track) ? known.indexOf(track) : known.length);
  return new Map([...counts].sort(([one], [other]) => order(one) - order(other)));
}
