// The offer to save a record of the last game: a quiet button in the foot of the page and, when the program has ended,
// below the sentence that says so.

/** @typedef {import('./program.js').Program} Program */

export const recordButton = /** @type {HTMLElement} */ (document.getElementById('record'));
const foot = /** @type {HTMLElement} */ (document.querySelector('footer'));
let read = () => '';
let address = ''; // of what was saved last
let game = /** @type {Element | null} */ (null);

/** @param {Program} program */
export function offerRecordOf(program) {
  read = () => program.record();
}

function save() {
  URL.revokeObjectURL(address);
  address = URL.createObjectURL(new Blob([read()], {type: 'text/plain'}));
  Object.assign(document.createElement('a'), {href: address, download: 'last_game.visit'}).click();
}

/** Lays it where it covers nothing: below the game, beside it, or nowhere. */
function lay() {
  if (!game?.isConnected) return;
  const {left, bottom} = game.getBoundingClientRect();
  recordButton.hidden = false;
  recordButton.hidden = !['below', 'beside'].some((place) => {
    recordButton.className = place;
    return foot.getBoundingClientRect().top >= bottom || recordButton.getBoundingClientRect().right <= left;
  });
}

/** The game's window has got its place. @param {Element} frame */
export function layRecordButton(frame) {
  game = frame;
  lay();
}

/** The button for the page that says that the program is no more. */
export function recordButtonAtEnd() {
  recordButton.className = '';
  recordButton.inert = false;
  recordButton.hidden = read() === '';
  return recordButton;
}

recordButton.addEventListener('click', save);
recordButton.addEventListener('mousedown', (event) => event.preventDefault()); // the keyboard stays with the game
new ResizeObserver(lay).observe(/** @type {HTMLElement} */ (document.getElementById('notice'))); // which takes room as well
