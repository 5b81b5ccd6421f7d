// Chord symbols through the package and through tonal, in one run, and how long the package takes to
// load: npm ci && node compare.mjs [PROGRAM]. PROGRAM is the bench of chord symbols of the C++ build,
// build/release/bin/chords_bench, whose time is set beside them.
import { execFileSync } from "node:child_process";
import { readFileSync } from "node:fs";
import { Chord } from "tonal";

const symbols = readFileSync(new URL("../../tests/data/chord-spellings.tsv", import.meta.url), "utf8")
  .trim().split("\n").slice(1).map((row) => row.split("\t")[0]);

const begin = performance.now();
const { load } = await import("../../js/dist/index.js");
const brindle = await load();
console.log(`load: ${(performance.now() - begin).toFixed(0)} ms`);

/** Microseconds a symbol, the best of some rounds. */
function timeOf(read) {
  let best = Infinity;
  for (let round = 0; round < 30; ++round) {
    const start = performance.now();
    for (let i = 0; i < 20; ++i) for (const symbol of symbols) read(symbol);
    best = Math.min(best, performance.now() - start);
  }
  return (best * 1000) / (20 * symbols.length);
}

const understood = (read) => symbols.filter(read).length;
const rows = {
  "brindle.chord": [(symbol) => brindle.chord(symbol), (symbol) => brindle.chord(symbol).mask > 0],
  "brindle.chord and its tones": [(symbol) => brindle.chord(symbol).tones, () => true],
  "tonal's Chord.get": [(symbol) => Chord.get(symbol), (symbol) => !Chord.get(symbol).empty],
};
for (const [name, [read, isRead]] of Object.entries(rows)) {
  console.log(`${name}: ${timeOf(read).toFixed(2)} us, understood ${understood(isRead)} of ${symbols.length}`);
}
if (process.argv[2]) {
  console.log(execFileSync(process.argv[2], { encoding: "utf8" }));
}
