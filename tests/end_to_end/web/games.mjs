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
};
