// What all stories share: a real browser, a visit to the page in it, and a player who sees the canvas.
//   node tell.mjs BROWSER STORIES BUILD
import {spawnSync} from 'node:child_process';
import {mkdtempSync, mkdirSync, readFileSync, rmSync, writeFileSync} from 'node:fs';
import {createRequire} from 'node:module';
import {tmpdir} from 'node:os';
import {join, resolve} from 'node:path';
import {serve, addressOf} from '../../../src/hosts/web/serve.mjs';

export const browserName = process.argv[2];
const build = resolve(process.argv[4]);
export const pageFolder = join(build, 'page');
const pictures = join(build, 'program_files', 'bin');
const require = createRequire(join(build, 'src/hosts/web/tools/'));
const puppeteer = require('puppeteer-core');
export const {PNG} = require('pngjs');
/** The script of a program that looks for faults of accessibility. */
export const axe = readFileSync(require.resolve('axe-core/axe.min.js'), 'utf8');

export const isFirefox = browserName === 'firefox';
/** A window of this size in the page shows the program at scale 1. */
const desktop = {width: 800, height: 640, ratio: 1};
export const menu = {training: 1, timed: 2, strategy: 3, trainingTable: 4, timedTable: 5, strategyTable: 6, help: 7, exit: 8};
/** How wide the windows' client areas are, in the program's pixels. */
const widths = {'Quabble  Ver 1.0': 675, 'Game Statistics': 457, 'Best Score': 360, 'Best Scores - Quabble': 473};

/** What does not hold is told in one sentence. */
export function expect(isTrue, sentence) {
  if (!isTrue) throw new Error(sentence);
}

export async function until(what, isTrue, seconds = 10) {
  for (const end = Date.now() + 1000 * seconds; Date.now() < end; await wait(20)) {
    const found = await isTrue();
    if (found) return found;
  }
  throw new Error(`There was no ${what} within ${seconds} seconds.`);
}

export const wait = (milliseconds) => new Promise((done) => setTimeout(done, milliseconds));

/** A folder that is gone when the stories are told. */
const folders = [];
export function newFolder() {
  folders.push(mkdtempSync(join(tmpdir(), 'quabble_page_')));
  return folders.at(-1);
}
/** Where the browsers put what is downloaded. */
export const downloads = newFolder();
export const removeFolders = () => folders.forEach((folder) => rmSync(folder, {recursive: true, force: true}));

/**
 * A browser of its own; without cookies it lets no page keep anything. With a ratio it believes to be on such a screen,
 * which is another thing in Chromium than to play one: only then whole device pixels are what it counts in.
 */
export function launch({cookies = true, ratio} = {}) {
  if (isFirefox) {
    return puppeteer.launch({
      browser: 'firefox', executablePath: '/usr/bin/firefox-esr', headless: true,
      extraPrefsFirefox: cookies ? {} : {'network.cookie.cookieBehavior': 2},
    });
  }
  const profile = newFolder();
  if (!cookies) {
    mkdirSync(join(profile, 'Default'));
    const preferences = {profile: {default_content_setting_values: {cookies: 2}}};
    writeFileSync(join(profile, 'Default', 'Preferences'), JSON.stringify(preferences));
  }
  return puppeteer.launch({
    executablePath: '/usr/bin/chromium', headless: true, userDataDir: profile, ...(ratio && {defaultViewport: null}),
    args: [...(ratio ? [`--force-device-scale-factor=${ratio}`] : []),
      '--no-sandbox', '--disable-gpu', '--disable-quic', '--no-first-run', '--disable-background-networking',
      '--disable-component-update', '--disable-sync'],
  });
}

/** Plays a visit on the machine without a screen, and comes back with what is other than it says: nothing, if all is well. */
export function differencesOf(visit) {
  const file = join(newFolder(), 'played.visit');
  writeFileSync(file, visit);
  const runner = ['--no-warnings', '--experimental-wasi-unstable-preview1', join(import.meta.dirname, '../../../cmake/run_wasi.mjs')];
  const {stdout} = spawnSync(process.execPath, [...runner, join(build, 'bin/quabble-visit'), '--files', pictures, file], {encoding: 'utf8'});
  return /\b0 of them/.test(stdout) ? '' : stdout;
}

/** The site, served by this machine; its address is `address`. */
export async function serveSite(folder = join(pageFolder, 'site')) {
  const server = await serve(folder);
  return {address: addressOf(server), close: () => (server.closeAllConnections(), new Promise((done) => server.close(done)))};
}

/** Runs in the page before its own script: what is looked at from outside, and which alarms are set. */
function watch() {
  const alarms = new Set();
  const {setTimeout: set, clearTimeout: clear} = window;
  const seen = {alarms, calls: 0}; // how often something was asked for that runs by itself
  window.setTimeout = (act, ...rest) => {
    const alarm = set(() => (alarms.delete(alarm), act()), ...rest);
    alarms.add(alarm);
    ++seen.calls;
    return alarm;
  };
  window.clearTimeout = (alarm) => (alarms.delete(alarm), clear(alarm));
  for (const name of ['requestAnimationFrame', 'requestIdleCallback', 'setInterval']) {
    const ask = window[name];
    window[name] = (...values) => (++seen.calls, ask(...values));
  }
  if (window.WebAssembly) {
    const make = WebAssembly.instantiate;
    WebAssembly.instantiate = async (module, imports) => {
      const made = await make(module, imports);
      seen.exports = (made.instance ?? made).exports;
      return made;
    };
  }
  document.addEventListener('securitypolicyviolation', (event) =>
    console.error(`The policy forbade ${event.violatedDirective} ${event.blockedURI} ${event.sample}`));

  seen.top = () => [...document.querySelectorAll('.frame.seen:not([hidden]) canvas')].at(-1);
  const fingerprint = (left, top, width, height) => {
    const {data} = seen.top().getContext('2d').getImageData(left, top, width, height);
    let hash = 0x811c9dc5;
    for (let i = 0; i < data.length; i += 4)
      hash = Math.imul(hash ^ ((data[i] << 16) | (data[i + 1] << 8) | data[i + 2]), 0x01000193);
    return hash >>> 0;
  };
  seen.handOver = (bytes, place) => new Uint8Array(seen.exports.memory.buffer, place, bytes.length).set(bytes);
  seen.textAt = (place) => {
    const bytes = new Uint8Array(seen.exports.memory.buffer, place);
    return new TextDecoder().decode(bytes.slice(0, bytes.indexOf(0)));
  };
  seen.handOverPicture = (canvas) => {
    const {width, height} = canvas;
    seen.handOver(canvas.getContext('2d').getImageData(0, 0, width, height).data, seen.exports.pictureBuffer(width, height));
  };
  /** What the canvas shows, in the words of a visit. */
  seen.picture = () => (seen.handOverPicture(seen.top()), seen.textAt(seen.exports.seenPicture()));
  seen.cells = (left, top) => Array.from({length: 192}, (_, i) =>
    fingerprint(left + (i % 12) * 28, top + Math.floor(i / 12) * 28, 28, 28));
  /** The place that the keyboard's ring is around, at scale 1: it has the only long white lines. */
  seen.ring = () => {
    const {width, height} = seen.top();
    const pixels = new Uint32Array(seen.top().getContext('2d').getImageData(0, 0, width, height).data.buffer);
    let ring = null;
    for (let i = 0, run = 0; i < pixels.length; ++i) {
      run = pixels[i] === 0xffffffff && i % width > 0 ? run + 1 : 0;
      if (run < 10) continue;
      const [x, y] = [i % width, Math.floor(i / width)];
      ring = {...(ring ?? {left: x + 1 - run, top: y}), right: x + 1, bottom: y + 1};
    }
    return ring;
  };
  window.seen = seen;
}

/** Somebody at the page. What is done to windows is noted, to be done again on the machine without a screen. */
export class Visit {
  acts = [];
  pictures = [];
  #complaints = [];
  #context = null;

  /** Comes back when the menu is there, unless something else is to be waited for. */
  static async open(browser, address, {width, height, ratio, seed = 7, before, touch = false, context, until = 'menu'} = {}) {
    const visit = new Visit();
    visit.#context = context ? null : await browser.createBrowserContext({downloadBehavior: {policy: 'allow', downloadPath: downloads}});
    visit.context = context ?? visit.#context;
    visit.tab = await visit.context.newPage();
    visit.watchTab(visit.tab);
    width ??= desktop.width;
    height ??= desktop.height;
    await visit.resize(width, height, ratio ?? desktop.ratio, touch);
    await visit.tab.evaluateOnNewDocument(watch);
    if (before) await visit.tab.evaluateOnNewDocument(before);
    await visit.tab.goto(`${address}#seed=${seed}`);
    if (until === 'menu') await visit.untilMenu();
    return visit;
  }

  /** The page of a Chromium that believes to be on another screen is as large as its window has room for. */
  async resize(width, height, ratio, touch = false) {
    const isReal = this.tab.viewport() === null && !isFirefox;
    if (!isReal) return this.tab.setViewport({width, height, deviceScaleFactor: ratio, ...(touch && {hasTouch: true})});
    const session = await this.tab.createCDPSession();
    const {windowId} = await session.send('Browser.getWindowForTarget');
    await session.send('Browser.setWindowBounds', {windowId, bounds: {width, height}});
  }

  watchTab(tab) {
    tab.on('console', (message) => {
      const isOurLooking = message.text().startsWith('Canvas2D: Multiple readback');
      if (['error', 'warn', 'warning'].includes(message.type()) && !isOurLooking) this.#complaints.push(message.text());
    });
    tab.on('pageerror', (error) => this.#complaints.push(error.message));
  }

  /** Whatever the browser has complained of must have been expected. */
  async close({expected = /^$/} = {}) {
    const complaints = this.#complaints.filter((complaint) => !expected.test(complaint));
    await (this.#context ?? this.tab).close();
    expect(complaints.length === 0, `The browser complained: ${complaints.join('; ')}`);
  }

  see(read, ...values) {
    return this.tab.evaluate(read, ...values);
  }
  /** The captions of the windows, the topmost last. */
  captions() {
    return this.see(() => [...document.querySelectorAll('.frame.seen:not([hidden])')].map((frame) => frame.ariaLabel));
  }
  notice() {
    return this.see(() => document.getElementById('notice').textContent);
  }
  /** What the page says when the program is no more. */
  ending() {
    return this.tab.waitForSelector('.ended p').then((text) => text.evaluate((element) => element.textContent));
  }
  async untilWindow(caption) {
    await until(`window "${caption}"`, async () => (await this.captions()).at(-1) === caption);
  }
  /** The main window in its final sharpness. */
  async untilMenu() {
    await this.tab.waitForFunction(() => document.querySelector('.bar')?.parentElement.classList.contains('seen'));
    await this.atRest();
  }
  /** Until nothing is going to happen by itself. */
  async atRest() {
    await this.tab.waitForFunction(() => window.seen.alarms.size === 0 && window.seen.top()?.style.imageRendering === 'pixelated');
  }

  /** Where the program's pixel of the topmost window is in the page. */
  async placeOf(x, y) {
    const client = widths[(await this.captions()).at(-1)];
    return this.see((x, y, client) => {
      const {left, top, width} = window.seen.top().getBoundingClientRect();
      return [left + ((x + 0.5) * width) / client, top + ((y + 0.5) * width) / client];
    }, x, y, client);
  }
  async click(x, y) {
    if (this.hasNoMouse) {
      await this.walkTo(x, y);
      return this.clickByKey();
    }
    await this.tab.mouse.click(...(await this.placeOf(x, y)));
    await this.tab.mouse.move(1, 1); // away from a window that appears there
    await this.#note(`click ${x} ${y}`);
  }
  /** Brings the keyboard's ring around a place, or to a column; each time half of the way. */
  async walkTo(x, y) {
    for (let tries = 0; tries < 50; ++tries) {
      const {left, right, top, bottom} = (await this.see(() => window.seen.ring())) ?? {left: 0, right: 1e9, top: 0, bottom: 0};
      const isInColumn = x >= left && x < right;
      if (isInColumn && (y === undefined || (y >= top && y < bottom))) return;
      const [way, size, keys] = isInColumn
        ? [y - top, bottom - top, ['ArrowUp', 'ArrowDown']] : [x - left, right - left, ['ArrowLeft', 'ArrowRight']];
      const steps = size === 0 ? 1 : Math.max(1, Math.floor(Math.abs(way) / size / 2)); // the first key only shows the ring
      for (let step = 0; step < steps; ++step) await this.tab.keyboard.press(keys[way < 0 ? 0 : 1]);
    }
    throw new Error(`The keyboard does not lead to ${x}, ${y}.`);
  }
  /** With one after the other of the keys that click. */
  async clickByKey() {
    const keys = isFirefox ? ['Insert', 'Enter'] : ['Insert', 'Enter', 'ContextMenu']; // which cannot be pressed there
    const key = keys[(this.keyClicks = (this.keyClicks ?? 0) + 1) % keys.length];
    if (key === 'Enter') await this.tab.keyboard.down('Control');
    await this.tab.keyboard.press(key);
    if (key === 'Enter') await this.tab.keyboard.up('Control');
  }
  choose(button) {
    return this.click(337, 15 + 52 * button + 2);
  }
  async type(text) {
    await this.tab.keyboard.type(text);
    await this.#note(`type ${text}`);
  }
  async press(key) {
    await this.tab.keyboard.press(key);
    await this.#note(`key ${key.toLowerCase()}`);
  }
  async #note(act) {
    if (!this.isNoting) return;
    await this.atRest();
    this.acts.push(act);
    this.pictures.push(await this.see(() => window.seen.top() && window.seen.picture()));
  }
  /** Notes what was done in another way, as the acts that it ought to have come to. */
  async cameTo(...acts) {
    for (const act of acts.slice(0, -1)) {
      this.acts.push(act);
      this.pictures.push(null);
    }
    await this.#note(acts.at(-1));
  }

  /** Another tab comes in front of the page, which hides it, and goes again. */
  async whileHidden(act = () => {}) {
    // A tab that is driven counts as seen and focused, if Chromium is not told otherwise.
    if (!isFirefox) await (await this.tab.createCDPSession()).send('Emulation.setFocusEmulationEnabled', {enabled: false});
    const other = await this.context.newPage();
    await other.bringToFront();
    await until('hidden page', () => this.see(() => document.hidden));
    await act();
    await this.tab.bringToFront();
    await until('page to be seen', () => this.see(() => !document.hidden));
    await other.close();
  }

  /** What the browser keeps for the page. */
  kept() {
    return this.see(() => localStorage.getItem('quabble'));
  }

  /** A short Training game, up to the box for a name. */
  async untilName() {
    await this.choose(menu.training);
    await this.move(true);
    await this.atRest();
    await this.click(95, 385); // End Game
    await this.untilWindow('Game Statistics');
    await this.press('Enter');
    await this.untilWindow('Best Score');
  }

  /** Does all that was noted once more on the machine without a screen, where every picture must be the same. */
  compare() {
    const [scale] = this.pictures.find((picture) => picture !== null).split(' ');
    const lines = ['visit 1', 'seed 7', `scale ${scale}`];
    for (const [i, act] of this.acts.entries()) {
      if (act.startsWith('click')) lines.push(act.replace('click', `at ${i + 1}00s move`));
      lines.push(`at ${i + 1}00s ${act}`, `at ${i + 1}50s`);
      if (this.pictures[i] !== null) lines.push(`expect picture ${this.pictures[i]}`);
    }
    const differences = differencesOf(`${lines.join('\n')}\n`);
    const [, line] = /:(\d+):/.exec(differences) ?? [];
    expect(differences === '', `After "${lines[line - 3]}" the machine without a screen shows another picture than the page: ${differences}`);
  }

  // --- The player ---

  /** The letters of the board, 12 a row: "1" to "4" for blocks, "?" for what is no tile. */
  async board(isTraining) {
    const cells = await this.see((top) => window.seen.cells(232, top), isTraining ? 37 : 31);
    return cells.map((cell) => tiles.get(cell) ?? '?').join('');
  }
  async untilBoard(isTraining) {
    return until('board', async () => {
      const letters = await this.board(isTraining);
      return letters.includes('?') ? null : letters;
    });
  }
  /** Clicks a block of the largest cluster; false when there is none of that size. */
  async move(isTraining, smallest = isTraining ? 2 : 3) {
    if (this.hasNoMouse) await this.walkTo(95); // to the panel, where the ring covers nothing
    const cluster = largestCluster(await this.untilBoard(isTraining));
    if (cluster.length < smallest) return false;
    const cell = cluster[0];
    await this.click(232 + (cell % 12) * 28 + 14, (isTraining ? 37 : 31) + Math.floor(cell / 12) * 28 + 14);
    return true;
  }
}

/** The places of the blocks in the largest cluster. */
function largestCluster(letters) {
  let largest = [];
  const visited = new Set();
  for (let start = 0; start < letters.length; ++start) {
    if (!'1234'.includes(letters[start]) || visited.has(start)) continue;
    const cluster = [start];
    visited.add(start);
    for (const cell of cluster) {
      const beside = [cell - 12, cell + 12, ...(cell % 12 > 0 ? [cell - 1] : []), ...(cell % 12 < 11 ? [cell + 1] : [])];
      for (const next of beside) {
        if (letters[next] !== letters[start] || visited.has(next)) continue;
        visited.add(next);
        cluster.push(next);
      }
    }
    if (cluster.length > largest.length) largest = cluster;
  }
  return largest;
}

/** Which letter a cell's fingerprint stands for: the tiles stand in a row at the top of the sheet, a bitmap of 24 bits. */
const tiles = (() => {
  const file = readFileSync(join(pictures, 'ALLPICDATA.BMP'));
  const [start, width, height] = [10, 18, 22].map((at) => file.readInt32LE(at));
  const stride = (3 * width + 3) & ~3;
  const found = new Map();
  [...'.1234SsabcWXYZ'].forEach((letter, tile) => {
    let hash = 0x811c9dc5;
    for (let i = 0; i < 28 * 28; ++i) {
      const at = start + (height - 1 - Math.floor(i / 28)) * stride + 3 * (28 * tile + (i % 28));
      hash = Math.imul(hash ^ file.readUIntLE(at, 3), 0x01000193);
    }
    found.set(hash >>> 0, letter);
  });
  return found;
})();
