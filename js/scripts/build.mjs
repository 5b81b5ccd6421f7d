// Makes dist/ of src/ and of what the WebAssembly build has made: build.mjs [FOLDER], by default
// build/wasm/js of the project.
import { execFileSync } from "node:child_process";
import { copyFile, mkdir, rm } from "node:fs/promises";
import { fileURLToPath } from "node:url";
import { build } from "esbuild";

const here = fileURLToPath(new URL("..", import.meta.url));
const made = process.argv[2] ?? fileURLToPath(new URL("../../build/wasm/js", import.meta.url));

await rm(`${here}dist`, { recursive: true, force: true });
await mkdir(`${here}dist`, { recursive: true });
await build({
  entryPoints: [`${here}src/index.ts`],
  outfile: `${here}dist/index.js`,
  alias: { "brindle-module": `${made}/brindle.mjs` },
  bundle: true,
  minify: true,
  format: "esm",
  target: "es2022",
  legalComments: "inline",
});
await copyFile(`${made}/brindle.wasm`, `${here}dist/brindle.wasm`);
execFileSync(process.execPath, [`${here}node_modules/typescript/bin/tsc`, "-p", here], {
  stdio: "inherit",
});
await copyFile(`${here}../LICENSE`, `${here}LICENSE`);
