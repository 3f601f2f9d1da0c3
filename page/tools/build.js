/**
 * Writes dist/timeline.html: the page in one file, with its script and style inside, ready for recordings to be
 * inserted at the marker. The content security policy names the script and the style by their hashes and forbids
 * every request. Writes dist/timeline.spdx.json, too, which lists the packages in the page.
 */

import { createHash } from 'node:crypto';
import { mkdir, readFile, writeFile } from 'node:fs/promises';
import { fileURLToPath } from 'node:url';

import { build } from 'esbuild';

import { sbomOf } from './sbom.js';

const Marker = '<!--recordings-->';

const pathOf = (/** @type {string} */ path) => fileURLToPath(new URL(`../${path}`, import.meta.url));

/** @param {string} text */
const hashOf = (text) => `'sha256-${createHash('sha256').update(text).digest('base64')}'`;

/** @type {Set<string>} */
const inputs = new Set();

/**
 * Adds the files of the bundle to the inputs.
 * @param {string} entry
 * @returns {Promise<string>} the bundle, in ASCII
 */
async function bundle(entry) {
  const result = await build({
    entryPoints: [pathOf(entry)],
    bundle: true,
    minify: true,
    write: false,
    metafile: true,
    absWorkingDir: pathOf(''),
    format: 'iife',
    tsconfigRaw: {}, // whatever lies in the folders above
    target: ['chrome111', 'firefox115', 'safari16.4'],
    charset: 'ascii',
    legalComments: 'inline',
    logLevel: 'warning',
  });
  Object.keys(result.metafile.inputs).forEach((input) => inputs.add(input));
  return result.outputFiles[0].text;
}

/**
 * Within a script, "<!--" may make a browser overlook the script's end. It only occurs in strings and patterns, where
 * the backslash changes nothing.
 * @param {string} script
 */
const withoutComments = (script) => script.replaceAll('<!--', '<\\!--');

const script = withoutComments(await bundle('src/main.js'));
const style = (await bundle('src/style/page.css')).replaceAll('</', '<\\/');
const policy = [
  "default-src 'none'",
  `script-src ${hashOf(script)}`,
  `style-src ${hashOf(style)}`,
  'img-src data:',
  "connect-src 'none'",
  "base-uri 'none'",
  "form-action 'none'",
].join('; ');

const page = (await readFile(pathOf('src/page.html'), 'utf8'))
  .replace('{{policy}}', () => policy)
  .replace('{{style}}', () => style)
  .replace('{{script}}', () => script);

if (page.split(Marker).length !== 2 || !page.split('\n').includes(Marker)) {
  throw new Error(`expected exactly one line ${Marker}`);
}
await mkdir(pathOf('dist'), { recursive: true });
await writeFile(pathOf('dist/timeline.html'), page);
await writeFile(pathOf('dist/timeline.spdx.json'), await sbomOf(inputs));
