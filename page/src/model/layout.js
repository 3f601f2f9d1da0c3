/**
 * Which marks of a lane are drawn at a scale: marks that would overlap become one cluster, so that the number of
 * elements depends on the width of the picture and not on the length of the recording.
 *
 * @typedef {import('./scene.js').Lane} Lane
 * @typedef {import('./scene.js').Mark} Mark
 *
 * @typedef {object} Shape one element of the picture
 * @property {number} start in milliseconds
 * @property {number} end
 * @property {Mark[]} marks at least one
 */

/** Widths in pixels. */
const InstantWidth = 5;
const DigitWidth = 7;
const ClusterPadding = 8;
const NarrowSlice = 5;
const Space = 1;

/** @param {number} count */
const widthOf = (count) => (count === 1 ? InstantWidth : ClusterPadding + DigitWidth * String(count).length);

/**
 * @param {readonly Mark[]} marks instants in order of their start
 * @param {number} scale milliseconds per pixel
 * @returns {Shape[]}
 */
export function layOutInstants(marks, scale) {
  /** @type {Shape[]} */
  const shapes = [];
  /** @type {Shape | undefined} */
  let shape;
  for (const mark of marks) {
    if (shape && mark.start < shape.end + Space * scale) {
      shape.marks.push(mark);
      shape.end = Math.max(shape.start + widthOf(shape.marks.length) * scale, mark.start);
    } else {
      shape = { start: mark.start, end: mark.start + InstantWidth * scale, marks: [mark] };
      shapes.push(shape);
    }
  }
  return shapes;
}

/**
 * @param {readonly Mark[]} marks slices in order of their start
 * @param {number} scale milliseconds per pixel
 * @returns {Shape[]} slices that are too narrow to see are clusters, up to the next slice that is not
 */
export function layOutSlices(marks, scale) {
  /** @type {Shape[]} */
  const shapes = [];
  /** @type {Shape | undefined} */
  let cluster;
  for (const mark of marks) {
    if (mark.end - mark.start >= NarrowSlice * scale) {
      if (cluster) {
        cluster.end = Math.max(Math.min(cluster.end, mark.start), cluster.start + scale);
        cluster = undefined;
      }
      shapes.push({ start: mark.start, end: mark.end, marks: [mark] });
    } else if (cluster && mark.start < cluster.end + Space * scale) {
      cluster.marks.push(mark);
      cluster.end = Math.max(cluster.end, mark.end, cluster.start + widthOf(cluster.marks.length) * scale);
    } else {
      cluster = { start: mark.start, end: mark.start + NarrowSlice * scale, marks: [mark] };
      shapes.push(cluster);
    }
  }
  return shapes;
}

/**
 * @param {Lane} lane
 * @param {number} scale milliseconds per pixel
 */
export function layOut(lane, scale) {
  return lane.slices ? layOutSlices(lane.marks, scale) : layOutInstants(lane.marks, scale);
}
