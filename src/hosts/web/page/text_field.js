// The field that lies unseen over the box in which text is typed. What is typed goes to the program, and the field shows
// what the program has made of it to those who go by the field: voices, and keyboards on a screen.

/** @typedef {import('./program.js').Program} Program */

export class TextField {
  element = document.createElement('input');
  #window;
  #program;
  #text = '';
  #selection = [0, 0];
  #half = ''; // of a character that Firefox reports in two halves
  #takenUp = ''; // the word that a composition began with

  /**
   * @param {number} window
   * @param {Program} program
   */
  constructor(window, program) {
    this.#window = window;
    this.#program = program;
    const field = this.element;
    Object.assign(field, {type: 'text', autocomplete: 'off', spellcheck: false, enterKeyHint: 'done'});
    field.setAttribute('autocorrect', 'off');
    field.addEventListener('beforeinput', (event) => this.#input(event));
    field.addEventListener('compositionstart', (event) => {
      this.#takenUp = event.data;
      field.classList.add('composing');
    });
    field.addEventListener('compositionend', (event) => {
      field.classList.remove('composing');
      this.#show();
      this.#remove(this.#takenUp);
      this.#type(event.data);
    });
    for (const act of /** @type {const} */ (['copy', 'cut'])) {
      field.addEventListener(act, (event) => {
        event.preventDefault();
        program.clipboard = '';
        program.call(`${act}Text`, window);
        if (program.clipboard !== '') event.clipboardData?.setData('text/plain', program.clipboard);
      });
    }
  }

  /**
   * What the program has in it, and what it is for.
   * @param {string} label
   * @param {string} text
   * @param {number} caret
   * @param {number} anchor
   */
  set(label, text, caret, anchor) {
    this.element.ariaLabel = label;
    this.#text = text;
    this.#selection = [caret, anchor];
    if (!this.element.classList.contains('composing')) this.#show();
  }

  #show() {
    const [caret, anchor] = this.#selection;
    this.element.value = this.#text;
    this.element.setSelectionRange(Math.min(caret, anchor), Math.max(caret, anchor), caret < anchor ? 'backward' : 'forward');
  }

  /** @param {InputEvent} event */
  #input(event) {
    if (event.isComposing || event.inputType === 'insertCompositionText') return;
    event.preventDefault();
    if (event.inputType === 'deleteContentBackward') this.#press('Backspace');
    else if (!['insertLineBreak', 'insertReplacementText'].includes(event.inputType)) this.#type(event.data);
  }

  /** Takes away a word that the caret is in or behind: keyboards on a screen take such a word up again. @param {string} word */
  #remove(word) {
    const [caret, anchor] = this.#selection;
    const start = this.#text.indexOf(word, Math.max(0, caret - word.length));
    if (word === '' || caret !== anchor || start < 0 || start > caret) return; // what is marked goes by itself
    for (let at = caret; at < start + word.length; ++at) this.#press('ArrowRight');
    for (let at = 0; at < word.length; ++at) this.#press('Backspace');
  }

  /** @param {string} key */
  #press(key) {
    this.#program.callWithText(key, 'pressKey', this.#window, false, false, false, false, false);
  }

  /** @param {string | null} text */
  #type(text) {
    const whole = this.#half + (text ?? '');
    this.#half = /^[\uD800-\uDBFF]$/.test(whole) ? whole : '';
    if (whole !== this.#half) this.#program.callWithText(whole, 'typeText', this.#window);
  }
}
