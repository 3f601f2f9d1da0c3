import assert from 'node:assert/strict';
import { readFileSync } from 'node:fs';
import { test } from 'node:test';

import { Interfaces } from '../../src/model/callbacks.js';
import { argumentsText, readRecording, textOf } from '../../src/model/recording.js';
import { formatDuration, formatTime } from '../../src/model/ticks.js';
import { entriesOf, gap, line, start } from '../support/lines.js';
import { pathOf } from '../support/page.js';

test('numbers beyond 2^53 keep all digits', () => {
  const text = '{"ticks":18446744073709551615,"time":"","interface":"settings","callback":"CurrentTimePosition",'
    + '"arguments":{"position":9007199254740993}}';
  const { entries, faults } = readRecording('big', text);
  assert.deepEqual(faults, []);
  assert.equal(entries[0].ticks, 18446744073709551615n);
  assert.equal(argumentsText(entries[0]), 'position=9007199254740993');
});

test('numbers up to 2^53 stay numbers', () => {
  assert.equal(entriesOf([line(0, 'ChapterNumber', { chapter: 3 })])[0].values.chapter, 3);
});

test('a string with many digits stays a string', () => {
  const [entry] = entriesOf([line(0, 'SystemSuspended', { data: '00112233445566778899', size: 10 })]);
  assert.equal(entry.values.data, '00112233445566778899');
});

test('a line that is not JSON is a fault with its number, and the others are read', () => {
  const { entries, faults } = readRecording('broken', '{"ticks":0,"interface":"control","callback":"Paused"}\n{oops\n');
  assert.equal(entries.length, 1);
  assert.deepEqual(faults.map((fault) => fault.line), [2]);
});

for (const [what, text] of Object.entries({
  'an array': '[1]',
  'a negative time': '{"ticks":-1,"callback":"Paused"}',
  'a fractional time': '{"ticks":1.5,"callback":"Paused"}',
  'no kind': '{"ticks":1}',
})) {
  test(`a line with ${what} is a fault`, () => {
    assert.equal(readRecording('', text).faults.length, 1);
  });
}

test('a time before the previous one is a fault', () => {
  const { faults } = readRecording('', '{"ticks":2,"callback":"Paused"}\n{"ticks":1,"callback":"Paused"}\n');
  assert.equal(faults.length, 1);
});

test('arguments that are missing are absent, in their order', () => {
  const [entry] = entriesOf([line(0, 'PlayItem', { playItemId: 1 })]);
  assert.deepEqual(entry.absent, ['playListId', 'videoFormat', 'aspectRatio']);
});

test('a member tags is kept', () => {
  const [entry] = entriesOf([line(0, 'Paused', {}, { tags: { device: 'attic' } })]);
  assert.deepEqual(entry.tags, { device: 'attic' });
});

test('gaps and starts have tracks of their own', () => {
  const entries = entriesOf([start(0, '2024-05-31'), gap(1, 'lost', 2)]);
  assert.deepEqual(entries.map(({ track }) => track), ['starts', 'gaps']);
});

test('values are text for people', () => {
  assert.equal(textOf(null), 'none');
  assert.equal(textOf([]), 'nothing');
  assert.equal(textOf(['TimeSearch', 'Stop']), 'TimeSearch, Stop');
  assert.equal(textOf({ x: 1, y: 2 }), 'x 1, y 2');
});

test('times are truncated and not limited to a day', () => {
  assert.equal(formatTime(2611877n), '00:00:58.041');
  assert.equal(formatTime(100n * 3600n * 45000n), '100:00:00.000');
  assert.equal(formatDuration(1877n), '0.041 s');
  assert.equal(formatDuration(125n * 45000n), '2:05 min');
  assert.equal(formatDuration(8n * 3600n * 45000n), '8:00:00 h');
});

test('the callbacks and arguments are those of docs/outputs.md', () => {
  const documented = {};
  for (const [, name, declaredBy, list] of readFileSync(pathOf('docs/outputs.md'), 'utf8')
    .matchAll(/^\| `(\w+)` \| (control|settings|button|interactive) \|(.*)\|$/gm)) {
    documented[declaredBy] ??= {};
    documented[declaredBy][name] = [...list.matchAll(/`(\w+)`/g)].map(([, argument]) => argument);
  }
  assert.deepEqual(Interfaces, documented);
});
