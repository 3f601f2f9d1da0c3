/**
 * Reads the JSON lines of a recording. Numbers keep all their digits: integers beyond 2^53 become BigInt.
 *
 * @typedef {any} Value a parsed JSON value; integers beyond 2^53 are BigInt
 *
 * @typedef {object} Entry a line of a recording
 * @property {number} index its position among the entries of its recording
 * @property {'callback' | 'gap' | 'start'} kind
 * @property {bigint} ticks session time
 * @property {string} track the track of its instant: the interface, or gaps, or starts
 * @property {string} name of the callback, or gap, or start
 * @property {Record<string, Value>} values the arguments, or the members of gap or start
 * @property {string[]} absent the names of the arguments that the recording lacks
 * @property {Record<string, Value>} tags
 *
 * @typedef {object} Fault a line that cannot be read
 * @property {number} line counted from 1
 * @property {string} message
 *
 * @typedef {object} Recording
 * @property {string} name
 * @property {Entry[]} entries
 * @property {Fault[]} faults
 */

import { parse } from 'lossless-json';

import { argumentsOf } from './callbacks.js';
import { isInteger } from './ticks.js';

/** Numbers that JSON.parse() may round: 16 digits and more, fractions and exponents. */
const MayBeRounded = /\d{16}|\d[.eE]/;

/**
 * Integers as they are; any other number that a double would round as its text.
 * @param {string} text
 */
function exactNumber(text) {
  if (!/^-?\d+$/.test(text)) {
    return String(Number(text)) === text ? Number(text) : text;
  }
  const number = Number(text);
  return Number.isSafeInteger(number) ? number : BigInt(text);
}

/**
 * @param {string} line
 * @returns {Value}
 * @throws {SyntaxError}
 */
export function parseLine(line) {
  return MayBeRounded.test(line) ? parse(line, undefined, { parseNumber: exactNumber }) : JSON.parse(line);
}

/**
 * @param {Value} value
 * @returns {value is Record<string, Value>}
 */
function isObject(value) {
  return typeof value === 'object' && value !== null && !Array.isArray(value);
}

/**
 * @param {Value} object
 * @param {number} index
 * @returns {Entry}
 * @throws {Error} what was expected instead
 */
function toEntry(object, index) {
  if (!isObject(object)) {
    throw new Error('expected a JSON object');
  }
  if (!isInteger(object.ticks) || object.ticks < 0) {
    throw new Error('expected ticks, a number of 45 kHz ticks');
  }
  const entry = {
    index,
    ticks: BigInt(object.ticks),
    absent: /** @type {string[]} */ ([]),
    tags: isObject(object.tags) ? object.tags : {},
  };
  if (isObject(object.gap)) {
    return { ...entry, kind: 'gap', track: 'gaps', name: 'gap', values: object.gap };
  }
  if (isObject(object.start)) {
    return { ...entry, kind: 'start', track: 'starts', name: 'start', values: object.start };
  }
  if (typeof object.callback !== 'string') {
    throw new Error('expected callback, gap or start');
  }
  const values = isObject(object.arguments) ? object.arguments : {};
  return {
    ...entry,
    kind: 'callback',
    track: typeof object.interface === 'string' ? object.interface : 'unknown interface',
    name: object.callback,
    values,
    absent: argumentsOf(object.callback).filter((name) => !Object.hasOwn(values, name)),
  };
}

/**
 * @param {string} name
 * @param {string} text the JSON lines
 * @returns {Recording}
 */
export function readRecording(name, text) {
  /** @type {Entry[]} */
  const entries = [];
  /** @type {Fault[]} */
  const faults = [];
  let number = 0;
  for (const line of text.replace(/^\r?\n/, '').split('\n')) {
    number += 1;
    if (line.trim() === '') {
      continue;
    }
    try {
      const entry = toEntry(parseLine(line), entries.length);
      const before = entries.at(-1);
      if (before && entry.ticks < before.ticks) {
        throw new Error('the time is before that of the previous line');
      }
      entries.push(entry);
    } catch (error) {
      faults.push({ line: number, message: /** @type {Error} */ (error).message });
    }
  }
  return { name, entries, faults };
}

/**
 * A value as text. Strings are bare, everything else is JSON with all digits.
 * @param {Value} value
 * @returns {string}
 */
export function textOf(value) {
  if (Array.isArray(value)) {
    return value.length === 0 ? 'nothing' : value.map(textOf).join(', ');
  }
  if (isObject(value)) {
    return Object.entries(value).map(([name, member]) => `${name} ${textOf(member)}`).join(', ');
  }
  return value === null ? 'none' : String(value);
}

/**
 * All arguments in one line.
 * @param {Entry} entry
 */
export function argumentsText(entry) {
  return Object.entries(entry.values).map(([name, value]) => `${name}=${textOf(value)}`).join(' ');
}
