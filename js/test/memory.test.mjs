import assert from "node:assert/strict";
import { test } from "node:test";
import { setImmediate } from "node:timers/promises";
import { load } from "../dist/index.js";
import { brindle } from "./support.mjs";

/** Where the memory of WebAssembly that is in use ends: there a large block finds its place. */
function end() {
  const song = brindle.read("C");
  const { module } = song.native;
  const place = module._malloc(2 ** 20);
  module._free(place);
  song.free();
  return place;
}

function work(count) {
  for (let i = 0; i < count; ++i) {
    assert.equal(brindle.chord("F#m7/C#").tones.length, 4);
    assert.throws(() => brindle.chord("Hq"));
    if (i % 50 > 0) continue;
    const song = brindle.read("Dm7 G7 | C . E7 . | Am . . .");
    const analysis = song.analyse({ explain: true });
    assert.equal(analysis.chords.length, 5);
    if (i % 100 === 0) song.free(), analysis.free();
  }
}

test("100,000 calls leave nothing behind, freed by hand or not", async () => {
  work(2_000);
  await setImmediate();
  globalThis.gc?.();
  const before = end();
  for (let part = 0; part < 50; ++part) {
    work(1_000);
    globalThis.gc?.();
    // What was collected is freed between two tasks.
    await setImmediate();
  }
  const grown = end() - before;
  assert.ok(grown < 2 ** 16, `${grown} bytes are left of what 50,000 rounds took`);
});

test("what was freed cannot be used, and freeing again is nothing", () => {
  const song = brindle.read("C");
  song.free();
  song.free();
  assert.throws(() => song.title, /freed/);
});

test("a song that needs more memory than there was is read, and what comes after it", async () => {
  const fresh = await load();
  const song = fresh.read("Dm7 | G7 | Cmaj7 | A7 | ".repeat(750));
  const analysis = song.analyse();
  assert.equal(analysis.sheet().Bars.length, 3000);
  assert.equal(analysis.chords[1].numeral, "V7");
  assert.equal(fresh.chord("F#m7/C#").symbol, "F#m7/C#");
});
