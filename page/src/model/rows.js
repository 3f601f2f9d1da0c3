/**
 * The rows of the table: an entry each, or in a comparison a pair of entries.
 *
 * @typedef {import('./recording.js').Entry} Entry
 * @typedef {import('./compare.js').Pair} Pair
 * @typedef {Pair & { text: string }} Row with the text that a search looks at
 */

import { compare } from './compare.js';
import { searchText } from './search.js';

/**
 * @param {readonly (readonly Entry[])[]} recordings one or two
 * @param {bigint} [tolerance] of compare()
 * @returns {Row[]}
 */
export function rowsOf(recordings, tolerance) {
  const pairs = recordings.length > 1 ? compare(recordings[0], recordings[1], tolerance)
    : recordings[0].map((entry) => ({ a: entry, b: null, difference: null, changes: [], offset: null }));
  return pairs.map((pair) => ({
    ...pair,
    text: [pair.a, pair.b].map((entry) => (entry ? searchText(entry) : '')).join('\n'),
  }));
}

/**
 * @param {readonly Row[]} rows
 * @returns {[Map<number, number>, Map<number, number>]} for each recording the row of an entry by its index
 */
export function indexRows(rows) {
  /** @type {[Map<number, number>, Map<number, number>]} */
  const index = [new Map(), new Map()];
  rows.forEach(({ a, b }, row) => {
    if (a) {
      index[0].set(a.index, row);
    }
    if (b) {
      index[1].set(b.index, row);
    }
  });
  return index;
}
