// The record of the last game, as the page lets it be saved and as it is then played on the machine without a screen.
import {existsSync, readFileSync, rmSync} from 'node:fs';
import {join} from 'node:path';
import {pathToFileURL} from 'node:url';
import {differencesOf, downloads, expect, menu, pageFolder, serveSite, until, Visit} from './browser.mjs';

const site = await serveSite();
export const leave = () => site.close();

const file = join(downloads, 'last_game.visit');
const scoreIn = (record) => Number(/^expect score (\d+)$/m.exec(record)[1]);

/** Takes what the page offers, by the mouse. */
async function save(visit) {
  rmSync(file, {force: true});
  await (await visit.tab.waitForSelector('#record', {visible: true})).click();
  return until('whole record', () => {
    const record = existsSync(file) ? readFileSync(file, 'utf8') : '';
    return record.includes('expect level') && record;
  });
}

/** Plays a record that ends with this picture, if there is one. */
function play(record, picture) {
  const differences = differencesOf(record + (picture ? `expect picture ${picture}\n` : ''));
  expect(differences === '', `The record comes to something else: ${differences}`);
}

async function begin(visit, moves) {
  await visit.choose(menu.strategy);
  for (let move = 0; move < moves; ++move) {
    expect(await visit.move(false), 'There is no move.');
    await visit.atRest();
  }
}

/** What of the page the offer lies on; nothing when it is not offered. */
function covered(visit) {
  return visit.see(() => {
    const areaOf = (element) => element.getBoundingClientRect();
    const own = areaOf(document.getElementById('record'));
    return own.width > 0 && ['.frame', '#hint', '#notice'].filter((name) => {
      const {left, top, right, bottom} = areaOf(document.querySelector(name));
      return left < own.right && own.left < right && top < own.bottom - 0.1 && own.top < bottom;
    }).join();
  });
}

export default {
  'the offer covers nothing, on a desktop or a phone, and where there is no room it is not made': async (browser) => {
    const visit = await Visit.open(browser, site.address);
    for (const [width, height, isOffered, isOfferedBesideNotice] of
      [[800, 640, true, false], [800, 600, false, false], [1000, 593, true, true], [390, 700, true, true], [844, 390, true, true]]) {
      await visit.see(() => void (document.getElementById('notice').textContent = ''));
      await visit.resize(width, height, 1);
      await until(`page of ${width} by ${height}`, () => visit.see((width) => innerWidth === width, width));
      const where = `On a page of ${width} by ${height}`;
      await until(`answer, ${where}`, async () => (await covered(visit)) === (isOffered && ''));
      await visit.see(() => void (document.getElementById('notice').textContent = 'Nothing can be kept.'));
      await until(`answer beside a notice, ${where}`, async () => (await covered(visit)) === (isOfferedBesideNotice && ''));
    }
    await visit.close();
  },

  'a game that was played in the page is played again from its record, to the same picture': async (browser) => {
    for (const address of [site.address, pathToFileURL(join(pageFolder, 'quabble.html')).href]) {
      const visit = await Visit.open(browser, address);
      await begin(visit, 2);
      await visit.tab.mouse.move(...(await visit.placeOf(300, 561))); // on its way
      await visit.atRest();
      const record = await save(visit);
      expect(scoreIn(record) > 0, `After two moves there are ${scoreIn(record)} points in the record.`);
      play(record, await visit.see(() => window.seen.picture()));

      await visit.tab.keyboard.press('q'); // still is the game's, and hides it
      await (await visit.tab.waitForSelector('.minimised')).click();
      await visit.click(400, 300);
      await visit.click(95, 465); // End Game
      await visit.untilWindow('Game Statistics');
      expect(await visit.see(() => document.getElementById('record').inert), 'While a dialog is open the record takes input.');
      for (const caption of ['Game Statistics', 'Best Score', 'Best Scores - Quabble']) {
        await visit.untilWindow(caption);
        await visit.press('Enter');
      }
      await until('menu', async () => (await visit.captions()).length === 1);
      await visit.choose(menu.exit);
      expect(/has ended/.test(await visit.ending()), 'The page does not say that the game has ended.');
      const whole = await save(visit);
      expect(scoreIn(whole) === scoreIn(record), `Of the last game, with ${scoreIn(record)} points, there are ${scoreIn(whole)} after its end.`);
      play(whole);
      await visit.close();
    }
  },

  'a program that has failed still tells what led to it': async (browser) => {
    const visit = await Visit.open(browser, site.address);
    await begin(visit, 1);
    await visit.see(() => void (TextEncoder.prototype.encode = () => ({length: -1}))); // no memory is as large
    await visit.tab.keyboard.press('Enter'); // which is not for the button that is there then
    expect(/went wrong/.test(await visit.ending()), 'Nobody says that something went wrong.');
    const record = await save(visit);
    expect(scoreIn(record) > 0, 'What was played is not in the record.');
    play(record);
    await visit.close({expected: /^$|length_error|RuntimeError|unreachable|JSHandle@(error|object)/});
  },
};
