// Makes the page in its two forms: node build_page.mjs FILES OUT
//   FILES             the folder with quabble.wasm, the program's files and the icons
//   OUT/quabble.html  everything in one file
//   OUT/site          the same as a site that installs itself
import {createHash} from 'node:crypto';
import {copyFileSync, mkdirSync, readFileSync, rmSync, writeFileSync} from 'node:fs';
import {join} from 'node:path';
import {gzipSync} from 'node:zlib';
import * as esbuild from 'esbuild';

const [filesFolder, out] = process.argv.slice(2);
const page = join(import.meta.dirname ?? new URL('.', import.meta.url).pathname, 'page');
const pictures = ['ALLPICDATA.BMP'];
const largePictures = ['ALLPICDATA.BIG', 'BGIMG.BIG'];
const helpPage = 'QB_HELP.HTM';
const icons = [192, 512];

const compressed = (bytes) => gzipSync(bytes, {level: 9});
const program = compressed(readFileSync(join(filesFolder, 'quabble.wasm')));

/** The form is described in page/parts.js. */
function pack(names) {
  const files = names.map((name) => readFileSync(join(filesFolder, name)));
  const list = Buffer.from(JSON.stringify(names.map((name, i) => [name, files[i].length])));
  const length = Buffer.alloc(4);
  length.writeUInt32LE(list.length);
  return compressed(Buffer.concat([length, list, ...files]));
}

/** Seven bits a character; a page does not keep 0, line ends as they are and what begins a tag. */
function asText(bytes) {
  const kept = (value) => String.fromCharCode([0, 13, 60].includes(value) ? value + 256 : value);
  let text = '';
  let bits = 0;
  let count = 0;
  for (const byte of bytes) {
    bits = ((bits << 8) | byte) & 0x7fff;
    count += 8;
    while (count >= 7) text += kept((bits >> (count -= 7)) & 127);
  }
  return count === 0 ? text : text + kept((bits << (7 - count)) & 127);
}

const hashOf = (text) => `'sha256-${createHash('sha256').update(text).digest('base64')}'`;

const template = readFileSync(join(page, 'index.html'), 'utf8');
const {code: style} = await esbuild.transform(readFileSync(join(page, 'style.css'), 'utf8'), {loader: 'css', minify: true});
const bundle = await esbuild.build({
  entryPoints: [join(page, 'main.js')], bundle: true, minify: true, format: 'esm', target: 'es2022', charset: 'ascii', write: false,
});
const script = bundle.outputFiles[0].text;
const {code: early} = await esbuild.transform(readFileSync(join(page, 'early.js'), 'utf8'), {minify: true, charset: 'ascii'});
const splash = readFileSync(join(filesFolder, 'BGIMG.PNG'));
const asData = (png) => `data:image/png;base64,${png.toString('base64')}`;

/** @param {string} source where the page's own files are taken from, in the words of a policy */
function fill(links, data, splash, source) {
  const policy = [
    "default-src 'none'", `script-src ${hashOf(early)} ${hashOf(script)} 'wasm-unsafe-eval'`, `style-src ${hashOf(style)}`,
    `img-src data: ${source}`, `connect-src ${source || 'data:'}`, `manifest-src ${source || "'none'"}`,
    `worker-src ${source || "'none'"}`, "base-uri 'none'", "form-action 'none'",
  ].join('; ');
  const parts = {policy, links, style, splash, early, data, script};
  return template.replace(/\{\{(\w+)\}\}/g, (_, name) => parts[name]);
}

rmSync(out, {recursive: true, force: true});
const site = join(out, 'site');
mkdirSync(site, {recursive: true});
const icon = (width) => readFileSync(join(filesFolder, `icon_${width}.png`));

const siteLinks = [
  ...['program', 'pictures'].map((name) => `<link rel="preload" href="${name}.data" as="fetch" crossorigin fetchpriority="low">`),
  '<link rel="manifest" href="manifest.webmanifest">', '<link rel="icon" href="icon_192.png">',
];
const siteFiles = {
  'index.html': fill(siteLinks.join('\n'), '', 'splash.png', "'self'"),
  'splash.png': splash,
  'program.data': program,
  'pictures.data': pack(pictures),
  'rest.data': pack(largePictures),
  'manifest.webmanifest': JSON.stringify({
    id: 'quabble', name: 'Quabble', short_name: 'Quabble', start_url: '.', display: 'standalone', orientation: 'landscape',
    background_color: '#14171d', theme_color: '#14171d',
    icons: icons.map((width) => ({src: `icon_${width}.png`, sizes: `${width}x${width}`, type: 'image/png'})),
  }),
  [helpPage]: readFileSync(join(filesFolder, helpPage)),
};
for (const width of icons) siteFiles[`icon_${width}.png`] = icon(width);
const version = createHash('sha256');
for (const name of Object.keys(siteFiles)) version.update(siteFiles[name]);
const {code: worker} = await esbuild.transform(readFileSync(join(page, 'service_worker.js'), 'utf8'), {
  minify: true,
  define: {
    VERSION: JSON.stringify(version.digest('hex').slice(0, 16)),
    FILES: JSON.stringify(['./', ...Object.keys(siteFiles).filter((name) => name !== 'index.html')]),
  },
});
siteFiles['service_worker.js'] = worker;
for (const [name, content] of Object.entries(siteFiles)) writeFileSync(join(site, name), content);

const inside = {program, pictures: pack(pictures), rest: pack([...largePictures, helpPage])};
const data = Object.entries(inside).map(([name, bytes]) => `<script type="text/plain" id="${name}">${asText(bytes)}</script>`);
const inlineIcon = `<link rel="icon" href="${asData(readFileSync(join(filesFolder, 'icon_64.png')))}">`;
writeFileSync(join(out, 'quabble.html'), fill(inlineIcon, data.join('\n'), asData(splash), ''));
