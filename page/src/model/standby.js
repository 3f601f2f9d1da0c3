/**
 * Long standby, which would leave no room for playback. Its middle is folded: its ends remain visible.
 *
 * @typedef {import('./recording.js').Entry} Entry
 * @typedef {import('./slices.js').Slice} Slice
 *
 * @typedef {object} Fold a hidden part of a slice Standby, in ticks
 * @property {bigint} start
 * @property {bigint} end
 */

import { TicksPerSecond } from './ticks.js';

/** Shorter standby is always visible. */
const Shortest = 60n * TicksPerSecond;

/** What remains visible of a folded standby is this fraction of the rest of the recording, and at least a second. */
const Fraction = 20n;

/**
 * @param {readonly Entry[]} entries
 * @param {readonly Slice[]} slices of the same recording
 * @returns {Fold[]} without any callback in them
 */
export function foldsOf(entries, slices) {
  /** @type {Fold[]} */
  const idle = [];
  for (const slice of slices) {
    if (slice.track === 'playback' && slice.name === 'Standby') {
      for (let index = slice.first; index < (slice.last ?? entries.length - 1); index += 1) {
        const { ticks: start } = entries[index];
        const { ticks: end } = entries[index + 1];
        if (end - start >= Shortest) {
          idle.push({ start, end });
        }
      }
    }
  }
  const duration = entries.length > 0 ? entries[entries.length - 1].ticks - entries[0].ticks : 0n;
  const rest = idle.reduce((left, { start, end }) => left - (end - start), duration);
  const half = (rest / Fraction > TicksPerSecond ? rest / Fraction : TicksPerSecond) / 2n;
  return idle
    .filter(({ start, end }) => end - start > 4n * half)
    .map(({ start, end }) => ({ start: start + half, end: roundTime(end - 2n * half, end - half / 4n) }));
}

/**
 * The roundest time between two, because the axis counts on from the end of a fold.
 * @param {bigint} least
 * @param {bigint} most
 */
function roundTime(least, most) {
  for (const seconds of [3600n, 60n, 30n, 10n, 5n, 1n]) {
    const time = most - (most % (seconds * TicksPerSecond));
    if (time >= least) {
      return time;
    }
  }
  return most;
}
