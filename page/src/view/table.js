/**
 * The callbacks as a table, a page of rows at a time: what the picture shows, for those who read rather than look.
 *
 * @typedef {import('../model/recording.js').Entry} Entry
 * @typedef {import('../model/rows.js').Row} Row
 */

import { argumentsText, textOf } from '../model/recording.js';
import { labelOf } from '../model/scene.js';
import { formatTime } from '../model/ticks.js';
import { create, get } from './dom.js';
import { Symbols } from './items.js';

const RowsPerPage = 100;

export const DifferenceNames = { added: 'added', missing: 'missing', changed: 'changed', moved: 'moved' };

export class Table {
  /** @param {(row: number) => void} onSelect */
  constructor(onSelect) {
    this.onSelect = onSelect;
    /** @type {readonly Row[]} */
    this.rows = [];
    /** @type {readonly (readonly (bigint | null)[])[]} */
    this.media = [];
    this.comparing = false;
    /** @type {number[]} the rows that the filter leaves */
    this.shown = [];
    /** @type {(row: number) => boolean} */
    this.isMatch = () => false;
    this.selected = -1;
    this.page = 0;
    this.scroll = get('table-scroll', HTMLDivElement);
    this.table = get('table', HTMLTableElement);
    this.caption = get('table-caption', HTMLTableCaptionElement);
    get('previous-page', HTMLButtonElement).addEventListener('click', () => this.turn(-1));
    get('next-page', HTMLButtonElement).addEventListener('click', () => this.turn(1));
    this.table.addEventListener('keydown', (event) => this.onKey(event));
  }

  /**
   * @param {readonly Row[]} rows
   * @param {readonly (readonly (bigint | null)[])[]} media media times of each recording
   */
  setRows(rows, media) {
    this.rows = rows;
    this.media = media;
    this.comparing = media.length > 1;
    const columns = this.comparing ? ['Difference', 'Time in A', 'Time in B', 'Callback', 'Arguments']
      : ['Time', 'Media time', 'Interface', 'Callback', 'Arguments'];
    const minor = this.comparing ? ['Time in B'] : ['Media time', 'Interface'];
    const head = /** @type {HTMLTableSectionElement} */ (this.table.tHead);
    head.replaceChildren(create('tr', {}, ...columns.map((name) => (
      create('th', { scope: 'col', class: minor.includes(name) ? 'minor' : '' }, name)))));
  }

  /**
   * @param {number[]} shown
   * @param {(row: number) => boolean} isMatch
   */
  setFilter(shown, isMatch) {
    this.shown = shown;
    this.isMatch = isMatch;
    const all = this.rows.length;
    const count = shown.length === all ? `${all.toLocaleString('en')}`
      : `${shown.length.toLocaleString('en')} of ${all.toLocaleString('en')}`;
    this.caption.textContent = `${this.comparing ? 'Callbacks of both recordings' : 'Callbacks'}: ${count}`;
    this.showPage(this.pageOf(this.selected) ?? 0);
  }

  /** @param {number} row */
  pageOf(row) {
    const place = this.shown.indexOf(row);
    return place < 0 ? null : Math.floor(place / RowsPerPage);
  }

  /**
   * @param {number} row
   * @param {boolean} focus
   */
  select(row, focus = false) {
    this.selected = row;
    const page = this.pageOf(row);
    this.showPage(page ?? this.page);
    const button = this.body().querySelector('[aria-current] button');
    if (button instanceof HTMLElement) {
      this.reveal(/** @type {HTMLElement} */ (button.closest('tr')));
      if (focus) {
        button.focus({ preventScroll: true });
      }
    }
  }

  /** Scrolls the table only, never the page. @param {HTMLElement} element */
  reveal(element) {
    const box = this.scroll.getBoundingClientRect();
    const { top, bottom } = element.getBoundingClientRect();
    const head = /** @type {HTMLElement} */ (this.table.tHead).getBoundingClientRect().height;
    if (top < box.top + head) {
      this.scroll.scrollTop -= box.top + head - top;
    } else if (bottom > box.bottom) {
      this.scroll.scrollTop += bottom - box.bottom;
    }
  }

  body() {
    return this.table.tBodies[0];
  }

  pages() {
    return Math.max(1, Math.ceil(this.shown.length / RowsPerPage));
  }

  /** @param {number} by */
  turn(by) {
    this.showPage(Math.min(Math.max(this.page + by, 0), this.pages() - 1));
    this.scroll.scrollTop = 0;
  }

  /** @param {number} page */
  showPage(page) {
    this.page = page;
    const rows = this.shown.slice(page * RowsPerPage, (page + 1) * RowsPerPage);
    const tabStop = rows.includes(this.selected) ? this.selected : rows[0];
    this.body().replaceChildren(...rows.map((row) => this.toElement(row, row === tabStop)));
    get('pages', HTMLElement).hidden = this.pages() === 1;
    get('previous-page', HTMLButtonElement).disabled = page === 0;
    get('next-page', HTMLButtonElement).disabled = page === this.pages() - 1;
    get('page-number', HTMLSpanElement).textContent = `Page ${page + 1} of ${this.pages()}`;
  }

  /**
   * @param {number} index
   * @param {boolean} tabStop whether the Tab key reaches it; the arrow keys reach all rows
   */
  toElement(index, tabStop) {
    const row = this.rows[index];
    const entry = /** @type {Entry} */ (row.a ?? row.b);
    const name = create('button', {
      type: 'button',
      tabindex: tabStop ? '0' : '-1',
      click: () => this.onSelect(index),
    }, entry.kind === 'callback' ? entry.name : `${entry.name}: ${labelOf(entry)}`);
    const cell = (/** @type {Node | string} */ content, kind = '') => create('td', { class: kind }, content);
    const time = (/** @type {Entry | null} */ one, kind = 'time') => cell(one ? formatTime(one.ticks) : '', kind);
    const callback = create('th', { scope: 'row' }, name);
    const classes = [row.difference ?? '', this.isMatch(index) ? 'match' : '', entry.kind].filter(Boolean).join(' ');
    const cells = this.comparing
      ? [cell(row.difference ? `${Symbols[row.difference]} ${DifferenceNames[row.difference]}` : '', 'difference'),
        time(row.a), time(row.b, 'time minor'), callback, cell(this.pairText(row), 'arguments')]
      : [time(entry), cell(this.mediaText(entry), 'time minor'), cell(entry.track, 'minor'), callback,
        cell(entry.kind === 'callback' ? argumentsText(entry) : '', 'arguments')];
    const current = index === this.selected && 'true';
    return create('tr', { class: classes, 'data-row': String(index), 'aria-current': current }, ...cells);
  }

  /** @param {Entry} entry */
  mediaText(entry) {
    const time = this.media[0][entry.index];
    return time === null ? '' : formatTime(time);
  }

  /** @param {Row} row */
  pairText({ a, b, changes }) {
    const entry = /** @type {Entry} */ (a ?? b);
    if (!a || !b || changes.length === 0) {
      return argumentsText(entry);
    }
    const value = (/** @type {Entry} */ one, /** @type {string} */ name) => (
      Object.hasOwn(one.values, name) ? textOf(one.values[name]) : 'absent');
    return changes.map((name) => `${name}: ${value(a, name)} → ${value(b, name)}`).join('; ');
  }

  /** @param {KeyboardEvent} event */
  onKey(event) {
    const steps = { ArrowDown: 1, ArrowUp: -1, PageDown: 10, PageUp: -10, Home: -Infinity, End: Infinity };
    if (!(event.key in steps) || event.altKey || event.ctrlKey || event.metaKey) {
      return;
    }
    const focused = /** @type {HTMLElement} */ (event.target).closest('tr')?.dataset.row;
    const place = this.shown.indexOf(focused === undefined ? this.selected : Number(focused));
    const to = place + steps[/** @type {keyof typeof steps} */ (event.key)];
    const next = this.shown[Math.min(Math.max(to, 0), this.shown.length - 1)];
    if (next !== undefined) {
      event.preventDefault();
      this.onSelect(next);
      this.select(next, true);
    }
  }
}
