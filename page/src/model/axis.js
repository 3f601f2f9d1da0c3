/**
 * The axis without its folded parts: times on it are milliseconds as if the folds took none.
 *
 * @typedef {import('./scene.js').Span} Span
 */

export class Axis {
  /** @param {readonly Span[]} folds in order, without overlap */
  constructor(folds) {
    this.folds = folds;
  }

  /**
   * @param {number} time
   * @returns {number} without what is folded before it
   */
  toVisible(time) {
    return this.folds.reduce((visible, { start, end }) => visible - Math.max(0, Math.min(time, end) - start), time);
  }

  /**
   * @param {number} visible
   * @returns {number} the time; at a fold its end
   */
  fromVisible(visible) {
    return this.folds.reduce((time, { start, end }) => (time >= start ? time + (end - start) : time), visible);
  }

  /**
   * A window that shows another part of the axis.
   * @param {number} start
   * @param {number} end
   * @param {number} factor above 1 shows more
   * @param {number} centre that keeps its place
   */
  zoom(start, end, factor, centre) {
    const [from, to, at] = [start, end, centre].map((time) => this.toVisible(time));
    return {
      start: this.fromVisible(at - (at - from) * factor),
      end: this.fromVisible(at + (to - at) * factor),
    };
  }

  /**
   * @param {number} start
   * @param {number} end
   * @param {number} fraction of the window by which it moves
   */
  move(start, end, fraction) {
    const [from, to] = [start, end].map((time) => this.toVisible(time));
    const by = (to - from) * fraction;
    return { start: this.fromVisible(from + by), end: this.fromVisible(to + by) };
  }
}
