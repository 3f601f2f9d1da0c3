/** Lines of recordings as short as tests need them. */

import { formatTime } from '../../src/model/ticks.js';
import { Interfaces } from '../../src/model/callbacks.js';
import { readRecording } from '../../src/model/recording.js';

/** @returns {string} the interface that declares a callback */
const interfaceOf = (callback) => Object.keys(Interfaces).find((name) => callback in Interfaces[name]);

/** A callback at a time in seconds. */
export const line = (seconds, callback, values = {}, more = {}) => ({
  ticks: Math.round(seconds * 45000),
  time: formatTime(BigInt(Math.round(seconds * 45000))),
  interface: interfaceOf(callback),
  callback,
  arguments: values,
  ...more,
});

/** The position that playback has reached, at times and positions in seconds. */
export const position = (seconds, media) => line(seconds, 'CurrentTimePosition', { position: media * 45000 });

export const gap = (seconds, cause, lost) => (
  { ticks: seconds * 45000, gap: lost === undefined ? { cause } : { lost, cause } });

export const start = (seconds, wallClock) => ({ ticks: seconds * 45000, start: { wallClock } });

export const toText = (lines) => lines.map((one) => `${JSON.stringify(one)}\n`).join('');

/** @returns {import('../../src/model/recording.js').Entry[]} */
export const entriesOf = (lines) => readRecording('test', toText(lines)).entries;

/** 10,000 callbacks: an evening on the sofa, again and again, with a pause in each. */
export function tenThousand() {
  const lines = [];
  for (let round = 0; lines.length < 10000; round += 1) {
    const at = round * 60;
    lines.push(
      line(at, 'PlayStarted'),
      line(at, 'Playlist', { playListId: round % 7 }),
      line(at, 'PlayItem', { playListId: round % 7, playItemId: 0, videoFormat: '1080p', aspectRatio: '16:9' }),
      line(at, 'ChapterNumber', { chapter: 1 + (round % 9) }),
      line(at, 'AudioInfo', { number: 1 + (round % 3) }),
      line(at, 'UOMask', { forbidden: ['ChapterSearch', 'TimeSearch'] }),
    );
    for (let second = 0; second < 40; second += 1) {
      lines.push(position(at + second, second));
    }
    lines.push(line(at + 40, 'Paused'), line(at + 50, 'Continued', { direction: 'Forward', speed: 'Normal' }),
      line(at + 59, 'Stopped'));
  }
  return lines.slice(0, 10000);
}
