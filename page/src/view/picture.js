/**
 * The timeline. It draws what is visible at the current scale; see model/layout.js. The library positions and pans;
 * keys are in view/keys.js.
 *
 * @typedef {import('../model/layout.js').Shape} Shape
 * @typedef {import('../model/scene.js').Lane} Lane
 * @typedef {import('../model/scene.js').Mark} Mark
 * @typedef {import('../model/scene.js').Scene} Scene
 * @typedef {import('../model/scene.js').Span} Span
 * @typedef {import('./items.js').Flags} Flags
 * @typedef {import('./items.js').Item} Item
 */

import moment from 'moment';
import { DataSet } from 'vis-data/esnext';
import { Timeline } from 'vis-timeline/esnext';

import { Axis } from '../model/axis.js';
import { Densities, layOut } from '../model/layout.js';
import { TicksPerMillisecond, formatTime } from '../model/ticks.js';
import { create } from './dom.js';
import { Gestures } from './gestures.js';
import { mergeSpans, toBackground, toItem } from './items.js';

/** Pixels of a gap or a fold at least. */
const SpanWidth = 6;

/** Parts of the picture that stay free before and after the recording. */
const MarginBefore = 0.02;
const MarginAfter = 0.04;

/** The library measures each new element, so there must not be too many. */
const MostElements = 700;

/** The longest window shows the recording so many times. */
const MostOverview = 2;

/** The shortest window in milliseconds. */
const ShortestWindow = 20;

export class Picture {
  /**
   * @param {HTMLElement} container
   * @param {(lane: Lane, marks: Mark[]) => void} onSelect called when something is clicked
   */
  constructor(container, onSelect) {
    this.container = container;
    /** @type {Scene | null} */
    this.scene = null;
    this.axis = new Axis([]);
    /** @type {(mark: Mark, lane: Lane) => Flags} */
    this.flagsOf = () => ({ selected: false, match: false, dimmed: false, difference: null });
    /** @type {(mark: Mark, lane: Lane) => boolean} */
    this.isShown = () => true;
    /** @type {Map<string, Shape[]>} by lane and density, at the scale shapesScale */
    this.shapes = new Map();
    this.shapesScale = 0;
    /** @type {Map<string, { lane: Lane, shape: Shape }>} */
    this.drawn = new Map();
    this.items = new DataSet(/** @type {Item[]} */ ([]));
    this.groups = new DataSet(/** @type {any[]} */ ([]));
    this.waiting = false;
    /** The library's own first window is that of no items; drawing waits for it. */
    this.ready = false;
    const frame = create('div', { 'aria-hidden': 'true' });
    container.append(frame);
    this.timeline = new Timeline(frame, /** @type {any} */ (this.items), this.groups, {
      onInitialDrawComplete: () => {
        this.ready = true;
        this.fit();
      },
      height: '100%',
      stack: false,
      selectable: false,
      showCurrentTime: false,
      showMajorLabels: false,
      maxMinorChars: 13,
      orientation: { axis: 'top', item: 'top' },
      margin: { axis: 0, item: { horizontal: 0, vertical: 2 } },
      groupOrder: 'order',
      verticalScroll: true,
      moveable: false, // view/gestures.js
      zoomMin: ShortestWindow,
      zoomMax: 1e16,
      dataAttributes: ['track', 'count'],
      moment: (/** @type {any} */ date) => moment.utc(date),
      format: { minorLabels: (/** @type {any} */ date) => this.axisLabel(date.valueOf()) },
    });
    this.timeline.on('rangechange', () => this.scheduleDraw());
    this.timeline.on('rangechanged', () => this.scheduleDraw());
    this.timeline.on('changed', () => this.scheduleDraw());
    const gestures = new Gestures(this);
    this.timeline.on('click', (event) => {
      const hit = this.drawn.get(event.item);
      if (hit && !gestures.dragged) {
        onSelect(hit.lane, hit.shape.marks);
      }
    });
    this.timeline.on('doubleClick', (event) => {
      const hit = this.drawn.get(event.item);
      if (hit) {
        this.zoomTo(hit.shape);
      }
    });
  }

  /** @param {number} time */
  axisLabel(time) {
    const ticks = (this.scene?.origin ?? 0n) + BigInt(Math.round(time)) * TicksPerMillisecond;
    return ticks < 0n ? '' : formatTime(ticks).replace(/\.000$/, '');
  }

  /**
   * Shows another scene as a whole.
   * @param {Scene} scene
   * @param {boolean} folded
   * @param {readonly string[]} names of the recordings, to tell lanes of the same track apart
   */
  show(scene, folded, names) {
    this.scene = scene;
    const folds = folded ? scene.folds : [];
    this.axis = new Axis(folds);
    this.shapes.clear();
    this.items.clear();
    this.drawn.clear();
    this.groups.clear();
    this.groups.add(scene.lanes.map((lane, order) => ({ id: lane.id, order, content: laneLabel(lane, names) })));
    this.container.style.setProperty('--picture-lanes', String(scene.lanes.length));
    this.timeline.setOptions({
      stack: scene.base === 'media',
      hiddenDates: folds.map(({ start, end }) => ({ start, end })),
    });
    this.fit();
  }

  /**
   * @param {(mark: Mark, lane: Lane) => Flags} flagsOf
   * @param {(mark: Mark, lane: Lane) => boolean} isShown
   */
  setFlags(flagsOf, isShown) {
    this.flagsOf = flagsOf;
    this.isShown = isShown;
    this.shapes.clear();
    this.draw();
  }

  fit() {
    const end = Math.max(this.scene?.end ?? 0, 1000);
    const visible = this.axis.toVisible(end);
    this.setWindow({ start: -visible * MarginBefore, end: end + visible * MarginAfter });
  }

  /**
   * Shows a part of the axis, moved so that something of the recording remains visible.
   * @param {{ start: number, end: number }} window
   */
  setWindow({ start, end }) {
    const all = this.axis.toVisible(Math.max(this.scene?.end ?? 0, 1000));
    const from = this.axis.toVisible(start);
    const length = Math.min(Math.max(this.axis.toVisible(end) - from, ShortestWindow), all * MostOverview);
    const least = Math.min(Math.max(from, -length / 2), all - length / 2);
    this.timeline.setWindow(this.axis.fromVisible(least), this.axis.fromVisible(least + length), { animation: false });
    this.draw();
  }

  /** @param {number} fraction of the window */
  timeAt(fraction) {
    const { start, end } = this.window();
    const from = this.axis.toVisible(start);
    return this.axis.fromVisible(from + (this.axis.toVisible(end) - from) * fraction);
  }

  /** @returns {{ start: number, end: number }} */
  window() {
    const { start, end } = this.timeline.getWindow();
    return { start: start.valueOf(), end: end.valueOf() };
  }

  /**
   * @param {number} factor above 1 shows more
   * @param {number} [centre] the centre of the picture by default
   */
  zoom(factor, centre) {
    const { start, end } = this.window();
    const at = centre !== undefined && centre >= start && centre <= end ? centre : this.timeAt(0.5);
    this.setWindow(this.axis.zoom(start, end, factor, at));
  }

  /** @param {number} fraction of the window */
  move(fraction) {
    const { start, end } = this.window();
    this.setWindow(this.axis.move(start, end, fraction));
  }

  /** @param {{ start: number, end: number }} span */
  zoomTo({ start, end }) {
    const margin = Math.max((end - start) * 0.1, ShortestWindow / 2);
    this.setWindow({ start: start - margin, end: end + margin });
  }

  /**
   * Scrolls as little as needed to make a mark visible.
   * @param {Lane} lane
   * @param {Mark} mark
   */
  reveal(lane, mark) {
    const { start, end } = this.window();
    if (mark.start < start || mark.start > end) {
      const [at, from, to] = [mark.start, start, end].map((time) => this.axis.toVisible(time));
      const half = (to - from) / 2;
      this.setWindow({ start: this.axis.fromVisible(at - half), end: this.axis.fromVisible(at + half) });
    }
    const panel = this.container.querySelector('.vis-center')?.getBoundingClientRect();
    const label = this.container.querySelectorAll('.vis-left .vis-label')[this.scene?.lanes.indexOf(lane) ?? -1];
    const box = label?.getBoundingClientRect();
    if (panel && box && (box.top < panel.top || box.bottom > panel.bottom)) {
      const hit = [...this.drawn].find(([, drawn]) => drawn.lane === lane && drawn.shape.marks.includes(mark));
      const { start: before, end: after } = this.window();
      if (hit) {
        this.timeline.focus(hit[0], { zoom: false, animation: false });
        this.setWindow({ start: before, end: after });
      }
    }
  }

  scheduleDraw() {
    if (!this.waiting) {
      this.waiting = true;
      requestAnimationFrame(() => {
        this.waiting = false;
        this.draw();
      });
    }
  }

  /** Updates the elements to the current window. */
  draw() {
    if (!this.scene || !this.ready) {
      return;
    }
    const { start, end } = this.window();
    const width = this.container.querySelector('.vis-center')?.clientWidth ?? 0;
    const visible = this.axis.toVisible(end) - this.axis.toVisible(start);
    if (width === 0 || visible <= 0) {
      return;
    }
    const scale = visible / width;
    const from = start - (end - start) / 2;
    const to = end + (end - start) / 2;
    /** @type {Map<string, Item>} */
    const items = new Map();
    this.drawn.clear();
    for (const { lane, shape } of this.visibleShapes(scale, from, to)) {
      const item = toItem(lane, shape, scale, this.flagsOf);
      items.set(item.id, item);
      this.drawn.set(item.id, { lane, shape });
    }
    for (const item of this.backgrounds(scale)) {
      items.set(item.id, item);
    }
    this.update(items);
  }

  /**
   * The shapes in a window, as dense as there may be elements.
   * @param {number} scale
   * @param {number} from
   * @param {number} to
   */
  visibleShapes(scale, from, to) {
    /** @type {{ lane: Lane, shape: Shape }[]} */
    let visible = [];
    for (let density = 0; density < Densities.length; density += 1) {
      visible = (this.scene?.lanes ?? []).flatMap((lane) => this.shapesOf(lane, scale, density)
        .filter((shape) => shape.end >= from && shape.start <= to)
        .map((shape) => ({ lane, shape })));
      if (visible.length <= MostElements) {
        break;
      }
    }
    return visible;
  }

  /**
   * @param {Lane} lane
   * @param {number} scale
   * @param {number} density
   */
  shapesOf(lane, scale, density) {
    if (Math.abs(this.shapesScale - scale) > scale * 1e-6) {
      this.shapes.clear();
      this.shapesScale = scale;
    }
    const key = `${density} ${lane.id}`;
    const cached = this.shapes.get(key);
    if (cached) {
      return cached;
    }
    const marks = lane.slices ? lane.marks : lane.marks.filter((mark) => this.isShown(mark, lane));
    const shapes = layOut({ ...lane, marks }, scale, density);
    this.shapes.set(key, shapes);
    return shapes;
  }

  /** @param {number} scale */
  backgrounds(scale) {
    const scene = /** @type {Scene} */ (this.scene);
    const gaps = mergeSpans(scene.gaps, SpanWidth * scale);
    const sides = new Set(scene.lanes.map(({ side }) => side));
    const half = (SpanWidth / 2) * scale;
    return [
      ...gaps.flatMap((gap) => (sides.size === 1 ? [toBackground('gap', gap)]
        : scene.lanes.filter(({ side }) => side === gap.side).map(({ id }) => toBackground('gap', gap, id)))),
      ...this.axis.folds.map(({ start, end, side }) => (
        toBackground('fold', { start: start - half, end: end + half, side }))),
    ];
  }

  /** @param {Map<string, Item>} items */
  update(items) {
    const gone = this.items.getIds().filter((id) => !items.has(String(id)));
    const changed = [...items.values()].filter((item) => this.items.get(item.id)?.look !== item.look);
    this.items.remove(gone);
    this.items.update(changed);
  }
}

/**
 * @param {Lane} lane
 * @param {readonly string[]} names
 */
function laneLabel(lane, names) {
  const letter = names.length > 1 ? create('b', {}, 'AB'[lane.side]) : '';
  return create('span', { class: 'lane' }, create('span', {}, lane.track), letter,
    create('span', { class: 'count' }, String(lane.count)));
}
