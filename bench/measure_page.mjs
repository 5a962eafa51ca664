// What the page costs in Chromium, against a page that shows one picture: node measure_page.mjs PAGE TOOLS SPLASH.png
//   PAGE   the folder that the build makes the page in
//   TOOLS  the folder with the page's tools
import {copyFileSync, mkdtempSync, rmSync, statSync, writeFileSync} from 'node:fs';
import {tmpdir} from 'node:os';
import {createRequire} from 'node:module';
import {join, resolve} from 'node:path';
import {serve, addressOf} from '../src/hosts/web/serve.mjs';

const [page, tools, splash] = process.argv.slice(2).map((path) => resolve(path));
const puppeteer = createRequire(tools + '/')('puppeteer-core');
const starts = 15;
const browser = await puppeteer.launch({
  executablePath: '/usr/bin/chromium', headless: true,
  args: ['--no-sandbox', '--disable-gpu', '--disable-quic', '--no-first-run', '--disable-background-networking',
    '--disable-component-update', '--disable-sync'],
});

const median = (values) => [...values].sort((one, other) => one - other)[values.length >> 1];

/** A line of the table whose head bench/run prints. */
function report(what, measured, limit, unit, {times = 1, more = 0} = {}) {
  const number = (value) => `${value.toFixed(2).padStart(9)} ${unit.padEnd(6)}`;
  const goal = times !== 1 ? `x ${times}` : `+ ${more} ${unit}`;
  const ratio = limit > 0 ? (measured / limit).toFixed(2) : '-';
  const isMet = measured <= limit * times + more;
  console.log(`| ${what.padEnd(58)} | ${number(measured)} | ${number(limit)} | ${ratio.padStart(6)} | ${goal.padEnd(14)} | ${(isMet ? 'ok' : 'SHORT').padEnd(5)} |`);
}

/** A visit by a browser that has seen nothing before. */
async function visit(address, width, height, ratio, watch) {
  const context = await browser.createBrowserContext();
  const tab = await context.newPage();
  await tab.setViewport({width, height, deviceScaleFactor: ratio});
  await tab.evaluateOnNewDocument(watch);
  await tab.goto(address);
  return {tab, leave: () => context.close()};
}

/** Notes the program's memory, and how it shows a picture. */
function watchGame() {
  const start = WebAssembly.instantiate;
  WebAssembly.instantiate = async (module, imports) => {
    const show = imports.page.showPixels;
    imports.page.showPixels = (...values) => {
      window.showAgain = () => show(...values);
      show(...values);
    };
    const made = await start(module, imports);
    window.programMemory = made.exports.memory;
    return made;
  };
}
/** Notes the time of the first frame in which a picture is seen, whether it is the program's or comes before it. */
function watchPicture() {
  const seen = () => requestAnimationFrame(() => (window.firstPicture ??= performance.now()));
  document.addEventListener('load', (event) => event.target instanceof HTMLImageElement && seen(), {capture: true});
}

async function timeOfFirstPicture(address) {
  const {tab, leave} = await visit(address, 1280, 800, 1, watchPicture);
  const time = await (await tab.waitForFunction(() => window.firstPicture)).jsonValue();
  await leave();
  return time;
}

async function untilMenu(tab) {
  await tab.waitForFunction(() => document.querySelector('.bar')?.parentElement.classList.contains('seen'));
  await tab.waitForFunction(() => document.querySelector('.frame canvas').style.imageRendering === 'pixelated');
}

/**
 * Does the same many times in the tab, and gives the milliseconds of one. What a canvas puts off it does when it is read.
 * The clock counts tenths of a millisecond.
 */
const timeIn = (tab, act) => tab.evaluate(async (source) => {
  const run = new Function(`return (${source})`)();
  const paint = document.querySelector('.frame canvas').getContext('2d');
  const times = [];
  for (let round = 0; round < 15; ++round) {
    const acts = 20;
    const begin = performance.now();
    for (let i = 0; i < acts; ++i) {
      run(i);
      paint.getImageData(0, 0, 1, 1);
    }
    times.push((performance.now() - begin) / acts);
  }
  return times.toSorted((one, other) => one - other)[times.length >> 1];
}, act.toString());

/** What the program does to show the main window, and what a page does at least. */
const showWindow = () => window.showAgain();
function putPixels() {
  const canvas = document.querySelector('.frame canvas');
  const paint = canvas.getContext('2d');
  window.pixels ??= paint.getImageData(0, 0, canvas.width, canvas.height);
  paint.putImageData(window.pixels, 0, 0);
}

/** The milliseconds from a press on a button of the menu until its picture is on the canvas, which the next frame shows. */
const timeOfClick = (tab) => tab.evaluate(() => {
  const canvas = document.querySelector('.frame canvas');
  const area = canvas.getBoundingClientRect();
  const at = {clientX: area.left + area.width / 2, clientY: area.top + (area.height * 67) / 562, bubbles: true, pointerId: 1};
  const surface = document.querySelector('.frame .spoken');
  surface.setPointerCapture = () => {};
  const paint = canvas.getContext('2d');
  const seen = () => paint.getImageData(canvas.width / 2, canvas.height / 2, 40, 40).data.join();
  const before = seen();
  const begin = performance.now();
  surface.dispatchEvent(new PointerEvent('pointerdown', at));
  const time = performance.now() - begin;
  if (seen() === before) throw new Error('a click shows nothing at once');
  return time;
});

const received = new Map();
const site = await serve(join(page, 'site'), 0, (path, size) => received.set(path, size));
const folder = mkdtempSync(join(tmpdir(), 'picture-'));
copyFileSync(splash, join(folder, 'splash.png'));
writeFileSync(join(folder, 'index.html'), '<!doctype html><title>A picture</title><img src="splash.png">');
const picture = await serve(folder);

const times = {page: [], picture: []};
for (let i = 0; i < starts; ++i) {
  times.page.push(await timeOfFirstPicture(addressOf(site)));
  times.picture.push(await timeOfFirstPicture(addressOf(picture)));
}
report('navigation to the first picture | a page with one PNG', median(times.page), median(times.picture), 'ms', {times: 1.5});

let sizes = 0;
for (const [path, size] of received) sizes += /rest\.data|HTM$/.test(path) ? 0 : size;
report('a first visit, without fine pictures and help | stated', sizes / 1000, 450, 'kB');
report('the page in one file | stated', statSync(join(page, 'quabble.html')).size / 1000, 1200, 'kB');

for (const scale of [1, 2]) {
  const {tab, leave} = await visit(addressOf(site), 700 * scale, 620 * scale, 1, watchGame);
  await untilMenu(tab);
  const at = scale === 1 ? '' : ` at scale ${scale}`;
  report(`showing the main window${at} | putImageData`, await timeIn(tab, showWindow), await timeIn(tab, putPixels), 'ms', {times: 1.5});
  report(`a click to its picture${at} | a frame`, await timeOfClick(tab), 1000 / 60, 'ms');
  if (scale === 1) await measurePlay(tab);
  else report('memory of WebAssembly at scale 2 | stated', await tab.evaluate(() => window.programMemory.buffer.byteLength / (1 << 20)), 24, 'MiB');
  await leave();
}

/** @param {any} tab */
async function measurePlay(tab) {
  await tab.evaluate(() => {
    window.timers = 0;
    for (const name of ['setTimeout', 'setInterval', 'requestAnimationFrame', 'requestIdleCallback']) {
      const ask = window[name];
      window[name] = (...values) => (++window.timers, ask.apply(window, values));
    }
  });
  await new Promise((rest) => setTimeout(rest, 10000));
  report('10 s idle, main menu: timers set | none', await tab.evaluate(() => window.timers), 0, '');
}
rmSync(folder, {recursive: true});
site.close();
picture.close();
await browser.close();
