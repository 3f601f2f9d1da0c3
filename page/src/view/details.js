/**
 * Everything that a recording says about what is selected.
 *
 * @typedef {import('../model/recording.js').Entry} Entry
 * @typedef {import('../model/recording.js').Value} Value
 * @typedef {import('../model/rows.js').Row} Row
 * @typedef {import('../model/scene.js').Analysis} Analysis
 * @typedef {import('../model/scene.js').Mark} Mark
 */

import { isPosition } from '../model/callbacks.js';
import { textOf } from '../model/recording.js';
import { labelOf } from '../model/scene.js';
import { formatDuration, formatTime, isInteger } from '../model/ticks.js';
import { Effects } from '../model/tracks.js';
import { create } from './dom.js';

/** Of a cluster with more callbacks than this only the first are listed. */
const MostListed = 30;

/** @param {bigint} ticks */
const timeText = (ticks) => `${formatTime(ticks)} (${ticks} ticks)`;

/** @param {[string, string | Node][]} pairs */
const list = (pairs) => create('dl', {}, ...pairs.map(([term, text]) => (
  create('div', {}, create('dt', {}, term), create('dd', {}, text)))));

/**
 * @param {Entry | null} entry
 * @param {string} name of the argument
 */
function valueCell(entry, name) {
  if (!entry) {
    return create('td', { class: 'absent' }, 'no callback');
  }
  if (!Object.hasOwn(entry.values, name)) {
    return create('td', { class: 'absent' }, 'not recorded');
  }
  /** @type {Value} */
  const value = entry.values[name];
  const time = isPosition(entry.name, name) && isInteger(value) ? ` ticks (${formatTime(BigInt(value))})` : '';
  return create('td', {}, textOf(value) + time);
}

/**
 * @param {string} caption
 * @param {readonly string[]} columns
 * @param {Node[][]} rows
 */
const tableOf = (caption, columns, rows) => create('table', {},
  create('caption', {}, caption),
  create('thead', {}, create('tr', {}, ...columns.map((name) => create('th', { scope: 'col' }, name)))),
  create('tbody', {}, ...rows.map((cells) => create('tr', {}, ...cells))));

/**
 * @param {(Entry | null)[]} entries one, or a pair
 * @param {readonly string[]} changes
 */
function valuesTable(entries, changes) {
  const names = [...new Set(entries.flatMap((entry) => (
    entry ? [...Object.keys(entry.values), ...entry.absent] : [])))];
  if (names.length === 0) {
    return create('p', {}, 'No arguments.');
  }
  const caption = entries.some((entry) => entry?.kind === 'callback') ? 'Arguments' : 'Values';
  const columns = entries.length > 1 ? ['Name', 'A', 'B'] : ['Name', 'Value'];
  return tableOf(caption, columns, names.map((name) => [
    create('th', { scope: 'row', class: changes.includes(name) ? 'changed' : '' },
      changes.includes(name) ? `≠ ${name}` : name),
    ...entries.map((entry) => valueCell(entry, name)),
  ]));
}

/** @param {Entry} entry */
function tagsTable(entry) {
  const tags = Object.entries(entry.tags);
  return tags.length === 0 ? '' : tableOf('Tags', ['Name', 'Value'], tags.map(([name, value]) => [
    create('th', { scope: 'row' }, name), create('td', {}, textOf(value))]));
}

/**
 * @param {Mark} mark a slice
 * @param {Analysis} analysis
 * @returns {[string, string | Node][]}
 */
function sliceLines(mark, analysis) {
  const slice = /** @type {import('../model/slices.js').Slice} */ (mark.slice);
  const last = slice.last === null ? null : analysis.recording.entries[slice.last];
  const beginner = Object.hasOwn(Effects, mark.entry.name) ? ` ${Effects[mark.entry.name].because}` : '';
  return [
    ['Begins', timeText(slice.start)],
    ['Ends', timeText(slice.end)],
    ['Lasts', formatDuration(slice.end - slice.start)],
    ['Begun by', `${mark.entry.name}.${beginner}`],
    ['Ended by', last ? `${last.kind === 'gap' ? 'a gap' : last.name}` : 'the end of the recording'],
  ];
}

/**
 * @param {Row} row
 * @param {readonly Analysis[]} analyses
 * @returns {[string, string | Node][]}
 */
function entryLines(row, analyses) {
  const several = analyses.length > 1;
  /** @type {[string, string | Node][]} */
  const lines = [];
  [row.a, row.b].forEach((entry, side) => {
    if (entry) {
      const suffix = several ? ` in ${'AB'[side]}` : '';
      const media = analyses[side].media[entry.index];
      lines.push([`Session time${suffix}`, timeText(entry.ticks)]);
      lines.push([`Media time${suffix}`, media === null ? 'unknown' : timeText(media)]);
    }
  });
  const entry = /** @type {Entry} */ (row.a ?? row.b);
  lines.push([entry.kind === 'callback' ? 'Interface' : 'Track', entry.track]);
  return lines;
}

/** @param {Row} row */
export function differenceText(row) {
  switch (row.difference) {
    case 'added':
      return 'Added: only in B.';
    case 'missing':
      return 'Missing in B: only in A.';
    case 'changed':
      return `Changed: ${row.changes.join(', ')}.`;
    case 'moved': {
      const offset = row.offset ?? 0n;
      const by = formatDuration(offset < 0n ? -offset : offset);
      return offset === 0n ? 'Moved: at the same time in both from here on.'
        : `Moved: ${by} ${offset < 0n ? 'earlier' : 'later'} in B from here on.`;
    }
    default:
      return '';
  }
}

/**
 * @param {HTMLElement} container
 * @param {object} selection
 * @param {Row | null} selection.row
 * @param {number} selection.side
 * @param {Mark | null} selection.mark the slice, if one is selected
 * @param {readonly Mark[]} selection.cluster what else is at the place that was clicked
 * @param {readonly Analysis[]} analyses
 * @param {(mark: Mark) => void} onSelect
 */
export function showDetails(container, { row, side, mark, cluster }, analyses, onSelect) {
  const title = (/** @type {string} */ text) => create('h2', { id: 'details-title' }, text);
  if (!row) {
    container.replaceChildren(title('Details'), create('p', { class: 'muted' }, 'Nothing is selected.'));
    return;
  }
  const entry = /** @type {Entry} */ ((side === 1 ? row.b : row.a) ?? row.a ?? row.b);
  const several = analyses.length > 1;
  const name = mark?.slice ? `${mark.slice.track}: ${mark.label}` : entry.kind === 'callback' ? entry.name
    : `${entry.name}: ${labelOf(entry)}`;
  container.replaceChildren(
    title(name),
    row.difference ? create('p', { class: `difference ${row.difference}` }, differenceText(row)) : '',
    list(mark?.slice ? sliceLines(mark, analyses[side]) : entryLines(row, analyses)),
    valuesTable(several ? [row.a, row.b] : [entry], row.changes),
    tagsTable(entry),
    clusterList(cluster, onSelect),
  );
}

/**
 * @param {readonly Mark[]} cluster
 * @param {(mark: Mark) => void} onSelect
 */
function clusterList(cluster, onSelect) {
  if (cluster.length < 2) {
    return '';
  }
  const more = cluster.length - MostListed;
  return create('div', { class: 'cluster' },
    create('h3', {}, `${cluster.length} at this place`),
    create('ul', {}, ...cluster.slice(0, MostListed).map((mark) => create('li', {}, create('button', {
      type: 'button',
      click: () => onSelect(mark),
    }, `${formatTime(mark.entry.ticks)} ${mark.label}`)))),
    more > 0 ? create('p', { class: 'muted' }, `${more} more: zoom in to tell them apart.`) : '');
}
