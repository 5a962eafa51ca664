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
    field.addEventListener('compositionstart', () => {
      field.value = '';
      field.classList.add('composing');
    });
    field.addEventListener('compositionend', (event) => {
      field.classList.remove('composing');
      this.#show();
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
    if (event.inputType === 'deleteContentBackward')
      this.#program.callWithText('Backspace', 'pressKey', this.#window, false, false, false, false, false);
    else if (event.inputType !== 'insertLineBreak') this.#type(event.data);
  }

  /** @param {string | null} text */
  #type(text) {
    const whole = this.#half + (text ?? '');
    this.#half = /^[\uD800-\uDBFF]$/.test(whole) ? whole : '';
    if (whole !== this.#half) this.#program.callWithText(whole, 'typeText', this.#window);
  }
}
