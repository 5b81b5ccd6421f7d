import assert from "node:assert/strict";
import { test } from "node:test";
import { brindle, tableOf } from "./support.mjs";

test("chord symbols have the tones that the table of spellings tells", () => {
  const rows = tableOf("tests/data/chord-spellings.tsv");
  assert.ok(rows.length > 300);
  for (const { text, tones, "bass key": bass } of rows) {
    const chord = brindle.chord(text);
    assert.equal(chord.intervals.join(","), tones, text);
    assert.equal(String(chord.bass?.pitchClass ?? ""), bass, text);
  }
});

test("what a chord writes reads back as the same chord, in each style", () => {
  const symbols = ["C", "F#m7/C#", "Bbm7b5", "E7#9", "Abmaj9", "Gsus4", "Db/F", "B"];
  const styles = [
    [{}, {}],
    [{ naming: "german" }, { bIsBFlat: true }],
    [{ naming: "solfege" }, { solfege: true }],
    [{ unicode: true }, {}],
  ];
  for (const symbol of symbols) {
    const chord = brindle.chord(symbol);
    for (const [style, how] of styles) {
      assert.deepEqual(brindle.chord(chord.write(style), how).toJSON(), chord.toJSON());
    }
  }
  assert.equal(brindle.chord("B").write({ naming: "german" }), "H");
  assert.equal(brindle.chord("Bb").write({ unicode: true }), "B♭");
});

test("a chord has its spelled tones, and none where none sounds", () => {
  const chord = brindle.chord("F#m7/C#");
  assert.deepEqual(chord.tones.map((tone) => tone.name), ["F#", "A", "C#", "E"]);
  assert.deepEqual(chord.bass, { pitchClass: 1, accidental: 1, name: "C#" });
  assert.equal(brindle.chord("N.C.").root, null);
});

test("keys and scales", () => {
  const keys = [
    ["Bb", "Bb Major", -2],
    ["F# minor", "F# Minor", 3],
    ["am", "A Minor", 0],
  ];
  for (const [text, name, signature] of keys) {
    const key = brindle.key(text);
    assert.deepEqual([key.name, key.signature], [name, signature]);
  }
  const dorian = brindle.scale("D dorian");
  assert.equal(dorian.name, "D Dorian");
  assert.equal(dorian.tones.map((tone) => tone.name).join(" "), "D E F G A B C");
});

test("notes have the names that players give them", () => {
  assert.equal(brindle.name([60, 64, 67])[0].symbol, "C");
  assert.equal(brindle.name([64, 67, 69, 72], { key: "A minor", limit: 1 }).length, 1);
  assert.equal(brindle.name([52, 60, 67])[0].symbol, "C/E");
  assert.deepEqual(brindle.name([]), []);
});

test("symbols and numerals are set in pieces", () => {
  assert.deepEqual(brindle.typeset("Bb").map(([text]) => text), ["B", "\u266D"]);
  const [degree, figure, rest] = brindle.typeset("V7/ii", "numeral");
  assert.deepEqual([degree, rest], [["V", 1, 0], ["/", 1, 0]]);
  assert.ok(figure[0] === "7" && figure[1] < 1 && figure[2] > 0, `${figure}`);
});

test("errors tell their place", () => {
  const cases = [
    [() => brindle.chord("Hq7"), "input", 2],
    [() => brindle.chord(""), "input", 1],
    [() => brindle.key("quux"), "input", 1],
    [() => brindle.name([128]), "argument", 0],
    [() => brindle.chord("C\0"), "argument", 0],
    [() => brindle.fingerings("Am7", { tuning: "what" }), undefined, undefined],
    [() => brindle.markov("no model"), "input", undefined],
    [() => brindle.markov(65), "argument", 0],
  ];
  for (const [call, status, position] of cases) {
    assert.throws(call, (error) => {
      assert.equal(error.name, "BrindleError");
      assert.ok(error.text.length > 0 && error.message === error.text);
      if (status !== undefined) assert.equal(error.status, status, error.text);
      if (position !== undefined) assert.equal(error.position, position, error.text);
      return true;
    });
  }
});
