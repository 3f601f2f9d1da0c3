/** Reads the recordings that the desk player has inserted into the page, and starts it. */

import { App } from './app.js';
import { readRecording } from './model/recording.js';
import { create, get, plural } from './view/dom.js';

/** Of a recording with more faults than this only the first are listed. */
const MostFaults = 5;

/** @param {...(Node | string)} content */
function notify(...content) {
  get('notices', HTMLDivElement).append(create('div', { class: 'notice' }, ...content));
}

/** @param {import('./model/recording.js').Recording} recording */
function reportFaults({ name, entries, faults }) {
  if (faults.length > 0) {
    const more = faults.length - MostFaults;
    notify(
      create('p', {}, `${name}: ${plural(faults.length, 'line')} cannot be read.`),
      create('ul', {}, ...faults.slice(0, MostFaults).map(({ line, message }) => (
        create('li', {}, `line ${line}: ${message}`)))),
      more > 0 ? create('p', {}, `and ${plural(more, 'more line')}`) : '');
  }
  if (entries.length === 0) {
    notify(create('p', {}, `${name} contains no callbacks.`));
  }
}

function start() {
  const elements = [...document.querySelectorAll('script[type="application/x-ndjson"]')].slice(0, 2);
  const recordings = elements.map((element, index) => readRecording(
    element.getAttribute('data-name') || `Recording ${index + 1}`, element.textContent ?? ''));
  recordings.forEach(reportFaults);
  if (recordings.length === 0) {
    notify(create('p', {}, 'This page contains no recording. The desk player writes one into it with --format html.'));
    return;
  }
  const app = new App(recordings);
  app.start();
}

window.addEventListener('error', ({ message }) => notify(create('p', {}, `The page failed: ${message}`)));

start();
