import assert from 'node:assert/strict';
import { test } from 'node:test';

import { Axis } from '../../src/model/axis.js';
import { mediaTimes, piecesOf } from '../../src/model/mediatime.js';
import { readRecording } from '../../src/model/recording.js';
import { analyse, sceneOf } from '../../src/model/scene.js';
import { slicesOf } from '../../src/model/slices.js';
import { foldsOf } from '../../src/model/standby.js';
import { entriesOf, gap, line, position, toText } from '../support/lines.js';

const seconds = (ticks) => (ticks === null ? null : Number(ticks) / 45000);
const mediaOf = (lines) => mediaTimes(entriesOf(lines)).map(seconds);

test('media time is the position reported last', () => {
  assert.deepEqual(mediaOf([position(5, 65), line(5.5, 'Paused'), position(6, 66)]), [65, 65, 66]);
});

test('before the first position media time is that of the same time', () => {
  const play = [line(0, 'PlayStarted'), line(0, 'Playlist', { playListId: 1 })];
  assert.deepEqual(mediaOf([...play, position(0, 7)]), [7, 7, 7]);
  assert.deepEqual(mediaOf([line(0, 'PlayStarted'), position(1, 7)]), [null, 7]);
});

test('after a jump media time is the next position at the same time', () => {
  assert.deepEqual(mediaOf([position(1, 1), line(2, 'JumpOccurred'), line(2, 'Paused'), position(2, 90)]),
    [1, 90, 90, 90]);
});

test('a step reports its own position', () => {
  assert.deepEqual(mediaOf([position(1, 1), line(2, 'Stepped', { position: 90000, direction: 'Forward' })]), [1, 2]);
});

test('a gap is where playback was, and what follows is unknown', () => {
  assert.deepEqual(mediaOf([position(1, 1), gap(2, 'lost'), line(2, 'Paused'), position(3, 4)]), [1, 1, null, 4]);
});

test('a position that is none or absent is unknown', () => {
  assert.deepEqual(mediaOf([position(1, 1), line(2, 'CurrentTimePosition', { position: null }),
    line(3, 'CurrentTimePosition')]), [1, null, null]);
});

test('a slice is cut where media time jumps or turns round', () => {
  const entries = entriesOf([line(0, 'PlayStarted'), position(0, 0), position(5, 5), line(6, 'JumpOccurred'),
    position(6, 60), position(9, 63), position(10, 62), position(12, 58)]);
  const pieces = piecesOf(slicesOf(entries)[0], entries, mediaTimes(entries));
  assert.deepEqual(pieces.map(({ start, end }) => [seconds(start), seconds(end)]), [[0, 5], [60, 63], [58, 62]]);
});

test('the middle of long standby is folded, and its end is a round time', () => {
  const entries = entriesOf([line(0, 'PlayStarted'), line(125, 'SystemSuspended'),
    line(8 * 3600 + 125, 'SystemResumed', { playing: true }), line(8 * 3600 + 215, 'Paused')]);
  const [fold] = foldsOf(entries, slicesOf(entries));
  assert.deepEqual([fold.start, fold.end].map(seconds), [130.375, 8 * 3600 + 120]);
});

test('short standby is not folded', () => {
  const entries = entriesOf([line(0, 'SystemSuspended'), line(59, 'SystemResumed'), line(60, 'Paused')]);
  assert.deepEqual(foldsOf(entries, slicesOf(entries)), []);
});

test('no callback is in a fold', () => {
  const entries = entriesOf([line(0, 'SystemSuspended'), line(3600, 'PopUpMenuAvailable'), line(7200, 'SystemResumed'),
    line(7260, 'Paused')]);
  const folds = foldsOf(entries, slicesOf(entries));
  assert.equal(folds.length, 2);
  assert.ok(folds.every(({ start, end }) => entries.every(({ ticks }) => ticks <= start || ticks >= end)));
});

test('the axis leaves out folds in both directions', () => {
  const axis = new Axis([{ start: 100, end: 1000, side: 0 }, { start: 2000, end: 3000, side: 0 }]);
  assert.deepEqual([50, 500, 1500, 4000].map((time) => axis.toVisible(time)), [50, 100, 600, 2100]);
  assert.deepEqual([50, 600, 2100].map((time) => axis.fromVisible(time)), [50, 1500, 4000]);
});

test('zoom keeps its centre, and counts only what is visible', () => {
  const axis = new Axis([{ start: 100, end: 1000, side: 0 }]);
  assert.deepEqual(axis.zoom(0, 1100, 0.5, 1050), { start: 75, end: 1075 });
  assert.deepEqual(axis.move(0, 1100, 0.5), { start: 1000, end: 1200 });
});

test('times of a scene count from the first full second, however late', () => {
  const recording = readRecording('late', '{"ticks":18446744073709500000,"interface":"control","callback":"Paused"}\n'
    + '{"ticks":18446744073709545000,"interface":"control","callback":"Stopped"}\n');
  const scene = sceneOf([analyse(recording)], 'session');
  assert.equal(scene.end, 1000 + Number((18446744073709500000n % 45000n) / 45n));
});

test('a position that no play list reaches is not drawn', () => {
  const recording = readRecording('odd', toText([position(0, 0), position(1, 1), position(2, 1e9)]));
  const scene = sceneOf([analyse(recording)], 'media');
  assert.deepEqual([scene.end, scene.unplaced], [1000, 1]);
});

test('a comparison folds what is standby in both', () => {
  const evening = (until) => analyse(readRecording('', toText([line(0, 'PlayStarted'), line(100, 'SystemSuspended'),
    line(until, 'SystemResumed', { playing: true }), line(until + 100, 'Paused')])));
  const [fold] = sceneOf([evening(7300), evening(3700)], 'session').folds;
  assert.deepEqual([fold.start, fold.end], [105000, 3690000]);
});
