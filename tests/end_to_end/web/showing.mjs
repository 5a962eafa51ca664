// What is seen, and what a pointer, a finger and the keyboard do to it.
import {expect, isFirefox, launch, menu, PNG, serveSite, until, Visit, wait} from './browser.mjs';

const site = await serveSite();
export const leave = () => site.close();

/** How many pixels the screen shows differently from what was painted on the canvas. */
async function differingPixels(visit) {
  const {left, top, width, height, painted} = await visit.see(() => {
    const canvas = window.seen.top();
    const area = canvas.getBoundingClientRect();
    return {left: area.left * devicePixelRatio, top: area.top * devicePixelRatio, width: canvas.width, height: canvas.height,
      painted: canvas.toDataURL().split(',')[1]};
  });
  const screen = PNG.sync.read(Buffer.from(await visit.tab.screenshot()));
  const canvas = PNG.sync.read(Buffer.from(painted, 'base64'));
  if (screen.width < Math.round(left) + width || screen.height < Math.round(top) + height) return width * height;
  let differing = 0;
  for (let y = 0; y < height; ++y) {
    for (let x = 0; x < width; ++x) {
      const [seen, drawn] = [4 * ((Math.round(top) + y) * screen.width + Math.round(left) + x), 4 * (y * width + x)];
      if (screen.data.compare(canvas.data, drawn, drawn + 3, seen, seen + 3) !== 0) ++differing;
    }
  }
  return differing;
}

/** Sharp is what the screen shows pixel for pixel, a moment after a change at the latest. */
async function checkSharpness(visit, where) {
  let differing = await differingPixels(visit);
  for (let tries = 0; differing > 0 && tries < 5; ++tries) {
    await wait(200);
    differing = await differingPixels(visit);
  }
  expect(differing === 0, `${where} ${differing} pixels on the screen are not those of the canvas.`);
}

export default {
  'the screen shows the canvas pixel for pixel, at every device ratio': async (shared) => {
    for (const ratio of [1, 1.1, 1.25, 4 / 3, 1.5, 2, 3]) {
      const browser = isFirefox ? shared : await launch({ratio});
      const visit = await Visit.open(browser, site.address, {ratio, width: 1001, height: 801});
      await checkSharpness(visit, `At ratio ${ratio}`);
      if (!Number.isInteger(4 * ratio)) {
        await visit.resize(777, 745, ratio);
        await checkSharpness(visit, `At ratio ${ratio}, in a smaller page,`);
      }
      await visit.close();
      if (!isFirefox) await browser.close();
    }
  },

  'when the ratio changes the pictures follow': async (browser) => {
    const visit = await Visit.open(browser, site.address, {width: 1400, height: 1300});
    visit.isNoting = true;
    await visit.choose(menu.training);
    for (const [i, ratio] of [2, 1.25, 1].entries()) {
      // Of another ratio alone Chromium says nothing when it only plays another screen.
      await visit.resize(isFirefox ? 1400 : 1401 + i, 1300, ratio);
      const width = 675 * 2 * ratio;
      await until(`canvas of ${width} pixels`, () => visit.see((width) => Math.abs(window.seen.top().width - width) < 1, width));
      await visit.cameTo(`scale ${2 * ratio}`);
    }
    visit.compare();
    await visit.close();
  },

  'a tap is a click, and a phone held upright is played on': async (browser) => {
    const visit = await Visit.open(browser, site.address, {width: 390, height: 664, ratio: 3, touch: true});
    visit.isNoting = true;
    const tap = async (x, y) => {
      await visit.tab.touchscreen.tap(...(await visit.placeOf(x, y)));
      await visit.cameTo(`click ${x} ${y}`);
    };
    expect(await visit.see(() => getComputedStyle(document.getElementById('hint')).display !== 'none'), 'Nobody says that it is best played sideways.');
    await tap(337, 69);
    for (const column of [0, 3, 6]) await tap(246 + 28 * column, 460);
    visit.compare();
    const [width, room] = await visit.see(() => [document.querySelector('.frame').getBoundingClientRect().width, innerWidth]);
    expect(width <= room, 'The window does not fit on the phone.');
    await visit.close();
  },

  'the second click of two quick ones does not reach the screen that the first one brings': async (browser) => {
    const visit = await Visit.open(browser, site.address);
    const [x, y] = await visit.placeOf(337, 121); // Timed Game, and on its screen a block
    await visit.tab.mouse.click(x, y, {count: 2});
    const board = await visit.untilBoard(false);
    await wait(1000);
    expect((await visit.board(false)) === board, 'The second click has been made on the board.');
    await visit.close();
  },

  'Tab goes through the page and does not pause': async (browser) => {
    const visit = await Visit.open(browser, site.address);
    const focus = () => visit.see(() => document.activeElement?.className || document.activeElement?.role);
    expect((await focus()) === 'application', 'The game does not have the keyboard when the page opens.');
    await visit.choose(menu.timed);
    const board = await visit.untilBoard(false);
    await visit.tab.keyboard.down('Shift');
    await visit.tab.keyboard.press('Tab');
    await visit.tab.keyboard.up('Shift');
    expect((await focus()) === 'close', 'Tab does not lead to the close button.');
    await visit.tab.keyboard.press('Tab');
    expect((await focus()) === 'application', 'Tab does not lead back to the game.');
    expect((await visit.board(false)) === board, 'Tab has paused the game.');
    await visit.close();
  },

  'nothing runs while nothing happens': async (browser) => {
    const visit = await Visit.open(browser, site.address);
    await visit.choose(menu.training);
    await visit.atRest();
    const measure = async () => {
      const {ScriptDuration = 0} = isFirefox ? {} : await visit.tab.metrics();
      return [await visit.see(() => window.seen.calls), ScriptDuration];
    };
    const [calls, script] = await measure();
    await wait(10_000);
    const [callsAfter, scriptAfter] = await measure();
    expect(callsAfter === calls, `In ten idle seconds ${callsAfter - calls} alarms or frames were asked for.`);
    expect(scriptAfter - script < 0.01, `In ten idle seconds script ran for ${scriptAfter - script} seconds.`);
    await visit.click(95, 385); // End Game
    await visit.untilWindow('Game Statistics');
    await visit.tab.keyboard.press('Enter');
    await until('menu', async () => (await visit.captions()).length === 1);
    await visit.choose(menu.timed);
    await visit.untilBoard(false);
    const [callsInGame] = await measure();
    await wait(3000);
    const wakes = (await measure())[0] - callsInGame;
    expect(wakes > 0 && wakes < 30, `In three seconds of a Timed game there were ${wakes} alarms.`);
    await visit.close();
  },
};
