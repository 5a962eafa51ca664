// The games, from the menu to the table.
import {expect, menu, serveSite, until, Visit, wait} from './browser.mjs';

const site = await serveSite();
export const leave = () => site.close();

/** Once by the panel's button, and once by any key. */
async function pauseByKeys(visit) {
  await visit.walkTo(95);
  const board = await visit.untilBoard(false);
  const goOn = async () => {
    await until('pause', async () => (await visit.board(false)).includes('?'));
    await visit.clickByKey();
    await visit.walkTo(95);
    expect((await visit.untilBoard(false)) === board, 'After a pause the board is another one.');
  };
  await visit.click(95, 385);
  await goOn();
  await visit.tab.keyboard.press('p');
  await visit.tab.keyboard.press('Enter'); // on the button that shows the game again
  await goOn();
}

export default {
  'a place in the table is there after a reload': async (browser) => {
    const visit = await Visit.open(browser, site.address);
    visit.isNoting = true;
    await visit.untilName();
    await visit.type('Jürgen ☃');
    await visit.press('Enter');
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

  'a game of each mode to its end, its name and its table by keys alone': async (browser) => {
    const visit = await Visit.open(browser, site.address);
    visit.hasNoMouse = true;
    const hasDialog = async () => (await visit.captions()).length > 1;
    for (const mode of ['training', 'strategy', 'timed']) {
      const isTraining = mode === 'training';
      await visit.choose(menu[mode]);
      for (let move = 0; (isTraining || move < 3) && (await visit.move(isTraining)); ++move) {
        await (mode === 'timed' ? wait(500) : visit.atRest());
        if (await hasDialog()) break;
      }
      if (mode === 'strategy') await pauseByKeys(visit);
      if (!isTraining) await visit.walkTo(400, 518); // the next row, until there is no room for one
      for (let row = 0; !isTraining && row < 40 && !(await hasDialog()); ++row) await visit.clickByKey();
      await visit.untilWindow('Game Statistics');
      await visit.click(230, 215);
      await visit.untilWindow('Best Score');
      await visit.tab.keyboard.type(`Joan of ${mode}`);
      await visit.click(180, 170);
      await visit.untilWindow('Best Scores - Quabble');
      await visit.click(150, 420);
      await until('menu', async () => !(await hasDialog()));
      expect((await visit.kept()).includes(`Joan of ${mode}`), `The ${mode} table has no entry.`);
    }
    await visit.choose(menu.exit);
    await visit.ending();
    await visit.close();
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
