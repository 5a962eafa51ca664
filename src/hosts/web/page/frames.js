// The program's windows: frames on the desk, each with a canvas. Sizes and places are in device pixels.

import {layRecordButton, recordButton} from './record.js';
import {Spoken} from './spoken.js';
import {TextField} from './text_field.js';

/**
 * @typedef {import('./program.js').Program} Program
 * @typedef {{frame: HTMLElement, bar: HTMLElement | null, canvas: HTMLCanvasElement, paint: CanvasRenderingContext2D,
 *   spoken: Spoken, field: TextField | null, owner: number, caption: string, client: number[]}} Shown
 */

export class Frames {
  /** @type {Map<number, Shown>} */
  #windows = new Map();
  #program;
  #desk;

  /**
   * @param {HTMLElement} desk
   * @param {Program} program
   */
  constructor(desk, program) {
    this.#desk = desk;
    this.#program = program;
    addEventListener('resize', () => this.#resize());
    this.#followRatio();
  }

  /** What windows have room in: width, height, and how many device pixels one of the page's has. */
  room() {
    const {width, height} = this.#desk.getBoundingClientRect();
    return [Math.floor(width * devicePixelRatio), Math.floor(height * devicePixelRatio), devicePixelRatio];
  }

  #resize() {
    this.#program.call('resize', ...this.room());
  }

  /** Another screen or another zoom. */
  #followRatio() {
    const change = () => {
      this.#resize();
      this.#followRatio();
    };
    matchMedia(`(resolution: ${devicePixelRatio}dppx)`).addEventListener('change', change, {once: true});
  }

  /**
   * @param {number} window
   * @param {number} owner 0 for a window that is no dialog
   * @param {boolean} isBorderless
   * @param {string} caption
   */
  create(window, owner, isBorderless, caption) {
    const frame = document.createElement('section');
    frame.className = 'frame';
    frame.ariaLabel = caption;
    if (owner !== 0) frame.role = 'dialog';
    const canvas = document.createElement('canvas');
    canvas.ariaHidden = 'true';
    const spoken = new Spoken(window, owner !== 0, (place) => this.#program.call('clickPlace', window, place));
    const paint = /** @type {CanvasRenderingContext2D} */ (canvas.getContext('2d', {alpha: false}));
    const bar = isBorderless ? null : this.#makeBar(window, owner, caption);
    frame.append(...(bar === null ? [] : [bar]), canvas, spoken.element);
    this.#windows.set(window, {frame, bar, canvas, paint, spoken, field: null, owner, caption, client: []});
    this.#listen(window, frame, spoken.element);
    this.#desk.append(frame);
    this.#letOneTakeInput();
  }

  /**
   * @param {number} window
   * @param {number} owner
   * @param {string} caption
   */
  #makeBar(window, owner, caption) {
    const bar = document.createElement('div');
    bar.className = 'bar';
    const title = document.createElement('span');
    title.textContent = caption;
    bar.append(title);
    /** @param {string} name @param {string} sign @param {() => void} act */
    const addButton = (name, sign, act) => {
      const button = document.createElement('button');
      button.className = name.toLowerCase();
      button.ariaLabel = name;
      button.textContent = sign;
      button.addEventListener('click', act);
      bar.append(button);
    };
    if (owner === 0) {
      addButton('Minimise', '\u2013', () => {
        this.minimise(window);
        this.#program.call('setMinimised', window, true);
      });
    }
    addButton('Close', '\u2715', () => this.#program.call('pressCloseButton', window));
    return bar;
  }

  /** While a dialog is open the windows below it, and what else is on the page, take no input. */
  #letOneTakeInput() {
    const shown = [...this.#windows.values()];
    const isModal = shown.some((window) => window.owner !== 0);
    for (const window of shown) window.frame.inert = isModal && window !== shown.at(-1);
    recordButton.inert = isModal;
  }

  /**
   * @param {number} window
   * @param {number[]} places the frame's left, top, width and height, and in it the client area's
   */
  place(window, places) {
    const shown = this.#windows.get(window);
    if (shown === undefined) return;
    shown.client = places.slice(4);
    lay(shown.frame, places);
    lay(shown.canvas, shown.client);
    lay(shown.spoken.element, shown.client);
    if (shown.bar !== null) shown.bar.style.height = css(shown.client[1]);
    this.#sharpen(shown);
    if (shown.bar !== null && shown.owner === 0) layRecordButton(shown.frame);
  }

  /** A picture that is shown one to one has sharp pixels; the others are only there until one that fits has come.
   * @param {Shown} shown
   */
  #sharpen({canvas, client}) {
    canvas.style.imageRendering = canvas.width === client[2] && canvas.height === client[3] ? 'pixelated' : 'auto';
  }

  /**
   * @param {number} window
   * @param {number} width
   * @param {number} height
   * @param {Uint8Array} pixels
   */
  show(window, width, height, pixels) {
    const shown = this.#windows.get(window);
    if (shown === undefined) return;
    const {canvas, paint, frame} = shown;
    if (canvas.width !== width || canvas.height !== height) {
      canvas.width = width;
      canvas.height = height;
      this.#sharpen(shown);
    }
    const bytes = new Uint8ClampedArray(/** @type {ArrayBuffer} */ (pixels.buffer), pixels.byteOffset, pixels.length);
    paint.putImageData(new ImageData(bytes, width), 0, 0);
    if (!frame.classList.contains('seen')) {
      frame.classList.add('seen');
      document.getElementById('splash')?.remove();
      focus(shown);
    }
  }

  /** Returns whether it was a dialog. @param {number} window */
  close(window) {
    const shown = this.#windows.get(window);
    if (shown === undefined) return false;
    this.#windows.delete(window);
    shown.frame.remove();
    this.#letOneTakeInput();
    const owner = this.#windows.get(shown.owner);
    if (owner !== undefined) focus(owner);
    return shown.owner !== 0;
  }

  /** @param {number} window */
  minimise(window) {
    const shown = this.#windows.get(window);
    if (shown === undefined || shown.frame.hidden) return;
    shown.frame.hidden = true;
    const button = document.createElement('button');
    button.className = 'minimised';
    button.textContent = `Show ${shown.caption}`;
    button.addEventListener('click', () => {
      button.remove();
      shown.frame.hidden = false;
      layRecordButton(shown.frame);
      focus(shown);
      this.#program.call('setMinimised', window, false);
    });
    this.#desk.append(button);
    button.focus();
  }

  /** @param {number} window @param {boolean} isHand */
  setPointer(window, isHand) {
    const shown = this.#windows.get(window);
    if (shown !== undefined) shown.spoken.element.style.cursor = isHand ? 'pointer' : 'default';
  }

  // --- Input ---

  /**
   * A touch is a click when it ends, for it may become a pinch; it has no hover, so the pointer moves there first.
   * @param {number} window
   * @param {HTMLElement} frame
   * @param {HTMLElement} surface where the pointer is felt
   */
  #listen(window, frame, surface) {
    /** @param {PointerEvent} event */
    const placeOf = (event) => {
      const area = surface.getBoundingClientRect();
      const client = this.#windows.get(window)?.client ?? [0, 0, 0, 0];
      return [
        Math.floor(((event.clientX - area.left) * client[2]) / area.width),
        Math.floor(((event.clientY - area.top) * client[3]) / area.height),
      ];
    };
    /** @param {PointerEvent} event */
    const press = (event) => {
      this.#program.call('moveMouse', window, ...placeOf(event));
      this.#program.call('pressMouse', window, ...placeOf(event), event.shiftKey);
    };
    surface.addEventListener('pointerdown', (event) => {
      if (event.pointerType === 'touch' || event.button > 2) return;
      surface.setPointerCapture(event.pointerId);
      press(event);
    });
    surface.addEventListener('pointermove', (event) => {
      if (event.pointerType !== 'touch') this.#program.call('moveMouse', window, ...placeOf(event));
    });
    surface.addEventListener('pointerup', (event) => {
      if (event.pointerType === 'touch') press(event);
      this.#program.call('releaseMouse', window, ...placeOf(event));
    });
    surface.addEventListener('mousedown', (event) => {
      event.preventDefault(); // the keyboard stays where it is, or goes to the text field
      const shown = this.#windows.get(window);
      if (shown !== undefined) focus(shown);
    });
    surface.addEventListener('contextmenu', (event) => event.preventDefault());
    frame.addEventListener('keydown', (event) => this.#pressKey(window, event));
  }

  /** @param {number} window @param {KeyboardEvent} event */
  #pressKey(window, event) {
    if (event.isComposing || event.target instanceof HTMLButtonElement) return;
    const {key, shiftKey, ctrlKey, metaKey, altKey, repeat} = event;
    const altGraph = event.getModifierState('AltGraph');
    const isTaken = this.#program.callWithText(
      key, 'pressKey', window, shiftKey, ctrlKey || metaKey, altKey, altGraph, repeat);
    const isTyped = event.target instanceof HTMLInputElement && [...key].length === 1 && !ctrlKey && !metaKey;
    const isForBrowser = isTaken === 0; // no key is, once the program has failed
    if (!isForBrowser && !isTyped) event.preventDefault();
  }

  // --- Text ---

  /**
   * While the window takes text, a field that is not seen lies over the place where it is typed.
   * @param {number} window
   * @param {number[]} place left, top, width and height; without a width there is none
   */
  setTextField(window, [left, top, width, height]) {
    const shown = this.#windows.get(window);
    if (shown === undefined) return;
    if (width === 0) {
      const hadFocus = shown.field?.element === document.activeElement;
      shown.field?.element.remove();
      shown.field = null;
      if (hadFocus) focus(shown);
      return;
    }
    if (shown.field === null) {
      shown.field = new TextField(window, this.#program);
      shown.frame.append(shown.field.element);
      if (shown.frame.classList.contains('seen')) focus(shown);
    }
    lay(shown.field.element, [shown.client[0] + left, shown.client[1] + top, width, height]);
  }

  // --- What is read ---

  /** @param {number} window */
  spoken(window) {
    return this.#windows.get(window)?.spoken;
  }

  /** @param {number} window */
  field(window) {
    return this.#windows.get(window)?.field;
  }
}

/** The keyboard goes to what takes it in a window. @param {Shown} shown */
function focus({field, spoken}) {
  (field?.element ?? spoken.keyboard).focus();
}

/** @param {number} devicePixels */
function css(devicePixels) {
  return `${devicePixels / devicePixelRatio}px`;
}

/** @param {HTMLElement} element @param {number[]} place */
function lay(element, [left, top, width, height]) {
  Object.assign(element.style, {left: css(left), top: css(top), width: css(width), height: css(height)});
}
