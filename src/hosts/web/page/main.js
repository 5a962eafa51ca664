// Starts the game in the page, or shows its help page where everything is one file.

import {Frames} from './frames.js';
import {showHelp} from './help.js';
import {Keeping} from './keeping.js';
import {backdrop, filesOf, isOneFile, program as loadProgram} from './parts.js';
import {Program} from './program.js';
import {offerRecordOf, recordButtonAtEnd} from './record.js';

const helpPage = 'QB_HELP.HTM';
const desk = /** @type {HTMLElement} */ (document.getElementById('desk'));
const notice = /** @type {HTMLElement} */ (document.getElementById('notice'));

/**
 * Nothing is left of the program but a sentence, and a way to start it again.
 * @param {string} sentence
 */
function showEnd(sentence) {
  const end = document.createElement('div');
  end.className = 'ended';
  end.role = 'alert';
  const text = document.createElement('p');
  text.textContent = sentence;
  const button = document.createElement('button');
  button.textContent = 'Start again';
  button.addEventListener('click', () => location.reload());
  end.append(text, button, recordButtonAtEnd());
  desk.replaceChildren(end);
  notice.textContent = '';
  button.focus();
}

/** @param {unknown} reason */
function fail(reason, isKept = false) {
  console.error(reason);
  const scores = isKept ? ' High scores that were entered are kept.' : '';
  showEnd(
    typeof WebAssembly === 'undefined' || typeof DecompressionStream === 'undefined'
      ? 'This browser is too old for Quabble: it lacks WebAssembly or the decompression of data.'
      : `Quabble has stopped because something went wrong.${scores}`);
}

/** What decides every board: by chance, or as the address says, to play the same boards again. */
function seed() {
  const given = new URLSearchParams(location.hash.slice(1)).get('seed') ?? '';
  return /^\d{1,19}$/.test(given) ? BigInt(given) : crypto.getRandomValues(new BigUint64Array(1))[0];
}

/** @param {string} document */
function open(document) {
  const isInside = document === helpPage && isOneFile;
  window.open(isInside ? `${location.href.split('#')[0]}#help` : document, '_blank', 'noopener');
}

/** What is seen first is not held up by what comes after it. Where nobody looks no frame comes, and none is waited for. */
async function splashIsSeen() {
  const splash = /** @type {HTMLImageElement} */ (document.getElementById('splash'));
  if (document.hidden) return;
  await splash.decode().catch(console.warn);
  await new Promise((seen) => requestAnimationFrame(() => setTimeout(seen)));
}

async function play() {
  await splashIsSeen();
  const keeping = new Keeping();
  const isOpened = keeping.open();
  const [module, files, picture] = await Promise.all([loadProgram(), filesOf('pictures'), backdrop()]);
  files.set('BGIMG.PNG', picture);
  let isTold = false;
  /** Said once. */
  const keep = () => {
    program.keep();
    if (keeping.isKept !== false || isTold || !keeping.isOurs) return;
    isTold = true;
    notice.textContent = 'Settings and high scores cannot be kept: the browser refuses to store them.';
  };
  const program = new Program(files, keeping, {
    end: () =>
      showEnd(keeping.isKept ? 'Quabble has ended. Settings and high scores are kept.'
                     : 'Quabble has ended. Settings and high scores could not be kept.'),
    fail: (reason, isAllKept) => fail(reason, isAllKept && keeping.isKept),
    closed: keep, // a name may have been entered, which is not to be lost when something goes wrong later
    open,
  });
  offerRecordOf(program);
  document.addEventListener('visibilitychange', () => {
    program.call('setHidden', document.hidden);
    if (document.hidden) keep();
  });
  addEventListener('pagehide', keep);
  await program.start(module, new Frames(desk, program), seed());
  program.call('setHidden', document.hidden);
  if (!(await isOpened))
    notice.textContent = 'Quabble is open in another tab. Settings and high scores of this one will be lost.';
  await addLargePictures(program);
}

/** The finer pictures come when the first ones are seen; without them the game is only coarser. @param {Program} program */
async function addLargePictures(program) {
  try {
    for (const [name, file] of await filesOf('rest')) program.files.set(name, file);
    program.call('takeLargePictures');
  } catch (error) {
    console.warn('The finer pictures did not come.', error);
  }
}

if (isOneFile && location.hash === '#help') {
  const files = await filesOf('rest');
  showHelp(new TextDecoder().decode(files.get(helpPage)));
} else {
  if (!isOneFile && 'serviceWorker' in navigator)
    navigator.serviceWorker.register('service_worker.js').catch(console.warn);
  await play().catch(fail);
}
