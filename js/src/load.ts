import { Brindle } from "./Brindle.js";
import { Native, type Module } from "./Native.js";
import { unzip } from "./unzip.js";
// Made by emscripten; scripts/build.mjs knows where it lies.
import createModule from "brindle-module";

/** Where the library comes from. */
export interface LoadOptions {
  /** The place of brindle.wasm, its bytes, or what it was compiled to; beside this module if it is not said. */
  wasm?: string | URL | BufferSource | WebAssembly.Module;
}

const isNode = typeof process === "object" && typeof process.versions?.node === "string";

async function bytesOf(place: URL | string): Promise<BufferSource | Response> {
  const url = new URL(place, import.meta.url);
  if (!isNode || url.protocol !== "file:") return fetch(url);
  // By name, so that no bundler for browsers looks for it.
  const files = "node:fs/promises";
  const { readFile } = (await import(/* @vite-ignore */ files)) as typeof import("node:fs/promises");
  return readFile(url);
}

async function compile(wasm: NonNullable<LoadOptions["wasm"]>): Promise<WebAssembly.Module> {
  if (wasm instanceof WebAssembly.Module) return wasm;
  const isPlace = typeof wasm === "string" || wasm instanceof URL;
  const source = isPlace ? await bytesOf(wasm) : wasm;
  if (!(source instanceof Response)) return WebAssembly.compile(source);
  if (!source.ok) throw new Error(`brindle.wasm: ${source.status} ${source.statusText}`);
  const isTyped = source.headers.get("Content-Type")?.startsWith("application/wasm");
  return isTyped
    ? WebAssembly.compileStreaming(source)
    : WebAssembly.compile(await source.arrayBuffer());
}

/** Loads the library; a page does that once. */
export async function load(options: LoadOptions = {}): Promise<Brindle> {
  const compiled = await compile(options.wasm ?? new URL("./brindle.wasm", import.meta.url));
  const module = await new Promise<Module>((resolve, reject) => {
    createModule({
      unzip,
      instantiateWasm(imports: WebAssembly.Imports, done: (instance: WebAssembly.Instance) => void) {
        WebAssembly.instantiate(compiled, imports).then(done, reject);
        return {};
      },
    }).then(resolve, reject);
  });
  return new Brindle(new Native(module));
}
