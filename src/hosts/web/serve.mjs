// Serves a folder on this machine alone, as any web server would: node serve.mjs FOLDER [open]
// With the word "open" a browser is asked to show it.
import {spawn} from 'node:child_process';
import {createServer} from 'node:http';
import {readFile} from 'node:fs/promises';
import {extname, join, normalize} from 'node:path';
import {pathToFileURL} from 'node:url';

const types = {
  '.css': 'text/css', '.data': 'application/octet-stream', '.htm': 'text/html; charset=utf-8', '.html': 'text/html; charset=utf-8',
  '.js': 'text/javascript', '.png': 'image/png', '.webmanifest': 'application/manifest+json',
};

/** Resolves to the server, once it listens; port 0 is any that is free. `answered` hears of every answer's path and size. */
export function serve(folder, port = 0, answered = () => {}) {
  const server = createServer(async (request, response) => {
    const path = normalize(decodeURIComponent(new URL(request.url, 'http://localhost').pathname));
    try {
      const content = await readFile(join(folder, path.endsWith('/') ? join(path, 'index.html') : path));
      response.writeHead(200, {
        'Content-Type': types[extname(path).toLowerCase()] ?? (path.endsWith('/') ? types['.html'] : 'application/octet-stream'),
        'Content-Length': content.length, 'Cache-Control': 'no-cache',
      });
      response.end(content);
      answered(path, content.length);
    } catch {
      response.writeHead(404).end();
      answered(path, 0);
    }
  });
  return new Promise((resolve, reject) => server.on('error', reject).listen(port, '127.0.0.1', () => resolve(server)));
}

export const addressOf = (server) => `http://localhost:${server.address().port}/`;

if (import.meta.url === pathToFileURL(process.argv[1]).href) {
  // A browser keeps what is to last with the address, so it is the same one each time, unless somebody else has it.
  const usualPort = 8642;
  const server = await serve(process.argv[2], usualPort).catch(() => serve(process.argv[2]));
  const address = addressOf(server);
  console.log(address);
  if (process.argv[3] === 'open') {
    const browser = spawn('xdg-open', [address], {stdio: 'ignore', detached: true});
    browser.on('error', () => console.log('No browser could be opened; open this address in one.'));
    browser.unref();
  }
}
