/**
 * The search for callbacks: all words must occur in the name, the interface or an argument, such as "PlayItem" or
 * "playListId=1". "-word" excludes, quotation marks keep blanks.
 *
 * @typedef {import('./recording.js').Entry} Entry
 */

import { argumentsText, textOf } from './recording.js';

/**
 * @param {Entry} entry
 * @returns {string} in lower case
 */
export function searchText(entry) {
  const tags = Object.entries(entry.tags).map(([name, value]) => `${name}=${textOf(value)}`);
  return [entry.name, argumentsText(entry), entry.track, ...tags].join(' ').toLowerCase();
}

/**
 * @param {string} query
 * @returns {((text: string) => boolean) | null} takes the text of an entry; null if the query is empty
 */
export function matcher(query) {
  const words = [...query.toLowerCase().matchAll(/(-?)(?:"([^"]*)"?|(\S+))/g)]
    .map(([, minus, quoted, bare]) => ({ wanted: minus === '', text: quoted ?? bare }))
    .filter(({ text }) => text !== '');
  return words.length === 0 ? null : (text) => words.every((word) => text.includes(word.text) === word.wanted);
}
