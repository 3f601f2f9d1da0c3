/** The tracks of the page against the trace that the desk player writes for the same recording. */

import assert from 'node:assert/strict';
import { mkdtempSync, rmSync, writeFileSync } from 'node:fs';
import { tmpdir } from 'node:os';
import { join } from 'node:path';
import { after, before, test } from 'node:test';

import { readRecording } from '../src/model/recording.js';
import { labelOf } from '../src/model/scene.js';
import { countTracks, slicesOf } from '../src/model/slices.js';
import { gap, line, start, toText } from './support/lines.js';
import { runPlayer, runSession } from './support/page.js';

/** What the trace says: slices with their times in ticks, and the number of events on each track. */
function readTrace(text) {
  const tracks = new Map();
  const counts = {};
  const slices = [];
  const open = new Map();
  for (const event of JSON.parse(text)) {
    if (event.ph === 'M') {
      tracks.set(event.tid, event.args.name ?? tracks.get(event.tid));
      continue;
    }
    const track = tracks.get(event.tid);
    const ticks = BigInt(Math.round((event.ts * 9) / 200));
    if (event.ph === 'B' || event.ph === 'i') {
      counts[track] = (counts[track] ?? 0) + 1;
    }
    if (event.ph === 'B') {
      open.set(track, { track, name: event.name, start: ticks, end: null });
      slices.push(open.get(track));
    } else if (event.ph === 'E') {
      open.get(track).end = ticks;
    }
  }
  return { counts, slices };
}

function assertSame(json, trace, endsWithSession) {
  const { entries, faults } = readRecording('', json);
  const slices = slicesOf(entries);
  const expected = readTrace(trace);
  assert.deepEqual(faults, []);
  assert.ok(slices.length > 0);
  assert.deepEqual(Object.fromEntries([...countTracks(entries, slices)].sort()),
    Object.fromEntries(Object.entries(expected.counts).sort()));
  // The session may last longer than its last callback.
  assert.deepEqual(
    slices.map(({ track, name, start: from, end, last }) => (
      { track, name, start: from, end: endsWithSession && last === null ? 'end' : end })),
    expected.slices.map((slice, index) => (
      { ...slice, end: endsWithSession && slices[index].last === null ? 'end' : slice.end })));
}

for (const session of ['evening', 'all-events']) {
  test(`the slices and instants of ${session} are those of its trace`, () => {
    assertSame(runSession(session, 'json'), runSession(session, 'trace'), true);
  });
}

let folder;
before(() => {
  folder = mkdtempSync(join(tmpdir(), 'timeline-'));
});
after(() => rmSync(folder, { recursive: true, force: true }));

test('gaps, starts and absent arguments do the same to tracks as in a trace', () => {
  const json = toText([
    start(0, '2024-05-31 20:15:00.123456'),
    line(0, 'PlayStarted'),
    line(0, 'AudioInfo', { number: 1 }),
    line(0, 'VideoInfo', { number: 1 }),
    line(1, 'AudioInfo'),
    line(1, 'PresentationGraphicsInfo', { number: 2 }),
    line(1, 'PlayMode', { direction: 'Forward' }),
    line(2, 'Paused'),
    gap(3, 'lost', 4),
    line(3, 'StillOff'),
    line(4, 'StillOn'),
    line(5, 'Suspended'),
    line(6, 'Resumed'),
    line(6, 'Continued'),
    line(7, 'SystemSuspended'),
    line(8, 'SystemResumed'),
    line(9, 'InteractiveGraphicsVisible'),
    line(10, 'ResumeFailed'),
  ]);
  const file = join(folder, 'recording.jsonl');
  writeFileSync(file, json);
  assertSame(json, runPlayer('--replay', file, '--format', 'trace'), false);
  assert.ok(readRecording('', json).entries.some((entry) => labelOf(entry) === 'lost: 4 missing'));
});
