/**
 * The state of the page, and what may be done to it. Views are told what to show; they report what was clicked.
 *
 * @typedef {import('./model/recording.js').Recording} Recording
 * @typedef {import('./model/scene.js').Lane} Lane
 * @typedef {import('./model/scene.js').Mark} Mark
 * @typedef {import('./model/scene.js').TimeBase} TimeBase
 * @typedef {import('./model/rows.js').Row} Row
 */

import { indexRows, rowsOf } from './model/rows.js';
import { analyse, sceneOf } from './model/scene.js';
import { matcher } from './model/search.js';
import { TicksPerMillisecond } from './model/ticks.js';
import { differenceText, showDetails } from './view/details.js';
import { get } from './view/dom.js';
import { describeMark, showDifferenceCounts, showHeader, showMatches, showNote } from './view/headings.js';
import { actionOf, fillDialog } from './view/keys.js';
import { Picture } from './view/picture.js';
import { Table } from './view/table.js';

const ZoomFactor = 0.6;

export class App {
  /** @param {Recording[]} recordings one or two */
  constructor(recordings) {
    this.names = recordings.map(({ name }) => name);
    this.analyses = recordings.map(analyse);
    /** @type {TimeBase} */
    this.base = 'session';
    this.folded = true;
    this.scene = sceneOf(this.analyses, this.base);
    this.rows = rowsOf(recordings.map(({ entries }) => entries));
    this.rowIndex = indexRows(this.rows);
    /** @type {Set<number>} */
    this.matches = new Set();
    this.searching = false;
    this.selection = {
      row: -1,
      side: 0,
      lane: /** @type {Lane | null} */ (null),
      mark: /** @type {Mark | null} */ (null),
      cluster: /** @type {readonly Mark[]} */ ([]),
    };
  }

  start() {
    get('tools', HTMLDivElement).hidden = false;
    get('main', HTMLElement).hidden = false;
    get('differences', HTMLDivElement).hidden = this.analyses.length < 2;
    get('fold-label', HTMLLabelElement).hidden = this.scene.folds.length === 0;
    showHeader(this.analyses);
    this.table = new Table((row) => this.selectRow(row));
    this.table.setRows(this.rows, this.analyses.map(({ media }) => media));
    this.picture = new Picture(get('picture', HTMLDivElement), (lane, marks) => this.selectMark(lane, marks[0], marks));
    this.connect();
    showDifferenceCounts(this.rows);
    this.showScene();
    this.filter();
    this.showSelection();
  }

  connect() {
    const on = (/** @type {string} */ id, /** @type {string} */ type, /** @type {(event: Event) => void} */ action) => (
      get(id, HTMLElement).addEventListener(type, action));
    on('query', 'input', () => this.search());
    on('query', 'keydown', (event) => this.onSearchKey(/** @type {KeyboardEvent} */ (event)));
    on('search', 'submit', (event) => {
      event.preventDefault();
      this.nextMatch();
    });
    on('previous-match', 'click', () => this.previousMatch());
    on('only-matches', 'change', () => this.filter());
    on('previous-difference', 'click', () => this.previousDifference());
    on('next-difference', 'click', () => this.nextDifference());
    on('only-differences', 'change', () => this.filter());
    on('tolerance', 'change', () => this.compareAgain());
    on('view', 'change', () => this.changeView());
    on('zoom-in', 'click', () => this.zoomIn());
    on('zoom-out', 'click', () => this.zoomOut());
    on('fit', 'click', () => this.fit());
    on('show-keys', 'click', () => this.showKeys());
    for (const [id, inPicture] of /** @type {[string, boolean][]} */ ([['picture', true], ['table', false]])) {
      on(id, 'keydown', (event) => this.onKey(/** @type {KeyboardEvent} */ (event), inPicture));
    }
  }

  /** @param {KeyboardEvent} event @param {boolean} inPicture */
  onKey(event, inPicture) {
    const action = actionOf(event, inPicture);
    if (action) {
      event.preventDefault();
      /** @type {Record<string, () => void>} */ (/** @type {unknown} */ (this))[action]();
    }
  }

  /** @param {KeyboardEvent} event */
  onSearchKey(event) {
    const query = get('query', HTMLInputElement);
    if (event.key === 'Enter' && event.shiftKey) {
      event.preventDefault();
      this.previousMatch();
    } else if (event.key === 'Escape' && query.value !== '') {
      event.preventDefault();
      query.value = '';
      this.search();
    }
  }

  // What is shown

  showScene() {
    this.picture?.show(this.scene, this.folded, this.names);
    showNote(this.scene);
  }

  changeView() {
    const base = document.querySelector('input[name="base"]:checked');
    this.base = base instanceof HTMLInputElement && base.value === 'media' ? 'media' : 'session';
    this.folded = get('fold', HTMLInputElement).checked;
    this.scene = sceneOf(this.analyses, this.base);
    get('fold', HTMLInputElement).disabled = this.base === 'media';
    this.selection.cluster = [];
    this.relocate();
    this.showScene();
    this.showSelection();
  }

  /** Finds the selection again in a new scene. */
  relocate() {
    const { lane, mark } = this.selection;
    this.selection.lane = this.scene.lanes.find(({ id }) => id === lane?.id) ?? null;
    this.selection.mark = this.selection.lane?.marks.find(({ entry, slice }) => (
      entry === mark?.entry && slice === mark?.slice)) ?? mark;
  }

  switchBase() {
    const other = this.base === 'media' ? 'session' : 'media';
    const input = document.querySelector(`input[name="base"][value="${other}"]`);
    if (input instanceof HTMLInputElement) {
      input.checked = true;
      this.changeView();
      this.announce(other === 'media' ? 'Media time' : 'Session time');
    }
  }

  switchFold() {
    const fold = get('fold', HTMLInputElement);
    if (!fold.disabled && this.analyses.some(({ folds }) => folds.length > 0)) {
      fold.checked = !fold.checked;
      this.changeView();
      this.announce(fold.checked ? 'Standby folded' : 'Standby unfolded');
    }
  }

  compareAgain() {
    const milliseconds = Number(get('tolerance', HTMLInputElement).value) || 0;
    const tolerance = BigInt(Math.max(0, Math.round(milliseconds))) * TicksPerMillisecond;
    this.rows = rowsOf(this.analyses.map(({ recording }) => recording.entries), tolerance);
    this.table?.setRows(this.rows, this.analyses.map(({ media }) => media));
    showDifferenceCounts(this.rows);
    this.filter();
  }

  // Search and filter

  search() {
    const matches = matcher(get('query', HTMLInputElement).value);
    this.searching = matches !== null;
    this.matches = new Set();
    if (matches) {
      this.rows.forEach(({ text }, row) => text.split('\n').some((one) => one !== '' && matches(one))
        && this.matches.add(row));
    }
    this.filter();
  }

  filter() {
    const onlyMatches = this.searching && get('only-matches', HTMLInputElement).checked;
    const onlyDifferences = get('only-differences', HTMLInputElement).checked;
    const isShown = (/** @type {number} */ row) => (!onlyMatches || this.matches.has(row))
      && (!onlyDifferences || this.rows[row].difference !== null);
    const shown = [...this.rows.keys()].filter(isShown);
    // With nothing else to see, a mark on every match says nothing.
    const isMarked = (/** @type {number} */ row) => !onlyMatches && this.matches.has(row);
    this.table?.setFilter(shown, isMarked);
    this.picture?.setFlags(
      (mark, lane) => {
        const row = this.rowOf(mark, lane.side);
        return {
          selected: this.selection.mark === mark,
          match: !mark.slice && isMarked(row),
          dimmed: this.searching && !mark.slice && !this.matches.has(row),
          difference: this.rows[row].difference,
        };
      },
      (mark, lane) => isShown(this.rowOf(mark, lane.side)));
    showMatches(this.searching ? this.matches : null, this.selection.row, this.rows.length);
  }

  /** @param {Mark} mark @param {number} side */
  rowOf(mark, side) {
    return /** @type {number} */ (this.rowIndex[side].get(mark.entry.index));
  }

  // Selection

  /** @param {number} row @param {number} [side] */
  selectRow(row, side = this.rows[row].a ? 0 : 1) {
    const entry = side === 0 ? this.rows[row].a : this.rows[row].b;
    const lane = this.scene.lanes.find((one) => !one.slices && one.side === side && one.track === entry?.track) ?? null;
    const mark = lane?.marks.find((one) => one.entry === entry) ?? null;
    this.selection = { row, side, lane, mark, cluster: [] };
    this.showSelection();
  }

  /** @param {Lane} lane @param {Mark} mark @param {readonly Mark[]} [cluster] */
  selectMark(lane, mark, cluster = []) {
    this.selection = { row: this.rowOf(mark, lane.side), side: lane.side, lane, mark, cluster };
    this.showSelection();
    this.announce(describeMark(lane, mark));
  }

  showSelection() {
    const { row, side, lane, mark, cluster } = this.selection;
    if (row >= 0) {
      this.table?.select(row);
    }
    if (lane && mark && lane.marks.includes(mark)) {
      this.picture?.reveal(lane, mark);
    }
    this.picture?.draw();
    showDetails(get('details', HTMLElement), { row: this.rows[row] ?? null, side, mark, cluster }, this.analyses,
      (other) => lane && this.selectMark(lane, other, cluster));
    showMatches(this.searching ? this.matches : null, row, this.rows.length);
  }

  /** @param {string} text */
  announce(text) {
    get('announcement', HTMLParagraphElement).textContent = text;
  }

  /**
   * Selects the next row of some kind, from the other end after the last.
   * @param {(row: Row, index: number) => boolean} isWanted
   * @param {1 | -1} direction
   */
  step(isWanted, direction) {
    const count = this.rows.length;
    const from = this.selection.row >= 0 ? this.selection.row : direction > 0 ? -1 : count;
    for (let distance = 1; distance <= count; distance += 1) {
      const row = (((from + direction * distance) % count) + count) % count;
      if (isWanted(this.rows[row], row)) {
        this.selectRow(row);
        const { a, b } = this.rows[row];
        this.announce([(a ?? b)?.name, differenceText(this.rows[row])].filter(Boolean).join('. '));
        return;
      }
    }
  }

  nextMatch() {
    this.step((_, row) => this.matches.has(row), 1);
  }

  previousMatch() {
    this.step((_, row) => this.matches.has(row), -1);
  }

  nextDifference() {
    this.step(({ difference }) => difference !== null, 1);
  }

  previousDifference() {
    this.step(({ difference }) => difference !== null, -1);
  }

  // The picture by keys

  /** @param {(marks: readonly Mark[], place: number) => number} placeOf the new place in the lane */
  moveOnLane(placeOf) {
    const lane = this.selection.lane ?? this.scene.lanes.find(({ marks }) => marks.length > 0);
    if (lane && lane.marks.length > 0) {
      const place = this.selection.mark ? lane.marks.indexOf(this.selection.mark) : -1;
      const next = Math.min(Math.max(placeOf(lane.marks, place), 0), lane.marks.length - 1);
      this.selectMark(lane, lane.marks[next]);
    }
  }

  nextMark() {
    this.moveOnLane((_, place) => place + 1);
  }

  previousMark() {
    this.moveOnLane((_, place) => place - 1);
  }

  firstMark() {
    this.moveOnLane(() => 0);
  }

  lastMark() {
    this.moveOnLane((marks) => marks.length - 1);
  }

  /** @param {1 | -1} direction */
  changeLane(direction) {
    const lanes = this.scene.lanes.filter(({ marks }) => marks.length > 0);
    const { lane, mark } = this.selection;
    const place = lane ? lanes.indexOf(lane) : -1;
    const next = lanes[Math.min(Math.max(place + direction, 0), lanes.length - 1)];
    if (next) {
      const time = mark?.start ?? 0;
      const nearest = next.marks.reduce((best, one) => (
        Math.abs(one.start - time) < Math.abs(best.start - time) ? one : best), next.marks[0]);
      this.selectMark(next, nearest);
    }
  }

  laneAbove() {
    this.changeLane(-1);
  }

  laneBelow() {
    this.changeLane(1);
  }

  zoomIn() {
    this.picture?.zoom(ZoomFactor, this.selection.mark?.start);
  }

  zoomOut() {
    this.picture?.zoom(1 / ZoomFactor, this.selection.mark?.start);
  }

  fit() {
    this.picture?.fit();
  }

  earlier() {
    this.picture?.move(-0.5);
  }

  later() {
    this.picture?.move(0.5);
  }

  toDetails() {
    get('details', HTMLElement).focus();
  }

  toSearch() {
    get('query', HTMLInputElement).focus();
    get('query', HTMLInputElement).select();
  }

  showKeys() {
    const dialog = get('keys', HTMLDialogElement);
    fillDialog(dialog);
    dialog.showModal();
  }
}
