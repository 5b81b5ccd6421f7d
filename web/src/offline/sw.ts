// Keeps the whole page, so that it works without a network once it has been loaded.

declare const self: ServiceWorkerGlobalScope;
// The build puts these in: see vite.config.mjs.
declare const __FILES__: string[];
declare const __VERSION__: string;

const kept = `brindle-${__VERSION__}`;

self.addEventListener("install", (event) => {
  const keepAll = async () => {
    const cache = await caches.open(kept);
    await cache.addAll(__FILES__.map((file) => new Request(file, { cache: "reload" })));
    await self.skipWaiting();
  };
  event.waitUntil(keepAll());
});

self.addEventListener("activate", (event) => {
  const takeOver = async () => {
    for (const name of await caches.keys()) {
      if (name.startsWith("brindle-") && name !== kept) await caches.delete(name);
    }
    await self.clients.claim();
  };
  event.waitUntil(takeOver());
});

self.addEventListener("fetch", (event) => {
  const { request } = event;
  if (request.method !== "GET" || new URL(request.url).origin !== self.location.origin) return;
  const answer = async () => {
    const cache = await caches.open(kept);
    const file = request.mode === "navigate" ? "./" : request;
    return (await cache.match(file, { ignoreSearch: true })) ?? fetch(request);
  };
  event.respondWith(answer());
});

// Makes this a module, so that its names are its own.
export {};
