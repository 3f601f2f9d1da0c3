import assert from 'node:assert/strict';
import { after, before, test } from 'node:test';

import { line, toText } from '../support/lines.js';
import { Browser, pageWith, runSession, settle, textIn } from '../support/page.js';

let browser;
before(async () => {
  browser = await Browser.start();
});
after(() => browser.stop());

const first = [
  line(0, 'PlayStarted'),
  line(0, 'AudioInfo', { number: 1 }),
  line(10, 'Paused'),
  line(20, 'Continued', { direction: 'Forward', speed: 'Normal' }),
  line(30, 'PopUpMenuAvailable'),
  line(40, 'Stopped'),
];
const second = [
  line(0, 'PlayStarted'),
  line(0, 'AudioInfo', { number: 2 }),
  line(10, 'Paused'),
  line(25, 'Continued', { direction: 'Forward', speed: 'Normal' }),
  line(30, 'StillOn'),
  line(45, 'Stopped'),
];

const open = (a, b) => browser.open(pageWith([{ name: 'first', lines: a }, { name: 'second', lines: b }]));
const rows = (page) => page.$$eval('#table tbody tr', (all) => all.map((row) => (
  [...row.cells].map(({ textContent }) => textContent))));

test('differences are counted by kind', async () => {
  const { page, requests, messages } = await open(toText(first), toText(second));
  assert.equal(await textIn(page, '#difference-counts'), '4 differences+ 1 added− 1 missing≠ 1 changed→ 1 moved');
  assert.match(await textIn(page, '#summary'), /A first: 6 callbacks.*B second: 6 callbacks/);
  assert.deepEqual([requests, messages], [[], []]);
  await page.close();
});

test('the table shows both, row by row, with what differs', async () => {
  const { page } = await open(toText(first), toText(second));
  assert.deepEqual((await rows(page)).map(([difference, a, b, name, values]) => [difference, a, b, name, values]), [
    ['', '00:00:00.000', '00:00:00.000', 'PlayStarted', ''],
    ['≠ changed', '00:00:00.000', '00:00:00.000', 'AudioInfo', 'number: 1 → 2'],
    ['', '00:00:10.000', '00:00:10.000', 'Paused', ''],
    ['→ moved', '00:00:20.000', '00:00:25.000', 'Continued', 'direction=Forward speed=Normal'],
    ['− missing', '00:00:30.000', '', 'PopUpMenuAvailable', ''],
    ['+ added', '', '00:00:30.000', 'StillOn', ''],
    ['', '00:00:40.000', '00:00:45.000', 'Stopped', ''],
  ]);
  await page.close();
});

test('the picture has both recordings on each track, and marks differences', async () => {
  const { page } = await open(toText(first), toText(second));
  const lanes = await page.$$eval('#picture .lane', (all) => all.map(({ textContent }) => textContent));
  assert.deepEqual(lanes.slice(0, 4),
    ['playbackA3', 'playbackB4', 'audioA1', 'audioB1']);
  for (const kind of ['added', 'missing', 'changed', 'moved']) {
    assert.ok(await page.$(`#picture .vis-item.instant.difference.${kind}`), kind);
  }
  await page.close();
});

test('next and previous go through the differences and say what they are', async () => {
  const { page } = await open(toText(first), toText(second));
  const difference = async (button) => {
    await page.click(button);
    await settle(page);
    return textIn(page, '#details p.difference');
  };
  assert.equal(await difference('#next-difference'), 'Changed: number.');
  assert.deepEqual(await page.$$eval('#details tbody tr', (all) => all.map(({ textContent }) => textContent)),
    ['≠ number12']);
  assert.equal(await difference('#next-difference'), 'Moved: 5.000 s later in B from here on.');
  assert.equal(await difference('#next-difference'), 'Missing in B: only in A.');
  assert.equal(await difference('#next-difference'), 'Added: only in B.');
  assert.equal(await textIn(page, '#announcement'), 'StillOn. Added: only in B.');
  assert.equal(await difference('#previous-difference'), 'Missing in B: only in A.');
  await page.focus('#picture');
  await page.keyboard.press('d');
  assert.equal(await textIn(page, '#details p.difference'), 'Added: only in B.');
  await page.close();
});

test('only differences are left when asked', async () => {
  const { page } = await open(toText(first), toText(second));
  await page.click('#only-differences');
  await settle(page);
  assert.equal(await textIn(page, '#table caption'), 'Callbacks of both recordings: 4 of 7');
  await page.close();
});

test('the tolerance decides what has moved', async () => {
  const { page } = await open(toText(first), toText(second));
  await page.$eval('#tolerance', (input) => {
    input.value = '6000';
    input.dispatchEvent(new Event('change', { bubbles: true }));
  });
  assert.match(await textIn(page, '#difference-counts'), /^3 differences/);
  await page.close();
});

test('a session does not differ from itself', async () => {
  const evening = runSession('evening', 'json');
  const { page } = await open(evening, evening);
  assert.equal(await textIn(page, '#difference-counts'), 'No differences');
  assert.equal((await page.$$('#picture .vis-item.fold')).length, 1);
  await page.close();
});
