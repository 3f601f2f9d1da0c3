import assert from 'node:assert/strict';
import { after, before, test } from 'node:test';

import { Browser, pageWith, runSession, settle, textIn } from '../support/page.js';

let browser;
let page;
before(async () => {
  browser = await Browser.start();
  ({ page } = await browser.open(pageWith([{ name: 'evening.session', lines: runSession('evening', 'json') }])));
});
after(() => browser.stop());

const title = () => textIn(page, '#details h2');
const announcement = () => textIn(page, '#announcement');
const focused = () => page.evaluate(() => document.activeElement.id || document.activeElement.closest('[id]')?.id);
const press = async (...keys) => {
  for (const key of keys) {
    await page.keyboard.press(key);
  }
  await settle(page);
};
const pressShift = async (key) => {
  await page.keyboard.down('Shift');
  await press(key);
  await page.keyboard.up('Shift');
};
const axis = () => page.$$eval('#picture .vis-time-axis .vis-text.vis-minor:not(.vis-measure)', (labels) => (
  labels.map(({ textContent }) => textContent).join()));

test('the Tab key reaches the search, the view, the picture, the table and the details, each with a visible focus',
  async () => {
    const reached = [];
    for (let count = 0; count < 20 && !reached.includes('details'); count += 1) {
      await press('Tab');
      reached.push(await focused());
      const outline = await page.evaluate(() => {
        const element = document.activeElement;
        const shown = element.type === 'radio' ? element.nextElementSibling : element;
        return getComputedStyle(shown).outlineStyle;
      });
      assert.equal(outline, 'solid', reached.at(-1));
    }
    for (const id of ['query', 'only-matches', 'fold', 'zoom-in', 'fit', 'picture', 'table', 'details']) {
      assert.ok(reached.includes(id), `${id} in ${reached}`);
    }
  });

test('the arrow keys go through the picture and announce what is there', async () => {
  await page.focus('#picture');
  await press('ArrowRight');
  assert.match(await announcement(), /^playback: Playing from 00:00:00\.000 to 00:00:25\.000, 1 of 11$/);
  assert.equal(await title(), 'playback: Playing');
  await press('ArrowRight');
  assert.equal(await title(), 'playback: Paused');
  await press('ArrowLeft', 'ArrowDown');
  assert.match(await announcement(), /^play mode: /);
  await press('End');
  assert.match(await announcement(), /2 of 2$/);
  await press('Home', 'ArrowUp');
  assert.match(await announcement(), /^playback: /);
});

test('every track is reached, and scrolled into view', async () => {
  await page.setViewport({ width: 1280, height: 660 });
  await settle(page);
  await page.focus('#picture');
  await press(...new Array(20).fill('ArrowDown'));
  assert.match(await announcement(), /^interactive: /);
  const visible = await page.evaluate(() => {
    const panel = document.querySelector('.vis-center').getBoundingClientRect();
    const item = document.querySelector('#picture .vis-item.selected').getBoundingClientRect();
    return item.top >= panel.top && item.bottom <= panel.bottom + 1;
  });
  assert.ok(visible);
  await page.setViewport({ width: 1280, height: 900 });
  await press('0');
});

test('plus and minus zoom, shifted arrow keys scroll, and 0 shows everything', async () => {
  await page.focus('#picture');
  await press('0');
  const whole = await axis();
  await press('+', '+', '+');
  const enlarged = await axis();
  assert.notEqual(enlarged, whole);
  await pressShift('ArrowLeft');
  assert.notEqual(await axis(), enlarged);
  await press('0');
  assert.equal(await axis(), whole);
});

test('the table goes by arrow keys and selects', async () => {
  await page.focus('#table tbody button[tabindex="0"]');
  await press('Home', 'ArrowDown', 'ArrowDown');
  assert.equal(await title(), 'PlayItem');
  assert.equal(await focused(), 'table');
  assert.equal(await page.$eval('#table tr[aria-current]', ({ dataset }) => dataset.row), '2');
  await press('End');
  assert.equal(await title(), 'Finished');
  assert.equal(await textIn(page, '#page-number'), 'Page 3 of 3');
});

test('slash goes to the search, Enter to matches, n and p to the next and the previous', async () => {
  await page.focus('#picture');
  await press('/');
  assert.equal(await focused(), 'query');
  await page.keyboard.type('playitem');
  await settle(page);
  assert.equal(await textIn(page, '#matches'), '7 of 300 match');
  await press('Enter');
  assert.equal(await textIn(page, '#matches'), 'Match 1 of 7');
  assert.equal(await focused(), 'query');
  await pressShift('Enter');
  assert.equal(await textIn(page, '#matches'), 'Match 7 of 7');
  await page.focus('#picture');
  await press('p', 'p', 'n');
  assert.equal(await textIn(page, '#matches'), 'Match 6 of 7');
  await page.focus('#query');
  await press('Escape');
  assert.equal(await textIn(page, '#matches'), '');
});

test('letters do nothing while text is typed', async () => {
  await page.focus('#query');
  await page.keyboard.type('m');
  assert.equal(await page.$eval('input[value=session]', ({ checked }) => checked), true);
  await press('Escape');
});

test('m switches the time and f folds standby', async () => {
  await page.focus('#picture');
  await press('m');
  assert.equal(await page.$eval('input[value=media]', ({ checked }) => checked), true);
  assert.equal(await announcement(), 'Media time');
  await press('m', 'f');
  assert.equal(await announcement(), 'Standby unfolded');
  assert.equal(await page.$eval('#fold', ({ checked }) => checked), false);
  await press('f');
});

test('Enter goes to the details', async () => {
  await page.focus('#picture');
  await press('ArrowRight', 'Enter');
  assert.equal(await focused(), 'details');
});

test('the question mark lists the keys, and Escape returns', async () => {
  await page.focus('#picture');
  await press('?');
  assert.ok(await page.$eval('#keys', ({ open }) => open));
  assert.ok((await page.$$('#keys tbody tr')).length > 15);
  await press('Escape');
  assert.equal(await focused(), 'picture');
});
