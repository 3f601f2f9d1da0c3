/** Pages for tests: recordings, the page with recordings in it, and a browser that shows it. */

import { spawnSync } from 'node:child_process';
import { mkdtempSync, readFileSync, rmSync, writeFileSync } from 'node:fs';
import { tmpdir } from 'node:os';
import { join } from 'node:path';
import { fileURLToPath, pathToFileURL } from 'node:url';

import puppeteer from 'puppeteer-core';

const Root = fileURLToPath(new URL('../../../', import.meta.url));
const Player = process.env.DESKPLAYER ?? join(Root, 'build/dev/deskplayer/bdmv-deskplayer');

export const pathOf = (path) => join(Root, path);

/** @returns {string} what the desk player writes; it may refuse commands of the session */
export function runPlayer(...options) {
  const result = spawnSync(Player, options, { encoding: 'utf8', maxBuffer: 1 << 28, cwd: Root });
  if (result.error || result.status !== 0) {
    throw new Error(`${Player} ${options.join(' ')}: ${result.error?.message ?? result.stderr}`);
  }
  return result.stdout;
}

/** The output of a session on the sample disc. */
export function runSession(session, format) {
  return runPlayer('examples/discs/sample', '--session', `examples/sessions/${session}.session`, '--format', format);
}

const escapeAttribute = (text) => text.replaceAll('&', '&amp;').replaceAll('"', '&quot;').replaceAll('<', '&lt;');

/**
 * Inserts recordings as the desk player does.
 * @param {{ name: string, lines: string }[]} recordings
 */
export function pageWith(recordings) {
  const [before, after] = readFileSync(pathOf('page/dist/timeline.html'), 'utf8').split('<!--recordings-->');
  const elements = recordings.map(({ name, lines }) => (
    `<script type="application/x-ndjson" data-name="${escapeAttribute(name)}">\n${
      lines.replaceAll('<', '\\u003c')}</script>`));
  return before + elements.join('\n') + after;
}

/** A browser, and the folder of the pages that it shows. */
export class Browser {
  static async start() {
    const folder = mkdtempSync(join(tmpdir(), 'timeline-'));
    const browser = await puppeteer.launch({
      executablePath: process.env.CHROMIUM ?? '/usr/bin/chromium',
      headless: true,
      userDataDir: join(folder, 'profile'),
      args: ['--no-sandbox', '--disable-gpu', '--disable-quic', '--no-first-run', '--disable-background-networking',
        '--disable-component-update', '--disable-sync', '--disable-dev-shm-usage'],
    });
    return new Browser(browser, folder);
  }

  constructor(browser, folder) {
    this.browser = browser;
    this.folder = folder;
    this.pages = 0;
  }

  /**
   * Shows a page. What it requests besides itself, and what it writes to the console, is kept.
   * @param {string} html
   * @param {{ width?: number, height?: number, scheme?: 'light' | 'dark' }} [options]
   */
  async open(html, { width = 1280, height = 900, scheme = 'light' } = {}) {
    const address = this.write(html);
    const page = await this.browser.newPage();
    await page.setViewport({ width, height });
    await page.emulateMediaFeatures([{ name: 'prefers-color-scheme', value: scheme }]);
    const requests = [];
    const messages = [];
    page.on('request', (request) => {
      if (request.url() !== address && !request.url().startsWith('data:')) {
        requests.push(request.url());
      }
    });
    page.on('console', (message) => messages.push(`${message.type()}: ${message.text()}`));
    page.on('pageerror', (error) => messages.push(`error: ${error.message}`));
    await page.goto(address);
    await settle(page);
    return { page, requests, messages };
  }

  /** @returns {string} the address of a page */
  write(html) {
    this.pages += 1;
    const file = join(this.folder, `page${this.pages}.html`);
    writeFileSync(file, html);
    return pathToFileURL(file).href;
  }

  async stop() {
    await this.browser.close();
    rmSync(this.folder, { recursive: true, force: true });
  }
}

/** Waits until what has been requested for the next frames is drawn. */
export async function settle(page) {
  await page.evaluate(() => new Promise((done) => {
    requestAnimationFrame(() => requestAnimationFrame(() => requestAnimationFrame(done)));
  }));
}

/** @returns {Promise<string>} the text of an element */
export const textIn = (page, selector) => page.$eval(selector, (element) => element.textContent);
