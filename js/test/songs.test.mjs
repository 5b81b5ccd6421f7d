import assert from "node:assert/strict";
import { execFileSync } from "node:child_process";
import { existsSync, readFileSync } from "node:fs";
import { test } from "node:test";
import { brindle, filesOf, program } from "./support.mjs";

const songs = filesOf("examples/songs", "examples/scores", "tests/data/leadsheets");
const skip = existsSync(program) ? false : `there is no ${program}`;

test("analyses are those of the program, for all examples and lead sheets", { skip }, () => {
  assert.ok(songs.length > 30);
  for (const file of songs) {
    let printed;
    try {
      printed = execFileSync(program, ["analyse", "--json", file], { stdio: ["ignore", "pipe", "ignore"] });
    } catch {
      // The program refuses scores without chord symbols, too.
      let chords = 0;
      try {
        chords = brindle.read(readFileSync(file)).chords.length;
      } catch (error) {
        assert.equal(error.name, "SongError", file);
      }
      assert.equal(chords, 0, file);
      continue;
    }
    const analysis = brindle.read(readFileSync(file)).analyse();
    const expected = JSON.parse(printed);
    assert.deepEqual(analysis.json(), expected, file);
  }
});

test("scores are read, plain and compressed, and nothing else is one", () => {
  const scores = songs.filter((file) => !file.endsWith(".txt"));
  for (const end of [".musicxml", ".mxl"]) {
    const song = brindle.readScore(readFileSync(scores.find((file) => file.endsWith(end))));
    assert.ok(song.chords.length > 0 || song.bars.length > 0, end);
  }
  assert.throws(() => brindle.readScore(new TextEncoder().encode("C F G")), { name: "BrindleError" });
  const broken = readFileSync(scores.find((file) => file.endsWith(".mxl"))).subarray(0, 200);
  assert.throws(() => brindle.readScore(broken), { name: "SongError" });
  const midi = brindle.scoreMidi(readFileSync(scores[0]));
  assert.equal(String.fromCharCode(...midi.subarray(0, 4)), "MThd");
  assert.ok(brindle.scoreEvents(readFileSync(scores[0])).length > 10);
});

test("a compressed score that is damaged is told, wherever the damage is", () => {
  const whole = readFileSync(songs.find((file) => file.endsWith(".mxl")));
  const titleOf = (bytes) => {
    const song = brindle.readScore(bytes);
    const told = JSON.stringify(song.chords.map(({ position, symbol }) => [position, symbol])) + song.title;
    song.free();
    return told;
  };
  const expected = titleOf(whole);
  let refused = 0;
  for (let at = 60; at < whole.length; at += 97) {
    const damaged = Uint8Array.from(whole);
    damaged[at] ^= 1 << at % 8;
    try {
      assert.equal(titleOf(damaged), expected, `byte ${at}`);
    } catch (error) {
      assert.match(error.name, /^(Song|Brindle)Error$/, error.message);
      refused += 1;
    }
  }
  assert.ok(refused > whole.length / 97 / 2, `${refused} of ${whole.length} bytes`);
});

test("a song tells its chords, bars and parts", () => {
  const song = brindle.read("{title: One}\n{key: C}\n{tempo: 96}\n{comment: Verse}\n[C]la [G7]la\n");
  assert.deepEqual([song.title, song.format, song.tempo, song.statedKey.name], ["One", "chord-pro", 96, "C Major"]);
  assert.deepEqual(song.chords.map(({ symbol, position }) => [symbol, position]), [["C", 0], ["G7", 1]]);
  assert.deepEqual(song.sections, [{ name: "Verse", position: 0 }]);
});

test("a reading, chord by chord", () => {
  const analysis = brindle.read("Dm7 G7 | C . E7 . | Am . . .").analyse({ explain: true });
  assert.equal(analysis.key.name, "C Major");
  const rows = analysis.chords.map((c) => [c.symbol, c.numeral, c.function, c.relation, c.resolvesTo]);
  assert.deepEqual(rows.slice(0, 2), [
    ["Dm7", "ii7", "subdominant", "related second", 1],
    ["G7", "V7", "dominant", "dominant", 2],
  ]);
  assert.deepEqual(rows[4].slice(1), ["i", "tonic", "tonic", null]);
  assert.match(analysis.chords[1].explanation, /dominant of C major/);
  assert.deepEqual(analysis.symbols("nashville").slice(0, 3), ["2-7", "57", "1"]);
  assert.deepEqual(analysis.symbols("roman").slice(0, 3), ["ii7", "V7", "I"]);
  assert.deepEqual(analysis.symbols("solfege", true).slice(0, 2), ["Rem7", "Sol7"]);
  assert.match(analysis.svg({ naming: "nashville", width: 390 }), /^<svg[^]*>5<[^]*>7<[^]*<\/svg>\s*$/);
});

test("faults are thrown with their place, or told", () => {
  const text = "C F\nG huh | C what";
  assert.throws(() => brindle.read(text), (error) => {
    assert.deepEqual([error.name, error.line, error.column, error.position], ["SongError", 2, 4, 8]);
    return true;
  });
  const song = brindle.read(text, { lenient: true });
  assert.deepEqual(song.faults.map(({ line, column }) => [line, column]), [[2, 4], [2, 11]]);
  assert.throws(() => brindle.read("C", { beatsPerBar: 0 }), { status: "argument" });
});

test("all keys: a transposed song has the same numerals and comes back", () => {
  for (const file of filesOf("examples/songs")) {
    const song = brindle.read(readFileSync(file));
    const numerals = song.analyse().chords.map((chord) => chord.numeral);
    const roots = song.chords.map(({ chord }) => chord.root?.pitchClass);
    for (let semitones = -6; semitones <= 6; ++semitones) {
      const moved = song.transpose(semitones);
      assert.deepEqual(moved.analyse().chords.map((chord) => chord.numeral), numerals, file);
      const back = moved.transpose(-semitones);
      assert.deepEqual(back.chords.map(({ chord }) => chord.root?.pitchClass), roots, file);
    }
  }
  const up = brindle.read("C E7 | Am D7 | Fm6 C").transpose(-1);
  assert.deepEqual(up.chords.map(({ symbol }) => symbol), ["B", "D#7", "G#m", "C#7", "Em6", "B"]);
});

test("ChordPro reads back as the same chords at the same places", () => {
  for (const file of filesOf("examples/songs")) {
    const song = brindle.read(readFileSync(file));
    const again = brindle.read(song.chordPro());
    assert.equal(again.format, "chord-pro");
    const shape = (of) => of.chords.map(({ position, chord }) => [position, chord.symbol]);
    assert.deepEqual(shape(again), shape(song), file);
  }
});

test("what comes next is ranked", () => {
  const next = brindle.next(["Dm7", "G7"], { key: "C", count: 5 });
  assert.equal(next.key.name, "C Major");
  assert.equal(next.chords.length, 5);
  assert.equal(next.chords[0].numeral, "I");
  const probabilities = next.chords.map((chord) => chord.probability);
  assert.deepEqual(probabilities, [...probabilities].sort((a, b) => b - a));
  assert.throws(() => brindle.next([], { style: "polka" }), { status: "not-found" });
});

test("fingerings are searched by options, and chosen for a song with its easiest capo", () => {
  const first = (symbol, options) => brindle.searchFingerings(symbol, options).list[0].frets;
  assert.deepEqual(first("C", { tuning: "ukulele" }), [0, 0, 0, 3]);
  assert.deepEqual(first("C", { capo: 3 }), [-1, 0, 2, 2, 2, 0]);
  assert.equal(brindle.searchFingerings("Am7", { limit: 2 }).length, 2);
  assert.equal(brindle.searchFingerings("F#m", { highestFret: 1 }).length, 0);
  assert.throws(() => brindle.searchFingerings("C", { span: 7 }), /a span is 2 to 6 frets/);
  const song = brindle.read("Bb F | Gm Eb");
  const names = (options) => song.fingerings(options).list.map(({ name, capo }) => `${capo} ${name}`);
  assert.deepEqual(names(), ["3 G", "3 D", "3 Em", "3 C"]);
  assert.deepEqual(names({ capo: 1 }), ["1 A", "1 E", "1 F#m", "1 D"]);
  const told = song.fingeringsJson({ highestCapo: 4 });
  assert.deepEqual([told.Capos.length, told.Capos[0].Capo, told.Chords.length], [5, 3, 4]);
  const grids = brindle.fingerings("F");
  assert.notEqual(grids.svg("F", { leftHanded: true }), grids.svg("F"));
  assert.ok(grids.svg("F", { dots: "notes" }).includes(">A<"));
});

test("fingerings are found, named and drawn", () => {
  const found = brindle.fingerings("Am7");
  assert.ok(found.length > 0 && [...found].every(({ frets }) => frets.length === 6));
  const [fingering] = brindle.fingeringsOf("x32010").list;
  assert.deepEqual([fingering.name, fingering.pitches], ["C", [-1, 60, 64, 67, 72, 76]]);
  assert.match(found.svg("Am7"), /<svg/);
  assert.equal(found.json().Grids?.length ?? found.json().length, found.length);
});

test("a model learns, writes itself, and generates the same by the same seed", () => {
  const model = brindle.markov(2).learn(brindle.read("C F G7 C | Am Dm G7 C | F G7 C C"));
  const again = brindle.markov(model.toText());
  assert.equal(again.symbolCount, model.symbolCount);
  const options = { beats: 8, seed: 2n ** 40n + 7n };
  assert.equal(again.generate(options), model.generate(options));
  assert.ok(brindle.read(model.generate(options)).chords.length > 0);
});
