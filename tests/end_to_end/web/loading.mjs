// The ways in which a page comes to be, comes to an end, and fails.
import {cpSync, readFileSync, writeFileSync} from 'node:fs';
import {join} from 'node:path';
import {pathToFileURL} from 'node:url';
import {expect, menu, newFolder, pageFolder, serveSite, until, Visit} from './browser.mjs';

const site = await serveSite();
export const leave = () => site.close();

/** The one file, as somebody has saved it. */
function savedFile() {
  const file = join(newFolder(), 'Für Anna (1) #2.html');
  cpSync(join(pageFolder, 'quabble.html'), file);
  return pathToFileURL(file).href;
}

/** The tab that the visit opens by an act. */
async function tabOf(visit, act) {
  const before = new Set(await visit.context.pages());
  await act();
  return until('new tab', async () => (await visit.context.pages()).find((tab) => !before.has(tab)));
}

async function checkHelp(visit) {
  const tab = await tabOf(visit, () => visit.choose(menu.help));
  visit.watchTab(tab);
  await tab.reload(); // what it had to complain of at first nobody has heard
  await until('help page', async () => (await tab.title()) === 'How to play Quabble');
  const {pictures, isAlone, isStyled} = await tab.evaluate(async () => {
    const images = [...document.images];
    await Promise.all(images.map((image) => image.decode()));
    return {
      pictures: images.length, isAlone: window.opener === null,
      isStyled: getComputedStyle(document.querySelector('header')).borderBottomWidth === '4px',
    };
  });
  expect(pictures > 0, 'The help page has no pictures.');
  expect(isAlone, 'The help page can reach the tab of the game.');
  expect(isStyled, 'The help page is without its styles.');
  await tab.close();
}

/** Ways to break the program: its memory is written over, or what it asks of the page goes wrong. */
const breaks = [
  () => void new Uint8Array(window.seen.exports.memory.buffer).fill(255),
  () => void (CanvasRenderingContext2D.prototype.putImageData = () => { throw new Error('no picture'); }),
];

const startAgain = async (visit) => {
  await (await visit.tab.waitForSelector('.ended button')).click();
  await visit.untilMenu();
};

export default {
  'one file from a disk plays, keeps scores and shows help': async (browser) => {
    const visit = await Visit.open(browser, savedFile());
    visit.isNoting = true;
    await visit.untilName();
    await visit.type('Zoë');
    await visit.press('Enter');
    await visit.press('Enter');
    visit.compare();
    visit.isNoting = false;
    await visit.tab.reload();
    await visit.untilMenu();
    await visit.choose(menu.exit);
    expect((await visit.ending()) && (await visit.kept()).includes('Zo\u00eb'), 'What was entered is not kept.');
    await startAgain(visit);
    await checkHelp(visit);
    await visit.close();
  },

  'the site shows help in a tab of its own': async (browser) => {
    const visit = await Visit.open(browser, site.address);
    await checkHelp(visit);
    await visit.close();
  },

  'after one visit it starts without a network, and a new version is there at the next start': async (browser) => {
    const folder = newFolder();
    cpSync(join(pageFolder, 'site'), folder, {recursive: true});
    const ours = await serveSite(folder);
    const visit = await Visit.open(browser, ours.address);
    await visit.see(() => navigator.serviceWorker.ready.then(() => true));
    const change = (name, from, to) => writeFileSync(join(folder, name), readFileSync(join(folder, name), 'utf8').replaceAll(from, to));
    const version = /[0-9a-f]{16}/.exec(readFileSync(join(folder, 'service_worker.js'), 'utf8'))[0];
    change('index.html', '<title>Quabble</title>', '<title>Quabble 2</title>');
    change('service_worker.js', version, '0123456789abcdef');
    await visit.tab.reload();
    await visit.untilMenu();
    expect((await visit.tab.title()) === 'Quabble', 'The new version did not wait for the next start.');
    await until('new version to be fetched', () => visit.see(async () => (await caches.keys()).join() === '0123456789abcdef'));
    await ours.close();
    await visit.tab.reload();
    await visit.untilMenu();
    expect((await visit.tab.title()) === 'Quabble 2', 'The next start has not shown the new version.');
    await checkHelp(visit);
    await visit.choose(menu.training);
    expect(await visit.move(true), 'Without a network nothing can be played.');
    // The service worker asks for a newer one of itself and does not find any.
    await visit.close({expected: /service_?worker|ServiceWorker|JSHandle@error|ERR_/i});
  },

  'a fetch that fails once is tried again, one that fails always is told of': async (browser) => {
    const failing = (times) => `{
      const failed = {};
      const really = window.fetch;
      window.fetch = (name) => {
        failed[name] = (failed[name] ?? 0) + 1;
        if (failed[name] > ${times}) return really(name);
        // the first half of what would come, and then nothing
        if (name === 'pictures.data') return Promise.resolve(new Response(new Blob([new Uint8Array([31, 139, 8, 0, 0])])));
        return Promise.reject(new TypeError('no connection'));
      };
    }`;
    const once = await Visit.open(browser, site.address, {before: failing(1)});
    await once.close({expected: /input is ended/});
    const always = await Visit.open(browser, site.address, {before: failing(9), until: 'end'});
    expect(/went wrong/.test(await always.ending()), 'Nobody says that the game could not be loaded.');
    await always.close({expected: /no connection|input is ended|JSHandle@error/});
  },

  'a browser without WebAssembly gets its sentence': async (browser) => {
    const visit = await Visit.open(browser, site.address, {before: 'delete window.WebAssembly', until: 'end'});
    expect(/too old.*WebAssembly/.test(await visit.ending()), 'Nobody says what the browser lacks.');
    await visit.close({expected: /WebAssembly|JSHandle@error/});
  },

  'when the program breaks the page says so, starts it again and has the scores': async (browser) => {
    const visit = await Visit.open(browser, site.address);
    await visit.untilName();
    await visit.type('Anna');
    await visit.press('Enter');
    await visit.untilWindow('Best Scores - Quabble');
    await visit.press('Enter');
    await until('menu', async () => (await visit.captions()).length === 1);
    for (const [i, breakIt] of breaks.entries()) {
      await visit.see(breakIt);
      await visit.tab.mouse.move(...(await visit.placeOf(337, 70)));
      const sentence = await visit.ending();
      expect(/went wrong/.test(sentence), 'Nobody says that something went wrong.');
      expect(i > 0 || /are kept/.test(sentence), 'Nobody says that the name which was entered is kept.');
      await visit.whileHidden(); // of a program that is no more nothing is kept
      await startAgain(visit);
      expect((await visit.kept()).includes('Anna'), 'The scores are gone.');
    }
    await visit.close({expected: /RuntimeError|memory|unreachable|no picture|JSHandle@(error|object)/});
  },

  'the close button ends it, and it can be started again': async (browser) => {
    const visit = await Visit.open(browser, site.address);
    await (await visit.tab.waitForSelector('.close')).click();
    expect(/has ended.*are kept/.test(await visit.ending()), 'The page does not say that the game has ended.');
    await startAgain(visit);
    await visit.close();
  },
};
