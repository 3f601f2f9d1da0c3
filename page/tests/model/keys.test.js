import assert from 'node:assert/strict';
import { readFileSync } from 'node:fs';
import { test } from 'node:test';

import { Keys, actionOf } from '../../src/view/keys.js';
import { pathOf } from '../support/page.js';

const press = (key, more = {}) => ({ key, shiftKey: false, altKey: false, ctrlKey: false, metaKey: false, ...more });

test('docs/timeline.md lists every key', () => {
  const text = readFileSync(pathOf('docs/timeline.md'), 'utf8');
  const rows = [...text.matchAll(/^\| (.+) \| (?:picture|both) \| .+ \|$/gm)];
  const documented = rows.flatMap(([, keys]) => keys.split(/[ ,]+/));
  for (const { shown } of Keys) {
    for (const part of shown.split(' ')) {
      assert.ok(documented.includes(part), shown);
    }
  }
});

test('no two actions share a key', () => {
  const all = Keys.flatMap(({ keys }) => keys);
  assert.equal(new Set(all).size, all.length);
});

test('keys of the picture do nothing in the table', () => {
  assert.equal(actionOf(press('ArrowRight'), true), 'nextMark');
  assert.equal(actionOf(press('ArrowRight'), false), undefined);
  assert.equal(actionOf(press('n'), false), 'nextMatch');
});

test('keys with Ctrl, Alt or Meta belong to the browser', () => {
  for (const modifier of ['ctrlKey', 'altKey', 'metaKey']) {
    assert.equal(actionOf(press('0', { [modifier]: true }), true), undefined);
  }
});

test('the shift key makes another key', () => {
  assert.equal(actionOf(press('D', { shiftKey: true }), true), 'previousDifference');
  assert.equal(actionOf(press('d'), true), 'nextDifference');
});
