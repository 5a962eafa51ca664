// The games, from the menu to the table.
import {expect, keys, menu, serveSite, until, Visit, wait} from './browser.mjs';

const site = await serveSite();
export const leave = () => site.close();

export default {
  'a Training game to its end, and its place in the table after a reload': async (browser) => {
    const visit = await Visit.open(browser, site.address);
    visit.isNoting = true;
    await visit.choose(menu.training);
    let moves = 0;
    while (await visit.move(true)) {
      if ((await visit.captions()).length > 1) break;
      ++moves;
    }
    expect(moves > 10, `The game was over after ${moves} moves.`);
    await visit.untilWindow('Game Statistics');
    await visit.press('Enter', keys.enter);
    await visit.untilWindow('Best Score');
    await visit.type('Jürgen ☃');
    await visit.press('Enter', keys.enter);
    await visit.untilWindow('Best Scores - Quabble');
    const table = visit.pictures.at(-1);
    visit.compare();
    await visit.tab.reload();
    await visit.untilMenu();
    await visit.choose(menu.trainingTable);
    await visit.untilWindow('Best Scores - Quabble');
    expect(visit.pictures.at(-1) === table, 'After a reload the table is another one.');
    await visit.close();
  },

  'moves of a Strategy game, at scale 1 and 2': async (browser) => {
    for (const [ratio, width, height] of [[1, 800, 640], [2, 800, 640]]) {
      const visit = await Visit.open(browser, site.address, {ratio, width, height});
      visit.isNoting = true;
      await visit.choose(menu.strategy);
      for (let move = 0; move < 8; ++move) {
        if (ratio === 1) await visit.move(false);
        else await visit.click(246 + 28 * move, 450);
      }
      visit.compare(4 * ratio);
      await visit.close();
    }
  },

  'rows push in from below by themselves in a Timed game': async (browser) => {
    const visit = await Visit.open(browser, site.address);
    await visit.choose(menu.timed);
    const before = await visit.untilBoard(false);
    const after = await until('row from below', async () => {
      const seen = await visit.board(false);
      return !seen.includes('?') && seen !== before && seen;
    }, 60);
    expect(after.startsWith(before.slice(12, 180)), 'A row came in, but the rows above it did not move up by one.');
    await visit.close();
  },

  'a key pauses, and so does hiding the page; a click goes on': async (browser) => {
    const visit = await Visit.open(browser, site.address);
    await visit.choose(menu.timed);
    const board = await visit.untilBoard(false);
    const goOn = async () => {
      await wait(1500);
      expect((await visit.board(false)).includes('?'), 'Nothing hides the board of a paused game.');
      expect((await visit.see(() => window.seen.alarms.size)) === 0, 'The clock goes on in a paused game.');
      await visit.click(400, 300);
      expect((await visit.untilBoard(false)) === board, 'After a pause the board is another one.');
    };
    await visit.tab.keyboard.press('p');
    await (await visit.tab.waitForSelector('.minimised')).click();
    await goOn();
    await visit.whileHidden();
    await goOn();
    await visit.tab.keyboard.press('Shift');
    await visit.tab.keyboard.press('F2');
    expect((await visit.board(false)) === board, 'A key that yields no character has paused the game.');
    await visit.close();
  },
};
