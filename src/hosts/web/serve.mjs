// Serves a folder on this machine alone, as any web server would: node serve.mjs FOLDER
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
  return new Promise((resolve) => server.listen(port, '127.0.0.1', () => resolve(server)));
}

export const addressOf = (server) => `http://localhost:${server.address().port}/`;

if (import.meta.url === pathToFileURL(process.argv[1]).href) console.log(addressOf(await serve(process.argv[2])));
