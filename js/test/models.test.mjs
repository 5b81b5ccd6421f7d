import assert from "node:assert/strict";
import { test } from "node:test";
import { brindle } from "./support.mjs";

const songs = () => [
  brindle.read("{title: One}\n{key: G}\n[G]la [C]la [D7]la [G]la"),
  brindle.read("Am Dm | E7 Am"),
];

test("a model tells its songs, joins, and is written and read", () => {
  const model = brindle.songModel(songs());
  assert.deepEqual(model.songs[0], { title: "One", makers: "", style: "", key: "G major", chords: 4 });
  const again = brindle.songModel(model.toText());
  assert.equal(again.toText(), model.toText());
  const all = brindle.songModel();
  assert.equal(all.songs.length, 81);
  assert.equal(all.join(model).songs.length, 83);
  assert.equal(all.ofStyle("HYMN").songs.length, 22);
  assert.deepEqual(again.next(["D7"], { key: "G" }).chords[0].symbol, "G");
  assert.throws(() => all.ofStyle("polka"), { status: "not-found" });
});

test("models that are damaged or learn nothing are refused", () => {
  const text = brindle.songModel(songs()).toText();
  for (let at = 0; at < text.length - 1; at += 3) {
    assert.throws(() => brindle.songModel(text.slice(0, at)), { status: "input" });
  }
  assert.throws(() => brindle.songModel(text.replace("One", "Ono")), /damaged/);
  assert.throws(() => brindle.songModel([]), { status: "input" });
  assert.throws(() => brindle.songModel([brindle.read("C what", { lenient: true })]), { status: "input" });
});

test("a song is written as it was asked for", () => {
  const model = brindle.songModel();
  const request = {
    key: "Eb", form: "ABAB", bars: 16, beatsPerBar: 3, sheet: "Eb | _ | Ab", contains: "ii V", never: "Bdim",
    ends: "I", mostQuotedBars: 3, order: 4, seed: 2n ** 63n,
  };
  const { song, text, quote } = model.writeSong(request);
  assert.deepEqual(song.sections.map(({ name }) => name), ["A", "B", "A", "B"]);
  assert.deepEqual([song.bars.length, song.beatsPerBar, song.statedKey.name], [16, 3, "Eb Major"]);
  const at = (beat) => song.chords.findLast(({ position }) => position <= beat).symbol;
  assert.deepEqual([at(0), at(6), at(47)], ["Eb", "Ab", "Eb"]);
  assert.ok(quote === null || quote.bars <= 3);
  assert.equal(model.writeSong(request).text, text);
  assert.notEqual(model.writeSong({ ...request, seed: 1 }).text, text);
  const read = brindle.read(text, { beatsPerBar: 3 });
  assert.deepEqual(read.chords.map(({ symbol }) => symbol), song.chords.map(({ symbol }) => symbol));
});

test("what cannot be written is told", () => {
  const model = brindle.songModel();
  const cases = [
    [{ bars: 257 }, "argument", "a song has 1 to 256 bars"],
    [{ beatsPerBar: 0 }, "argument", "a bar has 1 to 24 beats"],
    [{ mostQuotedBars: NaN }, "argument", "the longest quote has 0 to 1000 bars"],
    [{ order: 6 }, "argument", "histories have 1 to 5 chords"],
    [{ begins: "X" }, "input", "begins: X is neither a chord nor a numeral"],
    [{ begins: "C", never: "C", ends: "F" }, "not-found",
      "these wishes cannot be met together: begins C; never C"],
  ];
  for (const [request, status, text] of cases) {
    assert.throws(() => model.writeSong(request), { status, text });
  }
  assert.throws(() => model.writeSong({ key: "H sharp what" }), { name: "BrindleError" });
  assert.throws(() => model.next(["C"], { order: 0 }), { status: "argument" });
  model.free();
  assert.throws(() => model.writeSong(), /freed/);
});

test("a model foretells songs", () => {
  const told = brindle.songModel().ofStyle("blues").score();
  assert.deepEqual([told.Songs, told.Orders.length], [11, 5]);
  assert.equal(brindle.songModel().score(songs()).Chords, 8);
});
