/**
 * The differences between two recordings. Callbacks that are equal in name and arguments are aligned first; between
 * them, callbacks with the same name are paired: their arguments have changed.
 *
 * @typedef {import('./recording.js').Entry} Entry
 * @typedef {'added' | 'missing' | 'changed' | 'moved'} Difference
 *
 * @typedef {object} Pair
 * @property {Entry | null} a in the first recording
 * @property {Entry | null} b in the second recording
 * @property {Difference | null} difference
 * @property {string[]} changes names of the arguments that differ
 * @property {bigint | null} offset how much later b is than a, in ticks
 */

import { diff } from 'fast-myers-diff';

import { textOf } from './recording.js';

/** Offsets change by less than this between two runs of the same player: 100 ms. */
export const DefaultTolerance = 4500n;

/**
 * The names of the arguments that differ, those that only one has included.
 * @param {Entry} a
 * @param {Entry} b
 */
function changedArguments(a, b) {
  const names = new Set([...Object.keys(a.values), ...Object.keys(b.values)]);
  return [...names].filter((name) => (
    Object.hasOwn(a.values, name) !== Object.hasOwn(b.values, name)
    || textOf(a.values[name]) !== textOf(b.values[name])));
}

/** @param {Entry} entry */
const keyOf = (entry) => `${entry.kind} ${entry.track} ${entry.name} ${
  Object.entries(entry.values).map(([name, value]) => `${name}=${textOf(value)}`).sort().join(' ')}`;

/** @param {Entry} entry */
const nameOf = (entry) => `${entry.kind} ${entry.track} ${entry.name}`;

/**
 * The longest common subsequence by a key. Entries whose key the other recording lacks are left out beforehand: they
 * cost the search most.
 * @param {readonly Entry[]} a
 * @param {readonly Entry[]} b
 * @param {(entry: Entry) => string} key
 * @returns {[number, number][]} places in a and b
 */
function matchByKey(a, b, key) {
  const keys = [a.map(key), b.map(key)];
  /** @type {Map<string, number>} */
  const numbers = new Map();
  const inB = new Set(keys[1]);
  keys[0].forEach((text) => inB.has(text) && !numbers.has(text) && numbers.set(text, numbers.size));
  const places = keys.map((texts) => [...texts.keys()].filter((place) => numbers.has(texts[place])));
  const [codesOfA, codesOfB] = places.map((kept, side) => (
    Uint32Array.from(kept, (place) => /** @type {number} */ (numbers.get(keys[side][place])))));
  /** @type {[number, number][]} */
  const matches = [];
  let next = 0;
  let shift = 0;
  const matchUntil = (/** @type {number} */ end) => {
    for (; next < end; next += 1) {
      matches.push([places[0][next], places[1][next + shift]]);
    }
  };
  for (const [startA, endA, , endB] of diff(codesOfA, codesOfB)) {
    matchUntil(startA);
    next = endA;
    shift = endB - endA;
  }
  matchUntil(codesOfA.length);
  return matches;
}

/**
 * @param {readonly Entry[]} a
 * @param {readonly Entry[]} b
 * @param {((entry: Entry) => string)[]} keys the first aligns, the rest align what remains in between
 * @returns {[Entry | null, Entry | null][]}
 */
function align(a, b, keys) {
  /** @type {[Entry | null, Entry | null][]} */
  const pairs = [];
  const [key, ...rest] = keys;
  if (!key || a.length === 0 || b.length === 0) {
    a.forEach((entry) => pairs.push([entry, null]));
    b.forEach((entry) => pairs.push([null, entry]));
    return pairs;
  }
  let nextA = 0;
  let nextB = 0;
  for (const [inA, inB] of [...matchByKey(a, b, key), [a.length, b.length]]) {
    align(a.slice(nextA, inA), b.slice(nextB, inB), rest).forEach((pair) => pairs.push(pair));
    if (inA < a.length) {
      pairs.push([a[inA], b[inB]]);
    }
    nextA = inA + 1;
    nextB = inB + 1;
  }
  return pairs;
}

/**
 * @param {readonly Entry[]} a
 * @param {readonly Entry[]} b
 * @param {bigint} [tolerance] in ticks. A callback has moved in time if its offset differs by more than this from
 *   the offset at the last callback that moved: what shifts all that follows is one difference
 * @returns {Pair[]}
 */
export function compare(a, b, tolerance = DefaultTolerance) {
  let shift = 0n;
  return align(a, b, [keyOf, nameOf]).map(([inA, inB]) => {
    if (!inA || !inB) {
      return { a: inA, b: inB, difference: inA ? 'missing' : 'added', changes: [], offset: null };
    }
    const changes = changedArguments(inA, inB);
    const offset = inB.ticks - inA.ticks;
    const moved = offset - shift > tolerance || shift - offset > tolerance;
    if (moved) {
      shift = offset;
    }
    const difference = changes.length > 0 ? 'changed' : moved ? 'moved' : null;
    return { a: inA, b: inB, difference, changes, offset };
  });
}

/**
 * @param {readonly Pair[]} pairs
 * @returns {Record<Difference, number>}
 */
export function countDifferences(pairs) {
  const counts = { added: 0, missing: 0, changed: 0, moved: 0 };
  for (const { difference } of pairs) {
    if (difference) {
      counts[difference] += 1;
    }
  }
  return counts;
}
