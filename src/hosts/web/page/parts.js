// What the program is made of: packs of files, which lie beside the page or are part of it.

/** @typedef {Map<string, Uint8Array>} Files */

/** Whether everything is inside the page. */
export const isOneFile = document.getElementById('first') !== null;

/**
 * The files of a pack, "first" or "rest".
 * @param {string} pack
 * @returns {Promise<Files>}
 */
export async function filesOf(pack) {
  const inside = document.getElementById(pack);
  const packed = inside === null ? await fetched(`${pack}.data`) : new Blob([decoded(inside.textContent ?? '')]);
  const unpacked = packed.stream().pipeThrough(new DecompressionStream('gzip'));
  return unpack(new Uint8Array(await new Response(unpacked).arrayBuffer()));
}

/**
 * A connection that fails once gets a second chance.
 * @param {string} name
 * @returns {Promise<Blob>}
 */
async function fetched(name, tries = 2) {
  try {
    const response = await fetch(name);
    if (!response.ok) throw new Error(`${name}: ${response.status}`);
    return await response.blob();
  } catch (error) {
    if (tries === 1) throw error;
    return fetched(name, tries - 1);
  }
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
 * @param {Uint8Array} bytes
 */
function unpack(bytes) {
  const listEnd = 4 + new DataView(bytes.buffer).getUint32(0, true);
  /** @type {[string, number][]} */
  const list = JSON.parse(new TextDecoder().decode(bytes.subarray(4, listEnd)));
  /** @type {Files} */
  const files = new Map();
  let at = listEnd;
  for (const [name, size] of list) files.set(name, bytes.subarray(at, (at += size)));
  return files;
}
