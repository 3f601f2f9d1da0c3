import assert from 'node:assert/strict';
import { test } from 'node:test';

import { compare, countDifferences } from '../../src/model/compare.js';
import { layOutInstants, layOutSlices, limitRows } from '../../src/model/layout.js';
import { readRecording } from '../../src/model/recording.js';
import { matcher, searchText } from '../../src/model/search.js';
import { entriesOf, line, position, toText } from '../support/lines.js';

const find = (query, entry) => matcher(query)(searchText(entriesOf([entry])[0]));

test('all words of a search must occur, in any case', () => {
  const item = line(0, 'PlayItem', { playListId: 800, playItemId: 3 });
  assert.ok(find('playitem', item));
  assert.ok(find('playListId=800 ITEM', item));
  assert.ok(!find('PlayItem Chapter', item));
});

test('a word with a minus excludes', () => {
  assert.ok(find('settings -Position', line(0, 'AudioInfo', { number: 1 })));
  assert.ok(!find('settings -Position', position(0, 0)));
});

test('quotation marks keep blanks', () => {
  const mask = line(0, 'UOMask', { forbidden: ['TimeSearch', 'Stop'] });
  assert.ok(find('"TimeSearch, Stop"', mask));
  assert.ok(!find('"Stop, TimeSearch"', mask));
});

test('tags are found', () => {
  assert.ok(find('device=attic', line(0, 'Paused', {}, { tags: { device: 'attic' } })));
});

test('a search without words is none', () => {
  assert.equal(matcher('  '), null);
});

const differences = (a, b) => compare(entriesOf(a), entriesOf(b)).map(({ difference }) => difference);
const [play, pause, stop] = [line(0, 'PlayStarted'), line(5, 'Paused'), line(9, 'Stopped')];

test('equal recordings have no differences', () => {
  assert.deepEqual(differences([play, pause, stop], [play, pause, stop]), [null, null, null]);
});

test('a callback of one recording only is missing or added', () => {
  assert.deepEqual(differences([play, pause, stop], [play, stop]), [null, 'missing', null]);
  assert.deepEqual(differences([play, stop], [play, pause, stop]), [null, 'added', null]);
});

test('a callback with other arguments is changed, and they are named', () => {
  const audio = (number) => line(5, 'AudioInfo', { number });
  const [, pair] = compare(entriesOf([play, audio(1), stop]), entriesOf([play, audio(2), stop]));
  assert.deepEqual([pair.difference, pair.changes], ['changed', ['number']]);
});

test('numbers that a double confuses differ', () => {
  const [a, b] = ['9007199254740992', '9007199254740993'].map((digits) => readRecording('',
    toText([position(0, 0)]).replace('"position":0', `"position":${digits}`)).entries);
  assert.equal(compare(a, b)[0].difference, 'changed');
});

test('an argument that one recording lacks is changed', () => {
  const [pair] = compare(entriesOf([line(0, 'AudioInfo', { number: 1 })]), entriesOf([line(0, 'AudioInfo')]));
  assert.deepEqual(pair.changes, ['number']);
});

test('what shifts all that follows is one move', () => {
  const later = [play, line(7, 'Paused'), line(11, 'Stopped')];
  assert.deepEqual(differences([play, pause, stop], later), [null, 'moved', null]);
});

test('a move back is another', () => {
  const later = [play, line(7, 'Paused'), stop];
  assert.deepEqual(differences([play, pause, stop], later), [null, 'moved', 'moved']);
});

test('a shift within the tolerance is none', () => {
  assert.deepEqual(differences([play, pause], [play, line(5.09, 'Paused')]), [null, null]);
});

test('equal arguments are aligned before equal names', () => {
  const all = [0, 1, 2, 3].map((second) => position(second, second));
  assert.deepEqual(differences(all, [all[0], all[2], all[3]]), [null, 'missing', null, null]);
});

test('differences are counted by kind', () => {
  const pairs = compare(entriesOf([play, pause, stop]), entriesOf([play, line(2, 'StillOn'), stop]));
  assert.deepEqual(countDifferences(pairs), { added: 1, missing: 1, changed: 0, moved: 0 });
});

test('10,000 callbacks that all differ are paired by their names', () => {
  const many = (value) => entriesOf(Array.from({ length: 10000 }, (_, index) => position(index, index + value)));
  assert.equal(countDifferences(compare(many(0), many(0.5))).changed, 10000);
});

test('an alignment is in the order of both recordings and complete', () => {
  const mixed = (seed) => entriesOf(Array.from({ length: 300 }, (_, index) => (
    line(index, 'ChapterNumber', { chapter: (index * index * seed) % 7 }))));
  const [a, b] = [mixed(3), mixed(5)];
  const pairs = compare(a, b);
  assert.deepEqual(pairs.map((pair) => pair.a).filter(Boolean), a);
  assert.deepEqual(pairs.map((pair) => pair.b).filter(Boolean), b);
});

const instant = (start) => ({ start, end: start, label: '', entry: {}, slice: null });
const slice = (start, end) => ({ start, end, label: '', entry: {}, slice: {} });
const extents = (shapes) => shapes.map(({ start, end, marks }) => [start, end, marks.length]);

test('instants that would overlap are one cluster', () => {
  assert.deepEqual(extents(layOutInstants([0, 3, 4, 40].map(instant), 1)), [[0, 15, 3], [40, 45, 1]]);
});

test('clusters do not overlap at any scale, and contain every instant once', () => {
  const marks = Array.from({ length: 500 }, (_, index) => instant((index * index) % 7919))
    .sort((a, b) => a.start - b.start);
  for (const scale of [0.1, 1, 7, 100]) {
    for (const bucket of [0, 22, 44]) {
      const shapes = layOutInstants(marks, scale, bucket);
      assert.equal(shapes.reduce((sum, shape) => sum + shape.marks.length, 0), marks.length);
      shapes.slice(1).forEach((shape, index) => assert.ok(shape.start >= shapes[index].end));
    }
  }
});

test('narrow slices are clusters, and wide ones are not', () => {
  assert.deepEqual(extents(layOutSlices([slice(0, 2), slice(2, 4), slice(4, 100)], 1)), [[0, 4, 2], [4, 100, 1]]);
});

test('many narrow slices are several clusters', () => {
  const marks = Array.from({ length: 100 }, (_, index) => slice(index, index + 1));
  const shapes = layOutSlices(marks, 1);
  assert.ok(shapes.length > 3);
  assert.equal(shapes.reduce((sum, shape) => sum + shape.marks.length, 0), 100);
});

test('slices that overlap more often than there are rows are a cluster in the last row', () => {
  const shapes = [0, 10, 20, 30, 200].map((start) => ({ start, end: start + 100, marks: [slice(start, start + 100)] }));
  assert.deepEqual(extents(limitRows(shapes, 2)), [[0, 100, 1], [10, 130, 3], [200, 300, 1]]);
});
