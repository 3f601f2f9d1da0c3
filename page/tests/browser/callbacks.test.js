import assert from 'node:assert/strict';
import { after, before, test } from 'node:test';

import { gap, line, position, start, toText } from '../support/lines.js';
import { Browser, pageWith, runSession, settle, textIn } from '../support/page.js';

let browser;
let evening;
before(async () => {
  browser = await Browser.start();
  evening = runSession('evening', 'json');
});
after(() => browser.stop());

const open = (lines, name = 'evening.session') => browser.open(pageWith([{ name, lines }]));
const rowTexts = (page) => page.$$eval('#table tbody tr', (rows) => rows.map((row) => (
  [...row.cells].map(({ textContent }) => textContent))));
const search = async (page, query) => {
  await page.$eval('#query', (input) => {
    input.value = '';
  });
  await page.type('#query', query);
  await settle(page);
};

test('the table has a caption, headers and every callback with its arguments', async () => {
  const { page } = await open(evening);
  assert.equal(await textIn(page, '#table caption'), 'Callbacks: 300');
  assert.deepEqual(await page.$$eval('#table thead th', (cells) => cells.map(({ scope, textContent }) => (
    `${scope} ${textContent}`))), ['col Time', 'col Media time', 'col Interface', 'col Callback', 'col Arguments']);
  assert.equal((await page.$$('#table tbody th[scope=row]')).length, 100);
  const seen = [];
  for (let number = 0; number < 3; number += 1) {
    seen.push(...await rowTexts(page));
    if (number < 2) {
      await page.click('#next-page');
    }
  }
  const expected = evening.trimEnd().split('\n').map((one) => JSON.parse(one));
  assert.deepEqual(seen.map(([time, , declaredBy, name]) => [time, declaredBy, name]),
    expected.map((one) => [one.time, one.interface, one.callback]));
  assert.deepEqual(seen[2].at(-1), 'playListId=1 playItemId=0 videoFormat=1080p aspectRatio=16:9');
  await page.close();
});

test('a search counts, highlights and dims', async () => {
  const { page } = await open(evening);
  await search(page, 'audioinfo number=1');
  assert.equal(await textIn(page, '#matches'), '7 of 300 match');
  assert.equal((await page.$$('#table tr.match')).length, 4);
  assert.ok((await page.$$('#picture .vis-item.match')).length > 0);
  assert.ok((await page.$$('#picture .vis-item.instant.dimmed')).length > 0);
  assert.equal((await page.$$('#picture .vis-item.slice.dimmed')).length, 0);
  await page.click('#next-match');
  assert.equal(await textIn(page, '#details h2'), 'AudioInfo');
  assert.equal(await page.$eval('#table tr[aria-current]', ({ className }) => className), 'match callback');
  await page.close();
});

test('a search without matches says so', async () => {
  const { page } = await open(evening);
  await search(page, 'nothing like this');
  assert.equal(await textIn(page, '#matches'), 'No matches');
  await page.click('#next-match');
  assert.equal(await textIn(page, '#details h2'), 'Details');
  await page.close();
});

test('the filter leaves matches in the table and among the instants, and all slices', async () => {
  const { page } = await open(evening);
  const slices = (await page.$$('#picture .vis-item.slice')).length;
  await search(page, '-CurrentTimePosition');
  await page.click('#only-matches');
  await settle(page);
  assert.equal(await textIn(page, '#table caption'), 'Callbacks: 127 of 300');
  const instants = await page.$$eval('#picture .vis-item.instant', (items) => (
    items.reduce((sum, { dataset }) => sum + Number(dataset.count), 0)));
  assert.equal(instants, 127);
  assert.equal((await page.$$('#picture .vis-item.slice')).length, slices);
  assert.ok((await rowTexts(page)).every((cells) => !cells.includes('CurrentTimePosition')));
  assert.equal((await page.$$('.match')).length, 0);
  await page.close();
});

test('a selection in the picture turns the table to its page', async () => {
  const { page } = await open(evening);
  await page.focus('#picture');
  await page.keyboard.press('End');
  await page.keyboard.press('ArrowDown');
  await settle(page);
  const row = Number(await page.$eval('#table tr[aria-current]', ({ dataset }) => dataset.row));
  assert.equal(await textIn(page, '#page-number'), `Page ${Math.floor(row / 100) + 1} of 3`);
  await page.close();
});

test('gaps are hatched and name their cause and number', async () => {
  const { page } = await open(toText([start(0, '2024-05-31 20:15:00'), line(0, 'PlayStarted'), gap(30, 'lost', 12),
    line(30, 'Paused'), gap(60, 'restart'), line(60, 'PlayStarted'), line(90, 'Stopped')]));
  assert.equal((await page.$$('#picture .vis-item.gap')).length, 2);
  const background = await page.$eval('#picture .vis-item.gap', (item) => getComputedStyle(item).backgroundImage);
  assert.match(background, /repeating/);
  assert.deepEqual(await page.$$eval('#picture .vis-item.on-gaps', (items) => items.map((item) => item.textContent)),
    ['lost: 12 missing', 'restart']);
  assert.deepEqual(await page.$$eval('#picture .vis-item.on-starts', (items) => items.map((item) => item.textContent)),
    ['2024-05-31 20:15:00']);
  assert.match(await textIn(page, '#summary'), /2 gaps/);
  await page.click('#picture .vis-item.on-gaps');
  assert.deepEqual(await page.$$eval('#details tbody tr', (rows) => rows.map(({ textContent }) => textContent)),
    ['lost12', 'causelost']);
  await page.close();
});

test('lines that cannot be read are reported with their numbers, and the others are shown', async () => {
  const broken = new Array(7).fill('{"ticks":\n').join('');
  const [first, last] = [line(0, 'Paused'), line(9, 'Stopped')].map((one) => toText([one]));
  const { page, messages } = await open(`${first}not json\n${broken}${last}`);
  const notice = await textIn(page, '#notices');
  assert.match(notice, /evening\.session: 8 lines cannot be read\./);
  assert.match(notice, /line 2: /);
  assert.match(notice, /and 3 more lines/);
  assert.equal(await textIn(page, '#table caption'), 'Callbacks: 2');
  assert.deepEqual(messages, []);
  await page.close();
});

test('a recording without callbacks is reported', async () => {
  const { page, messages } = await open('');
  assert.match(await textIn(page, '#notices'), /evening\.session contains no callbacks\./);
  assert.deepEqual(messages, []);
  await page.close();
});

test('a page without a recording says so', async () => {
  const { page, messages } = await browser.open(pageWith([]));
  assert.match(await textIn(page, '#notices'), /contains no recording/);
  assert.deepEqual(messages, []);
  await page.close();
});

test('text from recordings is never markup', async () => {
  const evil = '</script><img src=x onerror="window.broken=1"><b>';
  const { page, requests, messages } = await open(toText([
    line(0, 'PlayItem', { playListId: evil, playItemId: evil, videoFormat: evil, aspectRatio: evil }),
    line(0, 'PlayMode', { direction: evil, speed: evil }),
    gap(1, evil),
    { ...line(2, 'Paused'), interface: evil, callback: evil },
    line(9, 'Stopped'),
  ]), evil);
  await page.click('#table tbody button');
  await page.hover('#picture .vis-item.on-play-mode');
  await page.waitForFunction(() => document.querySelector('.vis-tooltip')?.textContent.includes('onerror'));
  assert.equal(await textIn(page, 'h1'), evil);
  assert.match(await textIn(page, '#details'), /onerror/);
  assert.equal((await page.$$('img')).length, 0);
  assert.equal(await page.evaluate(() => window.broken), undefined);
  assert.deepEqual(requests, []);
  assert.deepEqual(messages, []);
  await page.close();
});

test('times and positions of any size are drawn without a complaint', async () => {
  const odd = toText([position(0, 0), line(1, 'Paused'), line(2, 'Stopped')])
    .replace('"ticks":90000', '"ticks":18446744073709551615')
    .replace('"position":0', '"position":18446744073709551615');
  const { page, messages } = await open(odd);
  await page.click('input[value=media]');
  await settle(page);
  assert.deepEqual(messages, []);
  assert.match(await textIn(page, '#table'), /113868790578:27:14\.480/);
  await page.close();
});

test('a recording of a single moment is drawn', async () => {
  const { page, messages } = await open(toText([line(5, 'PlayStarted'), line(5, 'Paused')]));
  assert.ok((await page.$$('#picture .vis-item.instant')).length > 0);
  await page.click('#zoom-in');
  await settle(page);
  assert.deepEqual(messages, []);
  await page.close();
});
