import assert from 'node:assert/strict';
import { test } from 'node:test';

import { countTracks, slicesOf } from '../../src/model/slices.js';
import { Effects, InstantTracks, SliceTracks } from '../../src/model/tracks.js';
import { entriesOf, gap, line } from '../support/lines.js';

const namesOn = (track, lines) => slicesOf(entriesOf(lines)).filter((slice) => slice.track === track)
  .map(({ name }) => name);

test('a slice lasts until the next one on its track', () => {
  const [playing, paused] = slicesOf(entriesOf([line(0, 'PlayStarted'), line(5, 'Paused'), line(9, 'AudioInfo')]));
  assert.deepEqual([playing.end, playing.last], [225000n, 1]);
  assert.deepEqual([paused.end, paused.last], [405000n, null]);
});

test('the end of playback leaves streams selected', () => {
  const slices = slicesOf(entriesOf([line(0, 'PlayStarted'), line(0, 'AudioInfo', { number: 1 }), line(5, 'Stopped'),
    line(9, 'Paused')]));
  assert.deepEqual(slices.map(({ name, end }) => [name, end]),
    [['Playing', 225000n], ['audio 1', 405000n], ['Paused', 405000n]]);
});

test('the number 0 ends a slice and begins none', () => {
  const chapter = (seconds, number) => line(seconds, 'ChapterNumber', { chapter: number });
  assert.deepEqual(namesOn('chapter', [chapter(0, 2), chapter(1, 0)]), ['chapter 2']);
});

test('play items are numbered from 0', () => {
  assert.deepEqual(namesOn('play item', [line(0, 'PlayItem',
    { playListId: 0, playItemId: 0, videoFormat: '1080p', aspectRatio: '16:9' })]), ['play item 0']);
});

test('a callback whose name lacks an argument ends a slice and begins none', () => {
  const slices = slicesOf(entriesOf([line(0, 'AudioInfo', { number: 1 }), line(1, 'AudioInfo'), line(2, 'Paused')]));
  assert.deepEqual(slices.map(({ name, end }) => [name, end]), [['audio 1', 45000n], ['Paused', 90000n]]);
});

test('a still that is left continues playback, a pause does not', () => {
  assert.deepEqual(namesOn('playback', [line(0, 'StillOn'), line(1, 'StillOff')]), ['Still', 'Playing']);
  assert.deepEqual(namesOn('playback', [line(0, 'Paused'), line(1, 'StillOff')]), ['Paused']);
});

test('after a suspension the state before it returns', () => {
  assert.deepEqual(namesOn('playback', [line(0, 'Paused'), line(1, 'Suspended'), line(2, 'Resumed')]),
    ['Paused', 'Suspended', 'Paused']);
});

test('after standby playback continues or has ended', () => {
  assert.deepEqual(namesOn('playback', [line(0, 'SystemSuspended'), line(1, 'SystemResumed', { playing: true })]),
    ['Standby', 'Playing']);
  assert.deepEqual(namesOn('playback', [line(0, 'SystemSuspended'), line(1, 'SystemResumed')]), ['Standby']);
});

test('a gap ends all slices', () => {
  const slices = slicesOf(entriesOf([line(0, 'Paused'), line(0, 'VideoInfo', { number: 1 }), gap(2, 'lost'),
    line(3, 'StillOff')]));
  assert.deepEqual(slices.map(({ end, last }) => [end, last]), [[90000n, 2], [90000n, 2]]);
});

test('every effect is on a track and has a reason', () => {
  for (const [name, { on, because }] of Object.entries(Effects)) {
    assert.ok(on === undefined || SliceTracks.includes(on), name);
    assert.match(because, /^[A-Z].*\.$/, name);
  }
});

test('tracks are counted from top to bottom', () => {
  const entries = entriesOf([line(0, 'PopUpMenuAvailable'), line(0, 'Paused'), gap(1, 'lost')]);
  assert.deepEqual([...countTracks(entries, slicesOf(entries))],
    [['playback', 1], ['control', 1], ['interactive', 1], ['gaps', 1]]);
  assert.equal(new Set([...SliceTracks, ...InstantTracks]).size, 20);
});
