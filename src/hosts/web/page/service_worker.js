// Keeps the site's files, so that the game starts without a network. A new version of it is fetched while the old one is
// played, and is there at the next start.

const worker = /** @type {ServiceWorkerGlobalScope} */ (/** @type {unknown} */ (self));

worker.addEventListener('install', (event) => {
  event.waitUntil(caches.open(VERSION).then((cache) => cache.addAll(FILES)).then(() => worker.skipWaiting()));
});

worker.addEventListener('activate', (event) => {
  const forget = async () => {
    for (const name of await caches.keys()) {
      if (name !== VERSION) await caches.delete(name);
    }
  };
  event.waitUntil(forget());
});

worker.addEventListener('fetch', (event) => {
  const answer = async () => (await caches.match(event.request, {ignoreSearch: true})) ?? fetch(event.request);
  event.respondWith(answer());
});
