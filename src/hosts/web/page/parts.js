// What the program is made of: packs of files, which lie beside the page or are part of it.

/** @typedef {Map<string, Uint8Array>} Files */

/** Whether everything is inside the page. */
export const isOneFile = document.getElementById('program') !== null;

/**
 * The program itself, compiled while it arrives.
 * @returns {Promise<WebAssembly.Module>}
 */
export function program() {
  const asModule = {headers: {'Content-Type': 'application/wasm'}};
  return twice(async () => WebAssembly.compileStreaming(new Response(await unpacked('program'), asModule)));
}

/**
 * The files of a pack, "pictures" or "rest".
 * @param {string} pack
 * @returns {Promise<Files>}
 */
export function filesOf(pack) {
  return twice(async () => unpack(await new Response(await unpacked(pack)).arrayBuffer()));
}

/**
 * The picture that the page shows until the program does.
 * @returns {Promise<Uint8Array>}
 */
export function backdrop() {
  const splash = /** @type {HTMLImageElement} */ (document.getElementById('splash'));
  return twice(async () => new Uint8Array(await (await fetch(splash.src, {cache: 'force-cache'})).arrayBuffer()));
}

/**
 * A connection that fails once gets a second chance.
 * @template T
 * @param {() => Promise<T>} load
 * @returns {Promise<T>}
 */
function twice(load) {
  return load().catch(load);
}

/** @param {string} name */
async function unpacked(name) {
  const inside = document.getElementById(name);
  const packed = inside === null ? await fetch(`${name}.data`) : new Response(decoded(inside.textContent ?? ''));
  if (!packed.ok || packed.body === null) throw new Error(`${name}: ${packed.status}`);
  return packed.body.pipeThrough(new DecompressionStream('gzip'));
}

/**
 * Seven bits a character; those that a page does not keep as they are lie 256 higher.
 * @param {string} text
 */
function decoded(text) {
  const bytes = new Uint8Array((text.length * 7) >> 3);
  let bits = 0;
  let count = 0;
  let at = 0;
  for (let i = 0; i < text.length; ++i) {
    bits = ((bits << 7) | (text.charCodeAt(i) & 127)) & 0x7fff;
    count += 7;
    if (count >= 8) bytes[at++] = bits >> (count -= 8);
  }
  return bytes;
}

/**
 * A pack begins with the length of its list, four bytes, and the list, JSON: the files' names and sizes.
 * @param {ArrayBuffer} buffer
 */
function unpack(buffer) {
  const bytes = new Uint8Array(buffer);
  const listEnd = 4 + new DataView(buffer).getUint32(0, true);
  /** @type {[string, number][]} */
  const list = JSON.parse(new TextDecoder().decode(bytes.subarray(4, listEnd)));
  /** @type {Files} */
  const files = new Map();
  let at = listEnd;
  for (const [name, size] of list) files.set(name, bytes.subarray(at, (at += size)));
  return files;
}
