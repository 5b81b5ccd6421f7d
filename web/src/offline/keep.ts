/** Keeps the page for the time without a network, where the browser can. */
export function keepPage(): void {
  if (!import.meta.env.PROD || !("serviceWorker" in navigator)) return;
  // Without it the page works as long as there is a network.
  navigator.serviceWorker.register("./sw.js").catch(() => undefined);
}
