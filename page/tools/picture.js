/**
 * Draws a page with a recording as a picture, always of the same size and in the light colours. A play item is
 * selected, so that its arguments are shown.
 *
 *     node tools/picture.js PAGE PICTURE
 */

import { readFileSync } from 'node:fs';

import { Browser, settle } from '../tests/support/page.js';

const [source, picture] = process.argv.slice(2);
const browser = await Browser.start();
try {
  const { page, messages } = await browser.open(readFileSync(source, 'utf8'), { width: 1280, height: 800 });
  await page.locator('#table ::-p-text(PlayItem)').click();
  await settle(page);
  if (messages.length > 0) {
    throw new Error(messages.join('\n'));
  }
  await page.screenshot({ path: picture });
} finally {
  await browser.stop();
}
