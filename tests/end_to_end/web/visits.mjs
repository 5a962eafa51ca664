// The visits that all machines play, in the page: a clock that is moved by hand, and what the canvas shows.
import {readFileSync, readdirSync} from 'node:fs';
import {join} from 'node:path';
import {browserName, expect, serveSite, until, Visit} from './browser.mjs';

const site = await serveSite();
export const leave = () => site.close();
const folder = join(import.meta.dirname, '../../visits');

/** Runs in the page before its own script. */
function beginAnew() {
  localStorage.clear();
  if (location.hash.endsWith('damaged')) localStorage.setItem('quabble', 'x');
  window.open = () => null; // the help's tab would hide the page
  window.clock = 0;
  const half = 0.5e-6; // of a nanosecond, the least that the program knows
  performance.now = () => window.clock + half;
}

/** Plays a visit in the page; returns what is other than expected. */
function play(visit) {
  const {exports: program, handOver, handOverPicture, textAt} = window.seen;
  const handOverText = (text) => {
    const bytes = new TextEncoder().encode(text);
    handOver(bytes, program.textBuffer(bytes.length));
  };
  const pass = (end) => {
    for (let due; !program.areWakesWritten() && (due = program.nextDeadline()) <= end; program.wake()) window.clock = due;
    window.clock = end;
  };
  const top = () => [...document.querySelectorAll('.frame canvas')].at(-1);
  const show = [
    () => {},
    () => handOverText(top()?.parentElement.ariaLabel ?? ''),
    () => handOverPicture(top()),
    () => document.querySelector('.minimised').click(),
  ];
  handOverText(visit);
  program.beginVisit();
  for (let time; (time = program.timeOfStep()) >= 0;) {
    const need = program.needOfStep();
    pass(time);
    show[need]();
    const difference = program.takeStep();
    if (difference !== 0) return textAt(difference);
  }
  return null;
}

/** In one tab, which is loaded anew for each visit. */
async function playAll(browser, scale) {
  const visit = await Visit.open(browser, site.address, {ratio: scale, before: beginAnew, until: 'splash'});
  const differences = [];
  for (const name of readdirSync(folder).filter((name) => name.endsWith('.visit'))) {
    const text = readFileSync(join(folder, name), 'utf8');
    const [, seed] = /^seed (\d+)$/m.exec(text) ?? [null, 1];
    const store = /^store damaged$/m.test(text) ? 'damaged' : 'new';
    await visit.see((start) => void (location.hash = start), `seed=${seed}&store=${store}`);
    await visit.tab.reload();
    await until('last pictures', () => visit.see(() => window.seen.exports?.canVisit()));
    const difference = await visit.see(play, text);
    if (difference !== null) differences.push(`${name}, ${difference}`);
  }
  await visit.close();
  expect(differences.length === 0, `In ${browserName} there is another thing to be seen than expected:\n  ${differences.join('\n  ')}`);
}

export default {
  'every visit at scale 1': (browser) => playAll(browser, 1),
  'every visit at scale 2': (browser) => playAll(browser, 2),
};
