// The box for a name, by all the ways in which text comes to it. What it shows is compared with the same text typed.
import {expect, isFirefox, serveSite, Visit} from './browser.mjs';

const site = await serveSite();
export const leave = () => site.close();

const backspace = 'key backspace';

/** A key pressed with Ctrl. Chromium that is driven leaves it to the driver what an editing key does. */
async function command(visit, key, name) {
  await visit.tab.keyboard.down('Control');
  await visit.tab.keyboard.press(key, isFirefox || !name ? {} : {commands: [name]});
  await visit.tab.keyboard.up('Control');
}

async function openBox(browser) {
  const visit = await Visit.open(browser, site.address);
  visit.isNoting = true;
  await visit.untilName();
  return visit;
}

export default {
  'keys edit, and cut, copied and pasted text is in the box': async (browser) => {
    const visit = await openBox(browser);
    await visit.type('Anna');
    await visit.tab.keyboard.press('ArrowLeft');
    await visit.tab.keyboard.press('Backspace');
    await visit.tab.keyboard.press('End');
    await visit.cameTo(backspace, backspace, 'type a');
    await command(visit, 'a');
    await command(visit, 'x', 'Cut');
    await visit.cameTo(backspace, backspace, backspace);
    await command(visit, 'v', 'Paste');
    await visit.cameTo('type Ana');
    await command(visit, 'a');
    await command(visit, 'c', 'Copy');
    await visit.tab.keyboard.press('End');
    await command(visit, 'v', 'Paste');
    await visit.cameTo('type Ana');
    visit.compare();
    await visit.close();
  },

  'what the code page lacks is a question mark at once': async (browser) => {
    const visit = await openBox(browser);
    await visit.type('Łé€😀ß');
    visit.compare();
    visit.acts[visit.acts.length - 1] = 'type ?é€?ß';
    visit.compare();
    await visit.close();
  },

  'a composed character comes when it is whole, text from a keyboard on the screen at once': async (browser) => {
    if (isFirefox) return; // which cannot be told to compose
    const visit = await openBox(browser);
    const session = await visit.tab.createCDPSession();
    const compose = (text) => session.send('Input.imeSetComposition', {text, selectionStart: text.length, selectionEnd: text.length});
    await visit.type('J');
    await compose('¨');
    await visit.cameTo('');
    await compose('ü');
    await session.send('Input.insertText', {text: 'ü'});
    await visit.cameTo('type ü');
    await compose('n');
    await compose('ni');
    await session.send('Input.insertText', {text: '你'});
    await visit.cameTo('type ?');
    await compose('x');
    await compose('');
    await visit.cameTo('');
    await session.send('Input.insertText', {text: 'rgen'});
    await visit.cameTo('type rgen');
    await visit.tab.keyboard.press('Backspace');
    await visit.cameTo(backspace);
    // A keyboard on a screen takes up the letters before the caret again.
    await session.send('Input.imeSetComposition', {text: 'r', selectionStart: 1, selectionEnd: 1, replacementStart: 3, replacementEnd: 6});
    await session.send('Input.insertText', {text: 'rs'});
    await visit.cameTo(backspace, backspace, backspace, 'type rs');
    visit.compare();
    await visit.close();
  },

  'a pointer puts the caret and marks, and the field takes the keyboard back': async (browser) => {
    const visit = await openBox(browser);
    await visit.type('Anna');
    await visit.click(36, 122); // before the first letter
    await visit.type('H');
    await visit.press('Enter');
    visit.compare();
    await visit.close();
  },

  'nothing but the dialog takes input while it is open': async (browser) => {
    const visit = await openBox(browser);
    const focus = () => visit.see(() => document.activeElement?.tagName);
    expect((await focus()) === 'INPUT', 'The box does not have the keyboard.');
    expect(await visit.see(() => document.querySelector('.frame').inert), 'The main window takes input.');
    const close = await visit.tab.$('.close'); // that of the main window
    await close.evaluate((button) => button.click());
    await visit.type('Anna');
    await visit.press('Enter');
    await visit.untilWindow('Best Scores - Quabble');
    visit.compare();
    await visit.close();
  },
};
