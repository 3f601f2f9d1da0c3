// The answers of docs/fleet.md find the faults of a fleet. scripts/fleet runs this.

import assert from 'node:assert/strict';
import { mkdtempSync, readFileSync, readdirSync, rmSync } from 'node:fs';
import os from 'node:os';
import path from 'node:path';
import { after, before, test } from 'node:test';
import { answer, questions, readRecords, rowsOf, tableOf } from './answers.mjs';
import { Devices, LogsPerDevice, PlayLists, makeFleet } from './fleet.mjs';

const { BDMV_DESKPLAYER: player, BDMV_DISC: disc } = process.env;

let folder;
let recordings;
let seeds;
let answers;

before(async () => {
  folder = mkdtempSync(path.join(os.tmpdir(), 'fleet-'));
  recordings = path.join(folder, 'recordings');
  seeds = makeFleet({ player, disc, folder });
  answers = await answer(recordings);
});

after(() => rmSync(folder, { recursive: true }));

const sum = (values) => values.reduce((total, value) => total + value, 0);
const rounded = (value) => Math.round(value * 1000) / 1000;
const count = (condition) => seeds.evenings.filter(condition).length;

test('every log becomes a recording', () => {
  const files = readdirSync(recordings, { recursive: true }).filter((name) => /\..*\./.test(name));
  assert.equal(files.length, Devices * LogsPerDevice);
  assert.ok(files.every((name) => /D\d\d.evening-\d\.log\.jsonl$/.test(name)), files.join());
});

test('records have the lines of each log in their order', async () => {
  const connection = await readRecords(recordings);
  const rows = await rowsOf(connection, 'SELECT log, ticks, name, device FROM records ORDER BY line');
  connection.closeSync();
  const logs = new Map();
  rows.forEach((row) => logs.set(row.log, [...(logs.get(row.log) ?? []), row]));
  assert.equal(logs.size, Devices * LogsPerDevice);
  for (const [log, read] of logs) {
    const written = readFileSync(log, 'utf8').trimEnd().split('\n').map((line) => {
      const { ticks, callback, gap, tags } = JSON.parse(line);
      return { log, ticks, name: callback ?? (gap ? '(gap)' : '(start)'), device: tags.device };
    });
    assert.deepEqual(read, written);
  }
});

test('the slowest listeners are those of firmware 2.0', () => {
  const rows = answers['slow-listeners.sql'];
  const expected = Object.entries(seeds.waits).map(([key, waits]) => ({
    firmware: key.split(' ')[0],
    callback: key.split(' ')[1],
    waits: waits.length,
    mean_ms: rounded(sum(waits) / waits.length),
    longest_ms: Math.max(...waits),
  }));
  assert.equal(expected.length, 12);
  expected.sort((one, other) => other.mean_ms - one.mean_ms);
  assert.deepEqual(rows, expected);
  assert.deepEqual(rows.slice(0, 4).map(({ firmware }) => firmware), Array(4).fill('2.0'));
});

test('a resume after standby that failed precedes PlayFailed', () => {
  const failures = count(({ session }) => session === 'failure');
  const recoveries = count(({ session }) => session === 'recovery');
  const firstFailures = count(({ session }) => session === 'firstFailure');
  // The first callbacks of all other logs have nothing before them either.
  assert.ok(recoveries > 0 && firstFailures > 0);
  assert.deepEqual(answers['before-play-failed.sql'], [
    {
      one_before: 'SystemSuspended',
      previous: 'SystemResumeFailed',
      failed: failures,
      occurred: failures + recoveries,
      percent: Math.round((1000 * failures) / (failures + recoveries)) / 10,
    },
    {
      one_before: '(none)',
      previous: '(none)',
      failed: firstFailures,
      occurred: seeds.evenings.length,
      percent: Math.round((1000 * firstFailures) / seeds.evenings.length) / 10,
    },
  ]);
});

test('skipping is forbidden in play list 1, as long as it was paused', () => {
  const periods = seeds.forbidden;
  assert.deepEqual(answers['skipping-forbidden.sql'], [
    {
      play_list: PlayLists.film,
      periods: periods.length,
      total_s: rounded(sum(periods)),
      mean_s: rounded(sum(periods) / periods.length),
      longest_s: rounded(Math.max(...periods)),
    },
  ]);
});

test('resumes fail in play list 2 with firmware 1.1, and after standby', () => {
  const rows = answers['resumes.sql'];
  const attempts = {
    film: 'Resumed', trailer: 'Resumed', brokenTrailer: 'ResumeFailed',
    standby: 'SystemResumed', failure: 'SystemResumeFailed', recovery: 'SystemResumeFailed',
  };
  const expected = new Map();
  for (const { session, firmware, losesLines } of seeds.evenings) {
    if (attempts[session] !== undefined) {
      const from = attempts[session].startsWith('System') ? 'standby' : 'suspension';
      const playList = losesLines ? null : PlayLists[session];
      const row = expected.get(`${playList} ${firmware} ${from}`) ?? { failed: 0, resumes: 0 };
      row.failed += attempts[session].endsWith('Failed') ? 1 : 0;
      ++row.resumes;
      expected.set(`${playList} ${firmware} ${from}`, row);
    }
  }
  assert.ok(expected.get('2 1.1 suspension').failed > 0);
  const found = new Map(rows.map(({ play_list, firmware, resumed_from, failed, resumes }) =>
    [`${play_list} ${firmware} ${resumed_from}`, { failed, resumes }]));
  assert.deepEqual(found, expected);
  const [worst] = rows.filter(({ resumed_from }) => resumed_from === 'suspension');
  assert.equal(`${worst.play_list} ${worst.firmware}`, '2 1.1');
  assert.equal(worst.percent, Math.round((1000 * worst.failed) / worst.resumes) / 10);
});

test('device D07 lost lines, and the last lines of three others are truncated', () => {
  assert.ok(seeds.lost.length > 0);
  assert.equal(seeds.truncated.length, 3);
  assert.deepEqual(answers['losses.sql'], [
    {
      cause: 'lost', firmware: '1.0', device: 'D07', gaps: seeds.lost.length,
      lost_lines: sum(seeds.lost), gaps_of_unknown_size: 0, logs: seeds.lost.length,
    },
    ...seeds.truncated.map((device) => ({
      cause: 'truncated', firmware: '1.0', device, gaps: 1, lost_lines: null,
      gaps_of_unknown_size: 1, logs: 1,
    })),
  ]);
});

for (const question of questions) {
  test(`docs/fleet.md shows the answer of ${question}`, () => {
    const page = readFileSync(new URL('../../docs/fleet.md', import.meta.url), 'utf8');
    const table = tableOf(answers[question]);
    assert.ok(page.includes(`(../examples/fleet/${question})\n\n${table}\n`), table);
  });
}
