// The program: calls into it, what it asks of the page, and the one alarm that wakes it.

import {say} from './spoken.js';

/**
 * @typedef {import('./frames.js').Frames} Frames
 * @typedef {import('./keeping.js').Keeping} Keeping
 * @typedef {import('./parts.js').Files} Files
 * @typedef {Record<string, (...values: any[]) => any> & {memory: WebAssembly.Memory}} Exports
 */

export class Program {
  #exports = /** @type {Exports} */ ({});
  #alarm = 0;
  #isOver = false;
  #hasClosedDialog = false;
  #failure = /** @type {unknown} */ (null); // of something that the program asked for
  #asked = /** @type {Uint8Array} */ (new Uint8Array());
  #record = '';
  /** What was cut or copied last. */
  clipboard = '';

  /**
   * @param {Files} files
   * @param {Keeping} keeping
   * @param {{end: () => void, fail: (reason: unknown, isAllKept: boolean) => void, closed: () => void, open: (document: string) => void}} page
   */
  constructor(files, keeping, page) {
    this.files = files;
    this.keeping = keeping;
    this.page = page;
  }

  /**
   * @param {WebAssembly.Module} module
   * @param {Frames} frames
   * @param {bigint} seed
   */
  async start(module, frames, seed) {
    const instance = await WebAssembly.instantiate(module, this.#imports(frames));
    this.#exports = /** @type {any} */ (instance.exports);
    this.#exports._initialize();
    this.call('start', ...frames.room(), seed);
  }

  /**
   * Calls one of the program's functions and lets it go on. Nothing is returned once it has ended or failed.
   * @param {string} name
   * @param {...any} values
   */
  call(name, ...values) {
    return this.#attempt(() => this.#exports[name](...values));
  }

  /** @param {() => any} act */
  #attempt(act) {
    if (this.#isOver) return undefined;
    try {
      const result = act();
      this.#exports.wake();
      if (this.#failure !== null) throw this.#failure;
      this.#settle();
      return result;
    } catch (error) {
      this.#isOver = true;
      clearTimeout(this.#alarm);
      this.page.fail(error, !this.#hasClosedDialog);
      return undefined;
    }
  }

  /**
   * The same for a function that takes a text.
   * @param {string} text
   * @param {string} name
   * @param {...any} values
   */
  callWithText(text, name, ...values) {
    return this.#attempt(() => {
      const bytes = new TextEncoder().encode(text);
      const place = this.#exports.textBuffer(bytes.length);
      this.bytesAt(place, bytes.length).set(bytes);
      return this.#exports[name](...values);
    });
  }

  /** Saves what should last. */
  keep() {
    this.call('keep');
  }

  /** What was done since the last game began; nothing when there is no program, or one that cannot even tell that. */
  record() {
    this.#record = '';
    try {
      this.#exports.writeRecord();
    } catch (error) {
      console.warn('The record is not whole.', error);
    }
    return this.#record;
  }

  #settle() {
    clearTimeout(this.#alarm);
    if (this.#exports.ended()) {
      this.#isOver = true;
      this.page.end();
      return;
    }
    const deadline = this.#exports.nextDeadline();
    if (deadline < Infinity)
      this.#alarm = setTimeout(() => this.call('wake'), Math.max(0, Math.ceil(deadline - performance.now())));
    if (this.#hasClosedDialog) {
      this.#hasClosedDialog = false;
      this.page.closed();
    }
  }

  /** @param {number} at @param {number} size */
  bytesAt(at, size) {
    return new Uint8Array(this.#exports.memory.buffer, at, size);
  }

  /** @param {number} at @param {number} size */
  #textAt(at, size) {
    return new TextDecoder().decode(this.bytesAt(at, size));
  }

  /** @param {Uint8Array | undefined} bytes */
  #ask(bytes) {
    this.#asked = bytes ?? new Uint8Array();
    return this.#asked.length;
  }

  /**
   * What the program asks of the page, as src/hosts/web/page.hpp has it. Nothing is thrown through the program: what goes
   * wrong is remembered, and the program is given up when it comes back.
   * @param {Frames} frames
   * @returns {WebAssembly.Imports}
   */
  #imports(frames) {
    /** @type {Record<string, (...values: any[]) => any>} */
    const page = {
      now: () => performance.now(),
      createWindow: (window, owner, isBorderless, caption, size) =>
        frames.create(window, owner, isBorderless !== 0, this.#textAt(caption, size)),
      placeWindow: (window, ...places) => frames.place(window, places),
      showPixels: (window, width, height, pixels) =>
        frames.show(window, width, height, this.bytesAt(pixels, width * height * 4)),
      closeWindow: (window) => {
        if (frames.close(window)) this.#hasClosedDialog = true;
      },
      minimiseWindow: (window) => frames.minimise(window),
      setPointer: (window, isHand) => frames.setPointer(window, isHand !== 0),
      setTextField: (window, ...place) => frames.setTextField(window, place),
      nameScreen: (window, name, size) => frames.spoken(window)?.nameScreen(this.#textAt(name, size)),
      clearPlaces: (window) => frames.spoken(window)?.clear(),
      setPlace: (window, place, role, left, top, width, height, words, size) =>
        frames.spoken(window)?.set(place, role, [left, top, width, height], this.#textAt(words, size)),
      setCurrentPlace: (window, place) => frames.spoken(window)?.setCurrent(place),
      setFieldText: (window, label, labelSize, text, size, caret, anchor) =>
        frames.field(window)?.set(this.#textAt(label, labelSize), this.#textAt(text, size), caret, anchor),
      say: (words, size) => say(this.#textAt(words, size)),
      openDocument: (document, size) => this.page.open(this.#textAt(document, size)),
      fileSize: (file, size) => this.#ask(this.files.get(this.#textAt(file, size))),
      storageSize: () => {
        const kept = this.keeping.read();
        return kept === null ? -1 : this.#ask(kept);
      },
      take: (to) => this.bytesAt(to, this.#asked.length).set(this.#asked),
      setClipboard: (text, size) => void (this.clipboard = this.#textAt(text, size)),
      writeStorage: (bytes, size) => this.keeping.write(this.bytesAt(bytes, size).slice()),
      addToRecord: (lines, size) => void (this.#record += this.#textAt(lines, size)),
    };
    for (const [name, act] of Object.entries(page)) {
      page[name] = (...values) => {
        try {
          return act(...values);
        } catch (error) {
          this.#failure ??= error;
          return 0;
        }
      };
    }
    const isNoFile = () => 8; // EBADF
    return {
      page,
      wasi_snapshot_preview1: {fd_write: this.#writeError.bind(this), fd_seek: isNoFile, fd_close: isNoFile},
    };
  }

  /**
   * What a broken assertion says goes to the console, as a program's words go to its standard error.
   * @param {number} _file
   * @param {number} pieces
   * @param {number} count
   * @param {number} written
   */
  #writeError(_file, pieces, count, written) {
    const memory = new DataView(this.#exports.memory.buffer);
    let size = 0;
    for (let i = 0; i < count; ++i) {
      const length = memory.getUint32(pieces + 8 * i + 4, true);
      console.error(this.#textAt(memory.getUint32(pieces + 8 * i, true), length));
      size += length;
    }
    memory.setUint32(written, size, true);
    return 0;
  }
}
