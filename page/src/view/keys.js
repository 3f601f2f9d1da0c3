/** The keys, in one table: what the page does and what the dialog lists. */

import { create } from './dom.js';

/**
 * @typedef {object} Key
 * @property {string[]} keys values of KeyboardEvent.key, with Shift+ before them if the shift key is held
 * @property {string} shown
 * @property {string} does
 * @property {string} action name of the method of Actions
 * @property {boolean} [everywhere] in the picture and in the table, otherwise only in the picture
 */

/** @type {readonly Key[]} */
export const Keys = [
  { keys: ['ArrowLeft'], shown: '←', does: 'Previous on this track', action: 'previousMark' },
  { keys: ['ArrowRight'], shown: '→', does: 'Next on this track', action: 'nextMark' },
  { keys: ['ArrowUp'], shown: '↑', does: 'Track above', action: 'laneAbove' },
  { keys: ['ArrowDown'], shown: '↓', does: 'Track below', action: 'laneBelow' },
  { keys: ['Home'], shown: 'Home', does: 'First on this track', action: 'firstMark' },
  { keys: ['End'], shown: 'End', does: 'Last on this track', action: 'lastMark' },
  { keys: ['Shift+ArrowLeft'], shown: 'Shift ←', does: 'Scroll to earlier times', action: 'earlier' },
  { keys: ['Shift+ArrowRight'], shown: 'Shift →', does: 'Scroll to later times', action: 'later' },
  { keys: ['+', '=', 'Shift++'], shown: '+', does: 'Zoom in', action: 'zoomIn', everywhere: true },
  { keys: ['-'], shown: '−', does: 'Zoom out', action: 'zoomOut', everywhere: true },
  { keys: ['0'], shown: '0', does: 'Show the whole recording', action: 'fit', everywhere: true },
  { keys: ['Enter'], shown: 'Enter', does: 'Go to the details', action: 'toDetails' },
  { keys: ['/', 'Shift+/'], shown: '/', does: 'Go to the search', action: 'toSearch', everywhere: true },
  { keys: ['n'], shown: 'n', does: 'Next match', action: 'nextMatch', everywhere: true },
  { keys: ['p'], shown: 'p', does: 'Previous match', action: 'previousMatch', everywhere: true },
  { keys: ['d'], shown: 'd', does: 'Next difference', action: 'nextDifference', everywhere: true },
  { keys: ['Shift+D'], shown: 'Shift D', does: 'Previous difference', action: 'previousDifference', everywhere: true },
  { keys: ['m'], shown: 'm', does: 'Session time or media time', action: 'switchBase', everywhere: true },
  { keys: ['f'], shown: 'f', does: 'Fold or unfold standby', action: 'switchFold', everywhere: true },
  { keys: ['?', 'Shift+?'], shown: '?', does: 'This list', action: 'showKeys', everywhere: true },
];

/**
 * @param {KeyboardEvent} event
 * @param {boolean} inPicture
 * @returns {string | undefined} the action
 */
export function actionOf(event, inPicture) {
  if (event.altKey || event.ctrlKey || event.metaKey) {
    return undefined;
  }
  const name = event.shiftKey ? `Shift+${event.key}` : event.key;
  return Keys.find(({ keys, everywhere }) => keys.includes(name) && (inPicture || everywhere))?.action;
}

/** @param {HTMLDialogElement} dialog */
export function fillDialog(dialog) {
  const row = (/** @type {string} */ shown, /** @type {string} */ does, /** @type {boolean} */ everywhere) => (
    create('tr', {}, create('th', { scope: 'row' }, create('kbd', {}, shown)), create('td', {}, does),
      create('td', {}, everywhere ? 'picture, table' : 'picture')));
  dialog.replaceChildren(
    create('h2', { id: 'keys-title' }, 'Keys'),
    create('p', {}, 'They work while the picture or the table has the focus. In the table, the arrow keys, Page Up, '
      + 'Page Down, Home and End select rows. In the search, Enter goes to the next match, Shift Enter to the previous '
      + 'one, and Escape clears it.'),
    create('p', {}, 'In the picture, drag to scroll, hold Ctrl and turn the wheel to zoom, double-click to enlarge.'),
    create('div', { class: 'scroll', tabindex: '0', role: 'group', 'aria-label': 'List of keys' },
      create('table', {},
        create('thead', {}, create('tr', {}, ...['Key', 'Action', 'Where'].map((name) => (
          create('th', { scope: 'col' }, name))))),
        create('tbody', {}, ...Keys.map(({ shown, does, everywhere }) => row(shown, does, everywhere ?? false))))),
    create('button', { type: 'button', click: () => dialog.close() }, 'Close'));
}
