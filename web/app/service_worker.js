// Keeps the application, so that it opens without a network; a newer one replaces it.

const KEPT = 'vantrel';
const FILES = ['./', 'manifest.webmanifest', 'icon.svg'];

self.addEventListener('install', (event) => {
  self.skipWaiting();
  event.waitUntil(caches.open(KEPT).then((cache) => cache.addAll(FILES)));
});
self.addEventListener('activate', (event) => event.waitUntil(self.clients.claim()));
self.addEventListener('fetch', (event) => {
  event.respondWith(fetch(event.request).then(async (answer) => {
    if (answer.ok) await (await caches.open(KEPT)).put(event.request, answer.clone());
    return answer;
  }, async () => await caches.match(event.request) ||
    (event.request.mode === 'navigate' && await caches.match('./')) || Response.error()));
});
