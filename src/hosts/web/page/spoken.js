// What is read of a window by those who do not see its picture. It lies over the picture, each place where it is seen, so
// that a finger finds it too, and is not seen itself.

const keysHint = 'Arrow keys move, Control and Enter click, F2 says how it stands';

/** The program's roles of places, in its order. */
const roles = ['text', 'row', 'button', 'link', 'gridcell', 'field'];
const cellsInRow = 12;
const sentencesKept = 4;

export class Spoken {
  /** @type {HTMLElement[]} */
  #places = [];
  #window;
  #isDialog;
  #grid = /** @type {HTMLElement | null} */ (null);
  #cells = 0;
  /** Everything; a region of the page, or what a dialog has inside. */
  element;
  /** What has the keyboard. Its current place is what is read. */
  keyboard = document.createElement('div');

  /**
   * @param {number} window
   * @param {boolean} isDialog
   * @param {(place: number) => void} choose what a click by other means than the pointer does
   */
  constructor(window, isDialog, choose) {
    this.#window = window;
    this.#isDialog = isDialog;
    this.element = document.createElement(isDialog ? 'div' : 'section');
    this.element.className = 'spoken';
    this.keyboard.role = 'application';
    this.keyboard.tabIndex = 0;
    this.keyboard.ariaLabel = 'Quabble';
    if (!isDialog) this.keyboard.setAttribute('aria-description', keysHint);
    this.element.append(this.keyboard);
    this.element.addEventListener('click', (event) => {
      const target = /** @type {HTMLElement} */ (event.target);
      const place = this.#places.indexOf(target);
      const isByPointer = /** @type {MouseEvent} */ (event).detail > 0; // which the frame has listened to
      if (place >= 0 && target.role !== null && !isByPointer) choose(place);
    });
  }

  /** @param {string} name */
  nameScreen(name) {
    if (!this.#isDialog) this.element.ariaLabel = name; // a dialog has its name from its frame
  }

  clear() {
    this.#places = [];
    this.#grid = null;
    this.#cells = 0;
    this.keyboard.replaceChildren();
    while (this.element.firstChild !== this.keyboard) this.element.firstChild?.remove();
  }

  /**
   * @param {number} place
   * @param {number} role
   * @param {number[]} area left, top, width and height, in percent
   * @param {string} words
   */
  set(place, role, area, words) {
    const element = (this.#places[place] ??= this.#make(place, roles[role], area));
    if (element.role === null) element.textContent = words;
    else element.ariaLabel = words;
  }

  /** @param {number} place @param {string} role @param {number[]} area */
  #make(place, role, [left, top, width, height]) {
    const isText = role === 'text' || role === 'row';
    const element = document.createElement(isText ? 'p' : 'div');
    element.id = `place-${this.#window}-${place}`;
    Object.assign(element.style, {left: `${left}%`, top: `${top}%`, width: `${width}%`, height: `${height}%`});
    if (role === 'field') return element; // the page has a real one
    if (!isText) element.role = role;
    if (isText) this.keyboard.before(element);
    else if (role === 'gridcell') this.#rowForNext().append(element);
    else this.keyboard.append(element);
    return element;
  }

  #rowForNext() {
    if (this.#grid === null) {
      this.#grid = document.createElement('div');
      this.#grid.role = 'grid';
      this.#grid.ariaLabel = 'Board';
      this.keyboard.append(this.#grid);
    }
    if (this.#cells++ % cellsInRow === 0) {
      const row = document.createElement('div');
      row.role = 'row';
      this.#grid.append(row);
    }
    return /** @type {HTMLElement} */ (this.#grid.lastElementChild);
  }

  /** @param {number} place -1 for none */
  setCurrent(place) {
    const element = this.#places[place];
    if (element?.isConnected) this.keyboard.setAttribute('aria-activedescendant', element.id);
    else this.keyboard.removeAttribute('aria-activedescendant');
  }
}

/** Says it politely: after what is being said, for which the sentences before stay a while. @param {string} words */
export function say(words) {
  const said = /** @type {HTMLElement} */ (document.getElementById('said'));
  const sentence = document.createElement('p');
  sentence.textContent = words;
  said.append(sentence);
  if (said.childElementCount > sentencesKept) said.firstElementChild?.remove();
}
