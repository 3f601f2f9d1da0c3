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

const MostRows = 4;

/**
 * What becomes a cluster, in pixels: instants within `bucket`, and within it slices narrower than `narrow`. The first
 * density shows most: it merges only what would overlap.
 */
export const Densities = [{ bucket: 0, narrow: 5 }, { bucket: 22, narrow: 12 }, { bucket: 44, narrow: 24 }];

/** @param {number} count */
const widthOf = (count) => (count === 1 ? InstantWidth : ClusterPadding + DigitWidth * String(count).length);

/**
 * @param {readonly Mark[]} marks instants in order of their start
 * @param {number} scale milliseconds per pixel
 * @param {number} [bucket]
 * @returns {Shape[]}
 */
export function layOutInstants(marks, scale, bucket = 0) {
  /** @type {Shape[]} */
  const shapes = [];
  /** @type {Shape | undefined} */
  let shape;
  for (const mark of marks) {
    if (shape && (mark.start < shape.end + scale || mark.start < shape.start + bucket * scale)) {
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
 * @param {number} [bucket]
 * @param {number} [narrow]
 * @returns {Shape[]} slices that are too narrow to see are clusters, up to the next slice that is not
 */
export function layOutSlices(marks, scale, bucket = 0, narrow = Densities[0].narrow) {
  /** @type {Shape[]} */
  const shapes = [];
  /** @type {Shape | undefined} */
  let cluster;
  for (const mark of marks) {
    if (mark.end - mark.start >= narrow * scale) {
      if (cluster) {
        cluster.end = Math.max(Math.min(cluster.end, mark.start), cluster.start + scale);
        cluster = undefined;
      }
      shapes.push({ start: mark.start, end: mark.end, marks: [mark] });
    } else if (cluster && mark.start < cluster.start + Math.max(bucket, widthOf(cluster.marks.length)) * scale) {
      cluster.marks.push(mark);
      cluster.end = Math.max(cluster.end, mark.end, cluster.start + widthOf(cluster.marks.length) * scale);
    } else {
      if (cluster) {
        cluster.end = Math.min(cluster.end, mark.start);
      }
      cluster = { start: mark.start, end: Math.max(mark.end, mark.start + InstantWidth * scale), marks: [mark] };
      shapes.push(cluster);
    }
  }
  return shapes;
}

/**
 * Passages that were played several times overlap on the axis of media time, and take a row each. What does not fit
 * into the rows becomes a cluster in the last one.
 * @param {readonly Shape[]} shapes in order of their start
 * @param {number} [most] rows
 * @returns {Shape[]}
 */
export function limitRows(shapes, most = MostRows) {
  /** @type {Shape[]} the last shape in each row */
  const rows = [];
  return shapes.filter((shape) => {
    const free = rows.findIndex(({ end }) => end <= shape.start);
    const row = free < 0 ? rows.length : free;
    if (row < most) {
      rows[row] = shape;
      return true;
    }
    const last = rows[most - 1];
    shape.marks.forEach((mark) => last.marks.push(mark));
    last.end = Math.max(last.end, shape.end);
    return false;
  });
}

/**
 * @param {Lane} lane
 * @param {number} scale milliseconds per pixel
 * @param {number} density place in Densities
 */
export function layOut(lane, scale, density) {
  const { bucket, narrow } = Densities[density];
  return lane.slices ? limitRows(layOutSlices(lane.marks, scale, bucket, narrow))
    : layOutInstants(lane.marks, scale, bucket);
}
