import { createHash } from "node:crypto";
import { readFileSync, readdirSync, writeFileSync } from "node:fs";
import { dirname, join } from "node:path";
import { fileURLToPath } from "node:url";
import { defineConfig } from "vite";

const here = dirname(fileURLToPath(import.meta.url));
const outDir = join(here, "../build/web/page");

/**
 * Writes into the service worker which files make the page, and a version that changes with any of
 * them, so that a visitor gets either the old page whole or the new one.
 */
function offlineFiles() {
  return {
    name: "offline-files",
    apply: "build",
    closeBundle() {
      const hash = createHash("sha256");
      const files = readdirSync(outDir, { recursive: true, withFileTypes: true })
        .filter((entry) => entry.isFile() && entry.name !== "sw.js")
        .map((entry) => join(entry.parentPath, entry.name).slice(outDir.length + 1))
        .sort();
      for (const file of files) hash.update(file).update(readFileSync(join(outDir, file)));
      const listed = files.map((file) => (file === "index.html" ? "./" : file));
      const path = join(outDir, "sw.js");
      const worker = readFileSync(path, "utf8")
        .replace("__FILES__", () => JSON.stringify(listed))
        .replace("__VERSION__", () => JSON.stringify(hash.digest("hex").slice(0, 16)));
      writeFileSync(path, worker);
    },
  };
}

export default defineConfig({
  base: "./",
  oxc: { jsx: { runtime: "automatic", importSource: "preact" } },
  worker: { format: "es" },
  build: {
    outDir,
    emptyOutDir: true,
    target: "es2022",
    // Files stay files: the policy of the page allows no code or font from data addresses.
    assetsInlineLimit: 0,
    modulePreload: { polyfill: false },
    rollupOptions: {
      input: { index: join(here, "index.html"), sw: join(here, "src/offline/sw.ts") },
      output: {
        entryFileNames: (chunk) => (chunk.name === "sw" ? "sw.js" : "assets/[name]-[hash].js"),
      },
    },
  },
  plugins: [offlineFiles()],
});
