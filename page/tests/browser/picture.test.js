import assert from 'node:assert/strict';
import { after, before, test } from 'node:test';

import { line, position, toText } from '../support/lines.js';
import { Browser, pageWith, runSession, settle, textIn } from '../support/page.js';

let browser;
let evening;
before(async () => {
  browser = await Browser.start();
  evening = runSession('evening', 'json');
});
after(() => browser.stop());

const open = (lines, options) => browser.open(pageWith([{ name: 'evening.session', lines }]), options);

/** The number of slices and instants that the elements of the picture stand for, by track. */
const drawnCounts = (page) => page.$$eval('#picture .vis-item[data-count]', (items) => {
  const counts = {};
  for (const { dataset } of items) {
    if (dataset.count !== '0') {
      counts[dataset.track] = (counts[dataset.track] ?? 0) + Number(dataset.count);
    }
  }
  return counts;
});

const traceCounts = (text) => {
  const names = new Map();
  const counts = {};
  for (const { ph, tid, name, args } of JSON.parse(text)) {
    if (ph === 'M' && name === 'thread_name') {
      names.set(tid, args.name);
    } else if (ph === 'B' || ph === 'i') {
      counts[names.get(tid)] = (counts[names.get(tid)] ?? 0) + 1;
    }
  }
  return counts;
};

const axisText = (page) => page.$$eval('#picture .vis-time-axis .vis-text.vis-minor:not(.vis-measure)', (labels) => (
  labels.map(({ textContent }) => textContent).filter(Boolean)));

test('the picture draws the slices and instants of the trace, and names their numbers', async () => {
  const { page } = await open(evening);
  const expected = traceCounts(runSession('evening', 'trace'));
  assert.deepEqual(await drawnCounts(page), expected);
  const labels = await page.$$eval('#picture .lane', (lanes) => Object.fromEntries(lanes.map((lane) => (
    [lane.firstChild.textContent, Number(lane.querySelector('.count').textContent)]))));
  assert.deepEqual(labels, expected);
  await page.close();
});

test('no request leaves the page, and nothing is written to the console', async () => {
  const { page, requests, messages } = await open(evening);
  await page.click('#zoom-in');
  await page.click('input[value=media]');
  await settle(page);
  assert.deepEqual(requests, []);
  assert.deepEqual(messages, []);
  await page.close();
});

test('the policy refuses a request and a foreign script', async () => {
  const { page } = await open(evening);
  const results = await page.evaluate(async () => {
    const script = document.createElement('script');
    script.textContent = 'window.foreign = true';
    document.head.append(script);
    const fetched = await fetch('data:text/plain,x').then(() => true, () => false);
    return { fetched, foreign: window.foreign === true };
  });
  assert.deepEqual(results, { fetched: false, foreign: false });
  await page.close();
});

test('a click on a slice shows the callback that began it', async () => {
  const { page } = await open(evening);
  await page.click('#picture .vis-item.on-subtitles');
  assert.equal(await textIn(page, '#details h2'), 'subtitles: subtitles 1');
  const details = await textIn(page, '#details');
  assert.match(details, /Begun byPresentationGraphicsInfo/);
  assert.match(details, /Lasts/);
  assert.deepEqual(await page.$$eval('#details tbody tr', (rows) => rows.map(({ textContent }) => textContent)),
    ['number1', 'availabletrue']);
  await page.close();
});

test('a click on an instant shows its arguments', async () => {
  const { page } = await open(evening);
  await page.click('#picture .vis-item.on-button');
  assert.equal(await textIn(page, '#details h2'), 'ExecuteButton');
  assert.deepEqual(await page.$$eval('#details tbody tr', (rows) => rows.map(({ textContent }) => textContent)),
    ['ticket1', 'buttonId4', 'commands2']);
  await page.close();
});

test('a click on a cluster lists what is in it', async () => {
  const { page } = await open(evening);
  const cluster = await page.$('#picture .vis-item.on-interactive.cluster');
  const count = await cluster.evaluate(({ dataset }) => Number(dataset.count));
  await cluster.click();
  assert.equal((await page.$$('#details .cluster li')).length, count);
  await page.click('#details .cluster li:nth-child(2) button');
  assert.equal(await textIn(page, '#details .cluster h3'), `${count} at this place`);
  await page.close();
});

test('numbers beyond 2^53 are exact on the page', async () => {
  const { page } = await open(toText([position(0, 0)]).replace('"position":0', '"position":18446744073709551615'));
  assert.match(await textIn(page, '#table tbody'), /position=18446744073709551615/);
  await page.click('#table tbody button');
  assert.match(await textIn(page, '#details tbody'), /18446744073709551615 ticks/);
  await page.close();
});

test('an absent argument is said to be absent', async () => {
  const { page } = await open(toText([line(0, 'AudioInfo')]));
  await page.click('#table tbody button');
  assert.equal(await textIn(page, '#details tbody'), 'numbernot recorded');
  await page.close();
});

test('tags are shown', async () => {
  const { page } = await open(toText([line(0, 'Paused', {}, { tags: { device: 'attic' } })]));
  await page.click('#table tbody button');
  assert.match(await textIn(page, '#details'), /Tags.*deviceattic/);
  await page.close();
});

test('long standby is folded, and unfolds', async () => {
  const { page } = await open(evening);
  const standby = async () => (await page.$('#picture .state-Standby')).evaluate((item) => item.clientWidth);
  const folded = await standby();
  assert.ok(folded < 100, `${folded}`);
  assert.equal((await page.$$('#picture .vis-item.fold')).length, 1);
  assert.ok((await axisText(page)).includes('08:02:00'));
  await page.click('#fold');
  await settle(page);
  assert.ok(await standby() > 900);
  assert.equal((await page.$$('#picture .vis-item.fold')).length, 0);
  await page.close();
});

test('a recording without standby offers no folding', async () => {
  const { page } = await open(toText([line(0, 'PlayStarted'), line(90, 'Stopped')]));
  assert.equal(await page.$eval('#fold-label', ({ hidden }) => hidden), true);
  await page.close();
});

test('media time places callbacks at their positions', async () => {
  const { page } = await open(toText([line(0, 'PlayStarted'), position(0, 7200), line(5, 'PopUpMenuAvailable'),
    position(10, 7210), line(20, 'TriggerSet')]));
  assert.ok((await axisText(page)).every((label) => label.startsWith('00:00:')));
  await page.click('input[value=media]');
  await settle(page);
  await page.click('#picture .vis-item.on-interactive');
  assert.match(await textIn(page, '#details'), /Session time00:00:05\.000.*Media time02:00:00\.000/);
  assert.equal((await drawnCounts(page)).control, 2);
  await page.close();
});

test('callbacks without a media time are counted below the picture', async () => {
  const { page } = await open(toText([line(0, 'PlayStarted'), line(1, 'Paused'), position(2, 5),
    line(3, 'Continued')]));
  await page.click('input[value=media]');
  await settle(page);
  assert.equal(await textIn(page, '#picture-note'), '2 callbacks without a media time are only in the table.');
  await page.close();
});

test('dragging scrolls and is no click', async () => {
  const { page } = await open(evening);
  const whole = await axisText(page);
  await page.mouse.move(700, 300);
  await page.mouse.down();
  await page.mouse.move(400, 300, { steps: 4 });
  await page.mouse.up();
  await settle(page);
  const moved = await axisText(page);
  assert.ok(whole.includes('00:00:00'));
  assert.ok(!moved.includes('00:00:00') && moved.includes('08:02:00'), `${moved}`);
  // Some browsers send the click to what is under the pointer, others to what was pressed.
  await page.$eval('#picture .vis-item.on-play-list', (item) => item.click());
  assert.equal(await textIn(page, '#details h2'), 'Details');
  await page.close();
});

test('the wheel zooms with Ctrl, scrolls with Shift, and otherwise scrolls the page', async () => {
  const { page } = await open(evening, { width: 480, height: 700 });
  const turn = async (deltaY, key) => {
    const first = () => page.$eval('#picture .vis-item.on-play-list', ({ style }) => style.transform + style.width);
    const old = await first();
    await page.keyboard.down(key);
    await page.mouse.wheel({ deltaY });
    while (await first() === old) {
      await settle(page);
    }
    await page.keyboard.up(key);
  };
  await page.mouse.move(300, 400);
  await turn(-400, 'Control');
  await turn(200, 'Shift');
  assert.equal(await page.evaluate(() => window.scrollY), 0);
  await page.mouse.wheel({ deltaY: 200 });
  await page.waitForFunction(() => window.scrollY > 0);
  await page.close();
});

test('a double click enlarges what is under it', async () => {
  const { page } = await open(evening);
  await page.click('#picture .vis-item.on-subtitles', { count: 2 });
  await settle(page);
  const width = await page.$eval('#picture .vis-item.on-subtitles', (item) => item.clientWidth);
  assert.ok(width > 800, `${width}`);
  await page.close();
});
