// What is read and said of the page to those who do not see it, and what it looks like to those who need it otherwise.
import {axe, expect, isFirefox, menu, serveSite, until, Visit, wait} from './browser.mjs';

const site = await serveSite();
export const leave = () => site.close();

/** Somebody who has a keyboard, and a voice that reads what the browser tells it: the tree of what is accessible. */
class Listener {
  static async at(visit) {
    const listener = new Listener();
    listener.visit = visit;
    if (!isFirefox) listener.session = await visit.tab.createCDPSession();
    // Everything that is said, as a voice would hear of it.
    await visit.see(() => {
      window.heard = [];
      const said = document.querySelector('[aria-live=polite]');
      const hear = (changes) => changes.forEach(({addedNodes}) => addedNodes.forEach((words) => window.heard.push(words.textContent)));
      new MutationObserver(hear).observe(said, {childList: true});
    });
    return listener;
  }
  /** What has been said since it was last asked for. */
  async heard() {
    return (await this.visit.see(() => window.heard.splice(0))).join(' | ');
  }

  async look() {
    const {nodes} = await this.session.send('Accessibility.getFullAXTree');
    this.nodes = nodes.filter((node) => !node.ignored);
  }
  named(role) {
    return this.nodes.filter((node) => node.role.value === role).map((node) => node.name.value);
  }
  /** What the keyboard is at: the current place of what has the focus, or that itself. */
  get current() {
    const property = (node, name) => node.properties?.find((property) => property.name === name)?.value;
    const focused = this.nodes.findLast((node) => property(node, 'focused')?.value);
    const place = property(focused, 'activedescendant')?.relatedNodes[0].backendDOMNodeId;
    return ((place && this.nodes.find((node) => node.backendDOMNodeId === place)) ?? focused).name.value;
  }
  async press(key, times = 1) {
    for (let i = 0; i < times; ++i) await this.visit.tab.keyboard.press(key);
    await this.look();
  }
  async click() {
    await this.visit.tab.keyboard.down('Control');
    await this.press('Enter');
    await this.visit.tab.keyboard.up('Control');
  }
  async comeTo(name, key = 'ArrowDown') {
    for (let steps = 0; this.current !== name; ++steps) {
      expect(steps < 20, `"${name}" is not found; the last thing heard of is "${this.current}".`);
      await this.press(key);
    }
  }

  /** The largest cluster that is told of: one of its cells. */
  largestCluster() {
    const cells = this.named('gridcell').map((words) => /column (\d+), row (\d+): .*, cluster of (\d+)/.exec(words)?.slice(1).map(Number));
    return cells.filter(Boolean).sort((one, other) => other[2] - one[2])[0];
  }
  async goTo(column, row) {
    await this.press('ArrowUp', this.isOnBoard ? 0 : 1);
    const [atColumn, atRow] = /column (\d+), row (\d+)/.exec(this.current)?.slice(1).map(Number) ?? [];
    await this.press(row < atRow ? 'ArrowUp' : 'ArrowDown', Math.abs(row - atRow));
    await this.press(column < atColumn ? 'ArrowLeft' : 'ArrowRight', Math.abs(column - atColumn));
    expect(this.current.startsWith(`column ${column}, row ${row}:`), `At column ${column}, row ${row} is heard "${this.current}".`);
  }
  get isOnBoard() {
    return this.current.startsWith('column ');
  }
}

/** What can be made out by a program that looks for faults. */
async function faults(visit) {
  await visit.see(axe);
  const found = await visit.see(() => window.axe.run(document, {resultTypes: ['violations']}));
  return found.violations.map(({id, nodes}) => `${id}: ${nodes.map((node) => node.html.slice(0, 80)).join(' ')}`).join('; ');
}

export default {
  'a Training game is played to its end, and entered in the table, by what is read of it': async (browser) => {
    if (isFirefox) return; // which shows its tree to nobody
    const visit = await Visit.open(browser, site.address);
    const player = await Listener.at(visit);
    await player.press('ArrowDown');
    await player.comeTo('Training Game');
    await player.click();
    await until('game', async () => (await player.look(), player.named('gridcell').length === 192));
    expect(player.named('region').includes('Training game'), `The screen is named ${player.named('region')}.`);
    expect((await player.heard()) === 'Training game', 'It is not said that the game begins.');

    let score = 0;
    for (let moves = 1; player.named('dialog').length === 0; ++moves) {
      const [column, row, size] = player.largestCluster();
      expect(size > 1 && moves < 100, 'The game goes on where there is no move.');
      await player.goTo(column, row);
      expect((await player.heard()) === '', 'Something is said while the pointer only moves.');
      await player.click();
      score += (size * (size + 1)) / 2;
      await visit.atRest();
      await player.look();
      const heard = await player.heard();
      expect(heard.startsWith(`${(size * (size + 1)) / 2} points`), `After a cluster of ${size} is heard "${heard}".`);
      if (player.named('dialog').length === 0) {
        expect(player.named('StaticText').includes(`Score ${score}`), `A score of ${score} is not to be read.`);
        expect(!heard.includes('|'), `A move is told in pieces: "${heard}".`);
      } else {
        expect(heard.endsWith(` | Game Over. score : ${score}. Number of Blocks Cleared ${heard.match(/Cleared (\d+)/)?.[1]}. ` +
          `Largest Cluster ${heard.match(/Largest Cluster (\d+)/)?.[1]}`), `At the end is heard "${heard}".`);
      }
    }
    expect(player.named('dialog').join() === 'Game Statistics', `The dialog is named ${player.named('dialog')}.`);

    await player.press('ArrowDown');
    expect(player.current === 'OK', `In the dialog the keyboard comes to "${player.current}".`);
    await player.click();
    await until('box for a name', async () => (await player.look(), player.named('dialog').join() === 'Best Score'));
    expect((await player.heard()) === 'Place 1 in the table. Congratulations !. Your Score is among High scores', 'The place in the table is not said.');
    expect(player.current === 'Enter Your Name', `The keyboard is at "${player.current}".`);
    await visit.type('Jörg');
    await player.look();
    const field = player.nodes.find((node) => node.role.value === 'textbox');
    expect(field.value?.value === 'Jörg', `The box is read as "${field.value?.value}".`);
    await player.press('Enter');
    await until('table', async () => (await player.look(), player.named('dialog').join() === 'Best Scores - Quabble'));
    expect(player.named('StaticText').includes(`1. Jörg, ${score}`), 'The table does not have the name.');
    expect((await player.heard()) === 'Training Game', 'More is said than whose table it is.');
    await player.press('Enter');
    await until('menu', async () => (await player.look(), player.named('region').includes('Main menu')));
    expect(player.named('dialog').length === 0, 'A dialog is still there.');
    expect((await player.heard()) === '', 'The menu is told of twice.');
    await visit.close();
  },

  'a Timed game says its rows and its pause, answers who asks, and is played by what has neither keys nor pointer': async (browser) => {
    const visit = await Visit.open(browser, site.address);
    const player = await Listener.at(visit);
    const choose = (words) => visit.see((words) => {
      const place = [...document.querySelectorAll('.spoken [role]')].find((place) => place.ariaLabel === words);
      place.click(); // what a voice that is told to press it does
    }, words);
    await choose('Timed Game');
    await visit.untilBoard(false);
    expect((await player.heard()) === 'Timed game. Level 1', 'It is not said which level begins.');
    await wait(500);
    expect((await player.heard()) === '', 'Something is said while nothing happens.');
    await choose('Bring the waiting row');
    expect((await player.heard()) === 'Row 1 of 48', 'It is not said that a row has come.');
    await visit.tab.keyboard.press('F2');
    const status = await player.heard();
    expect(/^Timed game\. Score 0\. Best score 0\. Level 1\. Row 1 of 48\. Waiting row, \d+ of 12 uncovered: (\w[a-z ]+(, |$)){12}$/.test(status), `Asked how it stands it says "${status}".`);
    await choose('Pause');
    expect((await player.heard()) === 'Game paused', 'The pause is not said.');
    expect(await visit.see(() => document.querySelectorAll('[role=gridcell]').length === 0), 'The board can be read while it is hidden.');
    await choose('Game Paused Click here to continue');
    expect((await player.heard()) === 'Timed game', 'The end of the pause is not said.');
    await visit.close();
  },

  'a bomb, a row that follows a move and a table that is cleared are told of': async (browser) => {
    const visit = await Visit.open(browser, site.address);
    const player = await Listener.at(visit);
    const choose = (pattern) => visit.see((pattern) => {
      const place = [...document.querySelectorAll('.spoken [role]')].find((place) => new RegExp(pattern).test(place.ariaLabel));
      place?.click();
      return place !== undefined;
    }, pattern);
    await choose('Strategy Game');
    for (let rows = 0; !(await choose(': bomb')); ++rows) {
      expect(rows < 11, 'There is no bomb.');
      await choose('Bring the waiting row');
    }
    await visit.atRest();
    const heard = await player.heard();
    expect(/\| Every (coral disc|mint diamond|amber star) explodes(\.| \|)/.test(heard), `Of a bomb is heard "${heard}".`);
    expect(/\| Row \d+ of 48$/.test(heard), `Of the row after it is heard "${heard}".`);
    await choose('End game');
    await visit.untilWindow('Game Statistics');
    await visit.tab.keyboard.press('Enter');
    await until('menu', async () => (await visit.captions()).length === 1);
    await choose('High scores - Timed');
    await visit.untilWindow('Best Scores - Quabble');
    await player.heard();
    await choose('Clear Scores');
    expect((await player.heard()) === 'Scores cleared', 'A table is cleared without a word.');
    await visit.close();
  },

  'no fault is found on any screen, and nothing moves by itself': async (browser) => {
    const visit = await Visit.open(browser, site.address);
    const check = async (where) => {
      const found = await faults(visit);
      expect(found === '', `${where}: ${found}`);
      expect(await visit.see(() => document.getAnimations().length === 0), `${where}: something of the page's own moves.`);
    };
    await check('In the menu');
    await visit.choose(menu.timed);
    await visit.untilBoard(false);
    await check('In a Timed game');
    await visit.tab.keyboard.press('p');
    await check('While it is minimised');
    await visit.see(() => document.querySelector('.minimised').click());
    await check('While it is paused');
    await visit.click(300, 300);
    await visit.move(false);
    await wait(500);
    await visit.click(95, 465); // End Game
    await visit.untilWindow('Game Statistics');
    await check('At the result');
    await visit.tab.keyboard.press('Enter');
    await visit.untilWindow('Best Score');
    await check('At the box for a name');
    await visit.tab.keyboard.press('Enter');
    await visit.untilWindow('Best Scores - Quabble');
    await check('At the table');
    await visit.tab.keyboard.press('Enter');
    await until('menu', async () => (await visit.captions()).length === 1);
    await visit.choose(menu.exit);
    await visit.ending();
    await check('At the end');
    await visit.close();
  },

  'with forced colours the frames stand out, and the game keeps its own': async (browser) => {
    if (isFirefox) return; // which cannot be told to force them
    const visit = await Visit.open(browser, site.address);
    const picture = await visit.see(() => window.seen.picture());
    await (await visit.tab.createCDPSession()).send('Emulation.setEmulatedMedia', {features: [{name: 'forced-colors', value: 'active'}]});
    const {edge, ground} = await visit.see(() => {
      const frame = getComputedStyle(document.querySelector('.frame'));
      return {edge: [frame.outlineStyle, frame.outlineColor].join(' '), ground: getComputedStyle(document.body).backgroundColor};
    });
    expect(edge.startsWith('solid') && !edge.endsWith(ground), `On ${ground} the frame's edge is ${edge}.`);
    expect((await visit.see(() => window.seen.picture())) === picture, 'The picture has other colours.');
    await visit.close();
  },
};
