// The parts of the page that need no browser, over more cases than a browser has time for.

import assert from "node:assert/strict";
import { after, before, test } from "node:test";
import { fileURLToPath } from "node:url";
import { createServer } from "vite";

let vite;
let units;
before(async () => {
  const root = fileURLToPath(new URL("..", import.meta.url));
  vite = await createServer({ root, configFile: false, appType: "custom", logLevel: "error", server: { middlewareMode: true, hmr: false, ws: false }, optimizeDeps: { noDiscovery: true } });
  const names = ["editor/faultMarks", "engine/Engine", "engine/insertChord", "engine/sentence", "player/midiNotes", "sheet/lines", "sheet/linkPaths", "song/files", "song/link", "song/save"];
  units = Object.assign({}, ...(await Promise.all(names.map((name) => vite.ssrLoadModule(`/src/${name}.ts`)))));
});
after(() => vite.close());

test("A fault is marked from its column to the end of its word, in characters", () => {
  const fault = (line, column) => ({ line, column, text: "", isNote: false });
  for (const [text, line, column, marked] of [
    ["C | Xyz | G", 1, 5, "Xyz"],
    ["C | Xyz | G", 1, 6, "Xyz"],
    ["C\nF Q|G", 2, 3, "Q"],
    ["\u{1D10B}\u{1D10B} Zz C", 1, 4, "Zz"],
    ["A[Q9]mazing", 1, 3, "Q9"],
    ["C", 0, 0, null],
    ["C", 7, 1, null],
    ["C  F", 1, 3, null],
  ]) {
    const place = units.placeOf(text, fault(line, column));
    assert.equal(place && text.slice(...place), marked, text);
  }
});

test("The marked pieces of a text are the whole text, whatever the faults", () => {
  const text = "C | Xyz Q\nZz | Q";
  const faults = [[2, 1], [1, 5], [1, 6], [9, 9], [0, 0], [2, 6]].map(([line, column]) => ({ line, column, text: "", isNote: false }));
  const pieces = units.markFaults(text, faults);
  assert.equal(pieces.map((piece) => piece.text).join(""), text);
  assert.deepEqual(pieces.filter(({ fault }) => fault !== null).map((piece) => piece.text), ["Xyz", "Zz", "Q"]);
});

test("A chord is put where a reader finds it, and nowhere else", () => {
  const read = (text) => text.split(/[\s|\[\].]+/).filter((word) => /^[A-G]/.test(word));
  for (const [text, index, changed] of [
    ["C . . . | F", 0, "C . X . | F".replace("X", "G7")],
    ["C | F | C", 1, "C | F G7 | C"],
    ["C | F | C", 2, "C | F | C | G7"],
    ["C | C | C", 1, "C | C G7 | C"],
    ["C | F |", 1, "C | F | G7"],
    ["a[C]b [F]c", 0, "a[C][G7]b [F]c"],
    ["Cm | C", 1, "Cm | C | G7"],
  ]) {
    assert.equal(units.insertChord(text, index, "G7", read), changed, text);
  }
  assert.equal(units.insertChord("C | F", 0, "G7", () => ["C", "F"]), null);
});

test("A link gives back any song, and nothing for what is none", async () => {
  for (const text of ["", "C | F", "\u266D \u{1F3B9} <b>&amp;", "Dm7 | ".repeat(20_000)]) {
    const song = { text, names: "roman", tempo: 88 };
    assert.deepEqual(await units.readLink(await units.writeLink(song)), song);
  }
  for (const hash of ["", "#", "#song=", "#song=AAAA", "#song=\u0000", "#other", `#song=${"A".repeat(200_000)}`]) {
    assert.equal(await units.readLink(hash), null, hash.slice(0, 20));
  }
  await assert.rejects(units.writeLink({ text: "C".repeat(units.longestText + 1), names: "typed", tempo: 120 }), /too long/);
  // No page writes this one: it unfolds to more than a song has.
  const packed = new Blob(["C".repeat(units.longestText + 1)]).stream().pipeThrough(new CompressionStream("deflate-raw"));
  const tooLong = Buffer.from(await new Response(packed).arrayBuffer()).toString("base64url");
  assert.equal(await units.readLink(`#song=${tooLong}`), null);
});

test("The notes of a MIDI file have the beats of their events", () => {
  const track = [
    [0, 0xff, 0x03, 2, 65, 66], // a name
    [0, 0x90, 60, 80], [0, 64, 70], // two notes, the second without a status of its own
    [0x83, 0x60, 0x80, 60, 0], // 480 ticks later
    [0x83, 0x60, 0x90, 64, 0], // an end written as a beginning without force
    [0, 0xc0, 5], [0, 0x91, 36, 90], [0x81, 0x70, 0x81, 36, 0],
    [0, 0xff, 0x2f, 0],
  ].flat();
  const bytes = Uint8Array.from([...Buffer.from("MThd"), 0, 0, 0, 6, 0, 1, 0, 1, 1, 0xe0, ...Buffer.from("MTrk"), 0, 0, 0, track.length, ...track]);
  assert.deepEqual(units.midiNotes(bytes), [
    { Position: 0, Length: 1, NoteNr: 60, Velocity: 80 },
    { Position: 0, Length: 2, NoteNr: 64, Velocity: 70 },
    { Position: 2, Length: 0.5, NoteNr: 36, Velocity: 90 },
  ]);
});

/** A sheet of bars with one chord each, of that many letters. */
function sheetOf(lengths, bars = {}) {
  const Chords = lengths.map((length) => ({ Runs: [["C".repeat(length), 1, 0]], NumeralRuns: [["I", 1, 0]] }));
  const Bars = lengths.map((_, i) => ({ Begin: i, End: i + 1, Held: null, Sign: null, Remark: "", ...bars[i] }));
  return { Chords, Bars };
}

test("Bars stand in lines of four, two or one, and a line ends before a part", () => {
  const plain = Array(10).fill(2);
  for (const [name, lengths, bars, width, lines] of [
    ["four", plain, {}, 800, [4, 4, 2]],
    ["two", plain.slice(0, 5), {}, 330, [2, 2, 1]],
    ["one", plain.slice(0, 3), {}, 200, [1, 1, 1]],
    ["a part", plain, { 3: { BeginsSection: true } }, 800, [3, 4, 3]],
    ["a coda", plain.slice(0, 6), { 5: { Sign: "coda" } }, 800, [4, 1, 1]],
    ["a segno, which stands where it stands", plain.slice(0, 6), { 1: { Sign: "segno" } }, 800, [4, 2]],
    ["a passage that is played again", plain.slice(0, 6), { 2: { Remark: "as bars 1 to 2" } }, 800, [2, 4]],
    ["an upbeat", plain.slice(0, 6), { 0: { IsUpbeat: true } }, 800, [5, 1]],
    ["a full line", [20, 20, 2, 2, 2], {}, 600, [1, 1, 2, 1]],
    ["a bar wider than all", [200, 2], {}, 600, [1, 1]],
  ]) {
    const sheet = sheetOf(lengths, bars);
    const broken = units.breakLines(sheet, sheet.Bars, { width, symbol: 27, numeral: 15 });
    assert.deepEqual(broken.map((line) => line.bars.length), lines, name);
    assert.deepEqual(broken.flatMap((line) => line.bars.map(({ index }) => index)), lengths.map((_, i) => i), name);
  }
});

test("Arrows have a piece on each line, a head at the end, and room above shorter ones", () => {
  const lines = [0, 100, 200].map((top) => ({ left: 10, right: 510, top: top + 40, bottom: top + 90 }));
  const place = (line, left) => ({ ...lines[line], line, left, right: left + 30, back: lines[line].right });
  const places = [place(0, 20), place(0, 200), { ...place(0, 300), back: 390 }, place(2, 20)];
  const paths = units.arrowPaths(
    [{ From: 0, To: 1, IsDotted: false }, { From: 0, To: 2, IsDotted: true }, { From: 2, To: 3, IsDotted: false }, { From: 2, To: null, IsDotted: false }, { From: 0, To: 9, IsDotted: false }],
    places,
    lines,
  );
  assert.deepEqual(paths.map(({ hasHead }) => hasHead), [true, true, false, false, true, true]);
  assert.deepEqual(paths.map(({ isDotted }) => isDotted), [false, true, false, false, false, false]);
  // The one that leads back ends at the repeat sign, not at the end of the line.
  const endOf = ({ d }) => d.match(/[\d.]+(?= [\d.]+$)/)[0];
  assert.deepEqual([...paths.slice(2, 3), ...paths.slice(4)].map(endOf), ["514", "28", "390"]);
  assert.deepEqual(paths.map(({ line }) => line), [0, 0, 0, 1, 2, 0]);
  const heights = paths.slice(0, 2).map(({ d }) => Math.min(...d.match(/-?[\d.]+ -?[\d.]+/g).map((pair) => Number(pair.split(" ")[1]))));
  assert.ok(heights[1] < heights[0], `${heights}`);
  assert.ok(paths.every(({ d }) => !d.includes("NaN")));
});

test("A bracket goes from a second to the end of its dominant, over lines if need be", () => {
  const lines = [0, 100].map((top) => ({ left: 10, right: 510, top, bottom: top + 50 }));
  const place = (line, left) => ({ ...lines[line], line, left, right: left + 30 });
  const places = [place(0, 20), place(0, 200), place(1, 20)];
  const paths = units.bracketPaths([{ From: 0, To: 1, IsDotted: false }, { From: 1, To: 2, IsDotted: true }], places, lines);
  assert.deepEqual(paths.map(({ d }) => d), ["M20 53v6H230v-6", "M200 53v6H514", "M2 159H50v-6"]);
});

test("A sentence has the numeral where it tells it, or behind it, and printed signs", () => {
  for (const [explanation, numeral, told] of [
    ["E7 is the dominant of A minor, which follows.", "V7/vi", "E7 is the dominant of A minor, which follows: *"],
    ["Fmaj7 is IV^7 in C major, with the function of a subdominant.", "IV^7", "Fmaj7 is * in C major, with the function of a subdominant."],
    ["Bb7 is the backdoor dominant of C major.", "bVII7", "B\u266D7 is the backdoor dominant of C major: *"],
    ["F#m7b5 is #ivh7 in Eb major, borrowed from Eb minor.", "#ivh7", "F\u266Fm7b5 is * in E\u266D major, borrowed from E\u266D minor."],
    ["C is I in C major.", "", "C is I in C major."],
    ["", "", ""],
  ]) {
    const { before, numeral: hasNumeral, after } = units.sentenceAround(explanation, numeral);
    assert.equal(before + (hasNumeral ? "*" : "") + after, told);
  }
  for (const [text, printed] of [
    ["Abm, Bbb, Dbmaj7/Ab", "A\u266Dm, B\u266D\u266D, D\u266Dmaj7/A\u266D"],
    ["before Ebdim and Gbsus4", "before E\u266Ddim and G\u266Dsus4"],
    ["Abbey, Bob, #1 and Cab", "Abbey, Bob, #1 and Cab"],
    ["bVII and #iv", "\u266DVII and \u266Fiv"],
  ]) {
    assert.equal(units.printedNames(text), printed);
  }
});

test("A worker that stops, is silent or does not load is replaced, and its calls are told why", async (context) => {
  const workers = [];
  class FakeWorker {
    calls = [];
    constructor() {
      workers.push(this);
    }
    postMessage(call) {
      this.calls.push(call);
    }
    terminate() {
      this.isGone = true;
    }
  }
  context.mock.timers.enable({ apis: ["setTimeout"] });
  Object.assign(globalThis, { Worker: FakeWorker, window: globalThis });
  const engine = new units.Engine();
  const answer = (worker, value) => worker.onmessage({ data: { id: worker.calls.shift().id, ...value } });

  const refused = engine.call("text", {});
  answer(workers[0], { error: "no song" });
  await assert.rejects(refused, { message: "no song" });
  assert.equal(workers.length, 1, "a song that cannot be read is no reason for a new worker");

  const both = [engine.call("text", {}), engine.call("notes", {})];
  answer(workers[0], { error: "out of memory", isFatal: true });
  for (const call of both) await assert.rejects(call, { message: "out of memory" });
  assert.ok(workers[0].isGone);

  const silent = engine.call("text", {});
  context.mock.timers.tick(20_001);
  await assert.rejects(silent, { message: "This takes too long." });
  const unloaded = engine.call("text", {});
  workers[2].onerror({ message: "" });
  await assert.rejects(unloaded, { message: "the library did not load" });

  const good = engine.call("text", {});
  answer(workers[3], { value: "C" });
  assert.equal(await good, "C");
  context.mock.timers.tick(60_000);
  assert.ok(!workers[3].isGone, "an answered call waits no more");
});

test("A file is a score or a text by what it holds, and is refused if neither", async () => {
  const kindOf = async (name, bytes) => (await units.readFile(new File([bytes], name))).kind;
  assert.equal(await kindOf("a.txt", "C | F"), "text");
  assert.equal(await kindOf("a.txt", "<?xml version='1.0'?><score-partwise/>"), "score");
  assert.equal(await kindOf("a.bin", Uint8Array.from([0x50, 0x4b, 3, 4])), "score");
  assert.equal(await kindOf("a.html", "<a href='irealb://x'>"), "text");
  for (const bytes of [Uint8Array.from([0xff, 0xfe, 0x41]), "a\0b", "C ".repeat(200_000), new Uint8Array(units.largestFile + 1)]) {
    await assert.rejects(kindOf("a.txt", bytes));
  }
});

test("A title makes a name of a file, whatever stands in it", () => {
  for (const [title, name] of [["After You've Gone", "after-you-ve-gone.svg"], ["../../etc/passwd", "etc-passwd.svg"], ["", "song.svg"], ["\u2028<>", "song.svg"], ["a".repeat(300), `${"a".repeat(60)}.svg`]]) {
    assert.equal(units.fileName(title, "svg"), name);
  }
});
