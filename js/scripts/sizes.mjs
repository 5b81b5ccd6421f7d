// Prints what each part of the package costs, packed with gzip; with --check too much is an error.
import { readFileSync } from "node:fs";
import { fileURLToPath } from "node:url";
import { gzipSync } from "node:zlib";

const most = 900_000;
const dist = fileURLToPath(new URL("../dist/", import.meta.url));
const files = ["index.js", "brindle.wasm"].map((name) => {
  const bytes = readFileSync(dist + name);
  return { name, bytes: bytes.length, packed: gzipSync(bytes, { level: 9 }).length };
});

/** The sections of a WebAssembly module, each with its bytes. */
function sectionsOf(bytes) {
  const names = ["custom", "types", "imports", "functions", "table", "memory", "globals", "exports",
    "start", "elements", "code", "data", "data count", "tags"];
  const sections = [];
  for (let at = 8; at < bytes.length; ) {
    const id = bytes[at++];
    let size = 0;
    for (let shift = 0, byte = 128; byte & 128; shift += 7) {
      byte = bytes[at++];
      size |= (byte & 127) << shift;
    }
    sections.push({ name: names[id] ?? `section ${id}`, bytes: bytes.subarray(at, at + size) });
    at += size;
  }
  return sections;
}

const row = (name, bytes, packed) =>
  console.log(name.padEnd(24), String(bytes).padStart(10), String(packed).padStart(10));
console.log("part".padEnd(24), "bytes".padStart(10), "gzip".padStart(10));
for (const { name, bytes, packed } of files) row(name, bytes, packed);
for (const { name, bytes } of sectionsOf(readFileSync(`${dist}brindle.wasm`))) {
  if (bytes.length > 10_000) row(`  of it ${name}`, bytes.length, gzipSync(bytes, { level: 9 }).length);
}
const total = files.reduce((sum, { packed }) => sum + packed, 0);
row("all", files.reduce((sum, { bytes }) => sum + bytes, 0), total);
if (process.argv.includes("--check") && total > most) {
  console.error(`the package has ${total} bytes, more than ${most}`);
  process.exit(1);
}
