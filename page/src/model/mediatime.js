/**
 * The media time of a recording's entries: the position on the play list that playback had reached. Only
 * CurrentTimePosition and Stepped report it. Between them the page does not guess: an entry has the position that was
 * reported last. After a jump, or where playback begins, that is the one reported next at the same time.
 *
 * @typedef {import('./recording.js').Entry} Entry
 * @typedef {import('./slices.js').Slice} Slice
 *
 * @typedef {object} Piece a part of a slice in which media time runs in one direction
 * @property {bigint} start in ticks, not after end
 * @property {bigint} end
 */

import { isInteger } from './ticks.js';

/** After these the position reported last is no longer that of playback. */
const Jumps = new Set(['gap', 'Playlist', 'PlayStarted', 'JumpOccurred']);

/**
 * @param {Entry} entry
 * @returns {bigint | null | undefined} the reported position; null if it is none or absent, undefined without a report
 */
export function reportedPosition(entry) {
  if (entry.name !== 'CurrentTimePosition' && entry.name !== 'Stepped') {
    return undefined;
  }
  const { position } = entry.values;
  return isInteger(position) ? BigInt(position) : null;
}

/**
 * @param {readonly Entry[]} entries
 * @returns {(bigint | null)[]} for each entry its media time, or null if it is unknown
 */
export function mediaTimes(entries) {
  /** @type {bigint | null} */
  let current = null;
  /** The first entry since a jump, while no position is known. */
  let waiting = 0;
  /** @type {(bigint | null)[]} */
  const times = [];
  entries.forEach((entry, index) => {
    const reported = reportedPosition(entry);
    if (entry.kind === 'gap') {
      // A gap is drawn where playback was when it began.
      times.push(current);
      current = null;
      waiting = index + 1;
      return;
    }
    if (reported !== undefined) {
      for (let i = index - 1; reported !== null && i >= waiting && entries[i].ticks === entry.ticks; i -= 1) {
        times[i] ??= reported;
      }
      current = reported;
      waiting = index + 1;
    } else if (Jumps.has(entry.name)) {
      waiting = current === null ? waiting : index;
      current = null;
    }
    times.push(current);
  });
  return times;
}

/**
 * Cuts a slice where media time jumps, turns round or is unknown.
 * @param {Slice} slice
 * @param {readonly Entry[]} entries
 * @param {readonly (bigint | null)[]} times of mediaTimes()
 * @returns {Piece[]} empty if no position is known in the slice
 */
export function piecesOf(slice, entries, times) {
  /** @type {Piece[]} */
  const pieces = [];
  /** @type {Piece | null} */
  let piece = null;
  let previous = 0n;
  let direction = 0;
  const last = slice.last ?? entries.length - 1;
  for (let index = slice.first; index <= last; index += 1) {
    const time = times[index];
    if (time === null) {
      piece = null;
      continue;
    }
    const turn = Math.sign(Number(time - previous));
    if (!piece || Jumps.has(entries[index].name) || turn * direction < 0) {
      piece = { start: time, end: time };
      pieces.push(piece);
      direction = 0;
    } else {
      direction = turn || direction;
      piece.start = time < piece.start ? time : piece.start;
      piece.end = time > piece.end ? time : piece.end;
    }
    previous = time;
  }
  const lasting = pieces.filter(({ start, end }) => start < end);
  return lasting.length > 0 ? lasting : pieces.slice(0, 1);
}
