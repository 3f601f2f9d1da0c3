/**
 * Wheel, mouse and touch in the picture. The library's own gestures do not know what is folded. The vertical wheel
 * is left to it.
 *
 * @typedef {import('./picture.js').Picture} Picture
 */

/** Pixels that a pointer moves before it drags. */
const DragThreshold = 4;

/** A hundred pixels of the wheel zoom by about a fifth. */
const ZoomPerPixel = 0.002;

export class Gestures {
  /** @param {Picture} picture */
  constructor(picture) {
    this.picture = picture;
    /** @type {Map<number, { x: number }>} the pointers that are down in the picture */
    this.pointers = new Map();
    this.pressedAt = 0;
    /** Whether the pointer has dragged since it was pressed, so that its release is no click. */
    this.dragged = false;
    const { container } = picture;
    container.addEventListener('wheel', (event) => this.onWheel(event), { capture: true, passive: false });
    container.addEventListener('pointerdown', (event) => this.onDown(event));
    container.addEventListener('pointermove', (event) => this.onMove(event));
    container.addEventListener('pointerup', (event) => this.onUp(event));
    container.addEventListener('pointercancel', (event) => this.onUp(event));
  }

  /** The part of the picture right of the labels. */
  panel() {
    return /** @type {Element} */ (this.picture.container.querySelector('.vis-center'));
  }

  /** @param {WheelEvent} event */
  onWheel(event) {
    const { width } = this.panel().getBoundingClientRect();
    const sideways = event.shiftKey && event.deltaX === 0 ? event.deltaY : event.deltaX;
    if (event.ctrlKey) {
      this.picture.zoom(Math.exp(event.deltaY * ZoomPerPixel), this.timeAt(event.clientX));
    } else if (event.shiftKey || Math.abs(sideways) > Math.abs(event.deltaY)) {
      this.picture.move(sideways / width);
    } else {
      return; // the library scrolls the tracks; if all are visible, the browser scrolls the page
    }
    event.preventDefault();
    event.stopPropagation();
  }

  /** @param {number} x in pixels of the window */
  timeAt(x) {
    const { left, width } = this.panel().getBoundingClientRect();
    return this.picture.timeAt(Math.min(Math.max((x - left) / width, 0), 1));
  }

  /** @param {PointerEvent} event */
  onDown(event) {
    if (event.button === 0 && this.panel().contains(/** @type {Node} */ (event.target))) {
      this.pointers.set(event.pointerId, { x: event.clientX });
      this.pressedAt = event.clientX;
      this.dragged = this.pointers.size > 1;
    }
  }

  /** @param {PointerEvent} event */
  onMove(event) {
    const pointer = this.pointers.get(event.pointerId);
    if (!pointer) {
      return;
    }
    const by = event.clientX - pointer.x;
    if (!this.dragged && Math.abs(event.clientX - this.pressedAt) < DragThreshold) {
      return;
    }
    this.dragged = true;
    this.picture.container.setPointerCapture(event.pointerId);
    const other = [...this.pointers].find(([id]) => id !== event.pointerId)?.[1];
    if (other) {
      const before = Math.max(Math.abs(pointer.x - other.x), 1);
      const after = Math.max(Math.abs(event.clientX - other.x), 1);
      this.picture.zoom(before / after, this.timeAt((event.clientX + other.x) / 2));
    } else {
      this.picture.move(-by / this.panel().getBoundingClientRect().width);
    }
    pointer.x = event.clientX;
  }

  /** @param {PointerEvent} event */
  onUp(event) {
    this.pointers.delete(event.pointerId);
  }
}
