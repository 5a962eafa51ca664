// What lasts from one visit to the next, and what happens when it cannot.
import {expect, launch, menu, serveSite, until, Visit, wait} from './browser.mjs';

const site = await serveSite();
export const leave = () => site.close();

/** Plays a little, and has reached the table by entering a name. */
async function enterName(visit, name) {
  await visit.untilName();
  await visit.type(name);
  await visit.press('Enter');
  await visit.untilWindow('Best Scores - Quabble');
  await visit.press('Enter');
  await until('menu', async () => (await visit.captions()).length === 1);
}

/** The message that what is kept cannot be opened comes before everything else, once. */
async function readMessage(visit) {
  await visit.untilWindow('Quabble');
  await visit.tab.keyboard.press('Enter');
  await visit.untilMenu();
}

async function exit(visit) {
  await visit.choose(menu.exit);
  return visit.ending();
}

export default {
  'a storage that is blocked is told of once, and play goes on': async () => {
    const browser = await launch({cookies: false});
    try {
      const visit = await Visit.open(browser, site.address, {until: 'message'});
      await readMessage(visit);
      await visit.choose(menu.training);
      expect(await visit.move(true), 'There is no move.');
      await visit.whileHidden();
      await visit.whileHidden();
      expect((await visit.notice()) === '', `A second message: ${await visit.notice()}`);
      await visit.close({expected: /Service ?Worker|JSHandle@error/}); // which cannot be kept either
    } finally {
      await browser.close();
    }
  },

  'a storage that is full is told of once, and play goes on': async (browser) => {
    const visit = await Visit.open(browser, site.address);
    await visit.see(() => {
      for (let size = 1 << 23; size >= 1; size >>= 1) {
        try {
          localStorage.setItem(`filler ${size}`, 'x'.repeat(size));
        } catch { /* tried with less */ }
      }
    });
    await enterName(visit, 'Anna');
    await visit.whileHidden();
    expect(/cannot be kept/.test(await visit.notice()), 'Nobody says that the storage is full.');
    expect((await visit.kept()) === null, 'Something was written where there is no room.');
    await visit.choose(menu.training);
    expect(await visit.move(true), 'There is no move.');
    await visit.close();
  },

  'what is damaged, or from a later version, is told of and stays as it is': async (browser) => {
    const first = await Visit.open(browser, site.address);
    await enterName(first, 'Anna');
    expect(/are kept/.test(await exit(first)), 'At the end nothing was kept.');
    const whole = await first.kept();
    await first.close();
    const cases = {damaged: whole.slice(0, -1) + '\u0007', cut: whole.slice(0, 100), foreign: 'no registry', later: whole.replace('QUABBLE1', 'QUABBLE2')};
    for (const [name, bytes] of Object.entries(cases)) {
      const visit = await Visit.open(browser, site.address, {
        until: 'message', before: `if (location.protocol === 'http:') localStorage.setItem('quabble', ${JSON.stringify(bytes)})`,
      });
      await readMessage(visit);
      if (name === 'later') await enterName(visit, 'Berta');
      await visit.whileHidden();
      expect((await visit.notice()) === '', `A second message: ${await visit.notice()}`);
      await visit.choose(menu.exit); // which tries to save, and says once more that it cannot
      await visit.untilWindow('Quabble');
      await visit.tab.keyboard.press('Enter');
      const sentence = await visit.ending();
      expect((await visit.kept()) === bytes, `What was ${name} has been written over.`);
      expect(!/are kept/.test(sentence), `What was ${name} could not be written over, yet the page says: ${sentence}`);
      await visit.close();
    }
  },

  'of two tabs, the second says so and does not write': async (browser) => {
    const first = await Visit.open(browser, site.address);
    const second = await Visit.open(browser, site.address, {context: first.context});
    await until('message about the other tab', async () => /another tab/.test(await second.notice()));
    await enterName(second, 'Second');
    await first.tab.bringToFront();
    await enterName(first, 'First');
    await first.whileHidden();
    const kept = await first.kept();
    expect(kept.includes('First'), 'The first tab did not keep its scores.');
    await second.tab.bringToFront();
    expect(!/are kept/.test(await exit(second)), 'The second tab says that it has kept something.');
    expect((await first.kept()) === kept, 'The second tab has written over the first.');
    await first.tab.bringToFront();
    expect(/are kept/.test(await exit(first)), 'The first tab could not keep anything any more.');
    await first.close();
  },

  'hiding the page is enough to keep the settings': async (browser) => {
    const visit = await Visit.open(browser, site.address);
    expect((await visit.kept()) === null, 'Something was written before there was anything to keep.');
    await visit.whileHidden();
    expect((await visit.kept()) !== null, 'A hidden page has not kept the settings.');
    await visit.close();
  },
};
