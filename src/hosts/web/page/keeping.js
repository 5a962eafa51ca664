// What is kept between visits: one text in the browser's storage, a character for each byte.

const name = 'quabble';

/**
 * Asks for the right to keep things; only one page at a time has it.
 * @returns {Promise<boolean>}
 */
function isOnlyPage() {
  if (!navigator.locks) return Promise.resolve(true);
  return new Promise((answer) => {
    const held = navigator.locks.request(name, {ifAvailable: true}, (lock) => {
      answer(lock !== null);
      return lock && new Promise(() => {}); // held until the page goes
    });
    held.catch(() => answer(true));
  });
}

/** The storage. Nothing is written before this page has got the right to. */
export class Keeping {
  /** What lies there, as far as we know: nobody else's is written over. */
  #known = /** @type {string | null} */ (null);
  #isOurs = false;
  /** Whether what was last to be kept is; nothing when the program has kept nothing, as it does when it cannot read what
   * lies there, and has told so. */
  isKept = /** @type {boolean | undefined} */ (undefined);

  /** Resolves to whether this page may keep things; if not, another one is open. */
  async open() {
    this.#isOurs = await isOnlyPage();
    return this.#isOurs;
  }

  get isOurs() {
    return this.#isOurs;
  }

  /** @returns {Uint8Array | null} */
  read() {
    try {
      this.#known = localStorage.getItem(name);
      return Uint8Array.from(this.#known ?? '', (character) => character.charCodeAt(0));
    } catch {
      return null;
    }
  }

  /** @param {Uint8Array} bytes */
  write(bytes) {
    this.isKept = this.#write(bytes);
    return this.isKept;
  }

  /** @param {Uint8Array} bytes */
  #write(bytes) {
    try {
      if (!this.#isOurs || localStorage.getItem(name) !== this.#known) return false;
      const text = String.fromCharCode(...bytes);
      localStorage.setItem(name, text);
      this.#known = text;
      return true;
    } catch {
      return false;
    }
  }
}
