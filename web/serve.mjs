// Serves the built page to this machine: `node serve.mjs [PORT]`. Any other server of files does it, too.

import { createReadStream, statSync } from "node:fs";
import { createServer } from "node:http";
import { dirname, extname, join, normalize, sep } from "node:path";
import { fileURLToPath, pathToFileURL } from "node:url";

const types = {
  ".html": "text/html; charset=utf-8",
  ".js": "text/javascript; charset=utf-8",
  ".css": "text/css; charset=utf-8",
  ".wasm": "application/wasm",
  ".svg": "image/svg+xml",
  ".woff2": "font/woff2",
  ".woff": "font/woff",
  ".mp3": "audio/mpeg",
  ".webmanifest": "application/manifest+json",
};

/** The page as the build has made it. */
export const builtPage = join(dirname(fileURLToPath(import.meta.url)), "../build/web/page");

/** The file that an address means; null for one outside of the folder or for none. */
function fileOf(folder, address) {
  try {
    const path = decodeURIComponent(new URL(address, "http://localhost").pathname);
    const file = join(folder, normalize(path.endsWith("/") ? `${path}index.html` : path));
    return file.startsWith(folder + sep) && statSync(file).isFile() ? file : null;
  } catch {
    return null;
  }
}

/** A server of a folder on this machine alone; port 0 takes a free one. */
export function serve(folder, port = 0) {
  const server = createServer((request, response) => {
    const file = fileOf(folder, request.url ?? "/");
    if (file === null) {
      response.writeHead(404, { "Content-Type": "text/plain" }).end("not found\n");
      return;
    }
    response.writeHead(200, {
      "Content-Type": types[extname(file)] ?? "application/octet-stream",
      "Cache-Control": "no-cache",
      "X-Content-Type-Options": "nosniff",
    });
    createReadStream(file).pipe(response);
  });
  return new Promise((resolve, reject) => {
    server.once("error", reject).listen(port, "127.0.0.1", () => resolve(server));
  });
}

if (import.meta.url === pathToFileURL(process.argv[1] ?? "").href) {
  const server = await serve(builtPage, Number(process.argv[2] ?? 8137));
  console.log(`http://127.0.0.1:${server.address().port}/`);
}
