/** The page as the desk player writes it. */

import assert from 'node:assert/strict';
import { mkdtempSync, rmSync, writeFileSync } from 'node:fs';
import { tmpdir } from 'node:os';
import { join } from 'node:path';
import { after, before, test } from 'node:test';

import { gap, line, toText } from '../support/lines.js';
import { Browser, pathOf, runPlayer, runSession, textIn } from '../support/page.js';

const skip = !runPlayer('--help').includes('--page') && 'this desk player does not write pages';
const evening = ['examples/discs/sample', '--session', 'examples/sessions/evening.session'];
const page = ['--format', 'html', '--page', pathOf('page/dist/timeline.html')];

let browser;
let folder;
before(async () => {
  browser = await Browser.start();
  folder = mkdtempSync(join(tmpdir(), 'timeline-'));
});
after(async () => {
  await browser.stop();
  rmSync(folder, { recursive: true, force: true });
});

test('a session is shown with every callback', { skip }, async () => {
  const shown = await browser.open(runPlayer(...evening, ...page));
  assert.match(await textIn(shown.page, 'h1'), /evening/);
  const count = runSession('evening', 'json').trimEnd().split('\n').length;
  assert.equal(await textIn(shown.page, '#table caption'), `Callbacks: ${count}`);
  assert.deepEqual([shown.requests, shown.messages, await textIn(shown.page, '#notices')], [[], [], '']);
});

test('a recording with gaps and markup is shown beside another', { skip }, async () => {
  const file = join(folder, '<b>&"odd".jsonl');
  writeFileSync(file, toText([line(0, 'PlayStarted'), gap(1, '</script><!--<script>', 3), line(2, 'Paused')]));
  const shown = await browser.open(runPlayer(...evening, '--compare', file, ...page));
  assert.match(await textIn(shown.page, '#summary'), /<b>&"odd"\.jsonl: 2 callbacks, 2\.000 s, 1 gap/);
  assert.match(await textIn(shown.page, '#difference-counts'), /differences/);
  assert.deepEqual([shown.requests, shown.messages, await textIn(shown.page, '#notices')], [[], [], '']);
});
