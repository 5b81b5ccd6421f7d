// What a musician does on the page, in a real browser.

import assert from "node:assert/strict";
import { readFileSync } from "node:fs";
import { after, before, test } from "node:test";
import { openBrowser, Page } from "./browser.mjs";

const example = (path) => readFileSync(new URL(`../../examples/${path}`, import.meta.url));

let browser;
before(async () => (browser = await openBrowser()));
after(() => browser.close());

/** A test on a page of its own, which has to stay free of errors. */
function onPage(name, options, act) {
  test(name, async () => {
    const opened = await Page.open(browser, options);
    await act(opened, opened.page);
    await opened.close();
  });
}

onPage("A typed song has its numerals, keys, arrows and brackets", {}, async (opened, page) => {
  await opened.type("Dm7 | G7 | Cmaj7 | A7 | Dm7 | Db7 | Cmaj7 | Bb7", 8);
  assert.deepEqual(await opened.symbols(), ["Dm7", "G7", "Cmaj7", "A7", "Dm7", "D\u266D7", "Cmaj7", "B\u266D7"]);
  assert.deepEqual((await opened.numerals()).slice(0, 7), ["ii7", "V7", "Imaj7", "V7/ii", "ii7", "subV7/I", "Imaj7"]);
  assert.match(await page.textContent(".key-of-song"), /in C major/);
  assert.deepEqual(await opened.texts(".key"), ["C major"]);
  // G7 to C; A7 to Dm7 over the end of the line, in two pieces; Db7 to C.
  assert.equal(await page.locator(".music .link[marker-end]").count(), 3);
  assert.equal(await page.locator(".music .link[marker-end].dotted").count(), 1);
  // Under Dm7 G7, and a dotted one under Dm7 Db7.
  assert.equal(await page.locator(".music .link:not([marker-end]):not(.dotted)").count(), 2);
  assert.equal(await page.locator(".line").count(), 2);
});

onPage("A song has its title, parts, repeats and endings", {}, async (opened, page) => {
  await opened.type("Down the Line\nby Some Body\n\n[Verse]\n|: C | F | G7 [1 C :| [2 Am |", 5);
  assert.equal(await page.textContent(".title"), "Down the Line");
  assert.equal(await page.title(), "Down the Line \u2013 Brindle");
  assert.match(await page.textContent(".makers"), /Some Body/);
  assert.deepEqual(await opened.texts(".ending-number"), ["1.", "2."]);
  assert.equal(await page.locator(".begins-repeat").count(), 1);
  assert.equal(await page.locator(".ends-repeat").count(), 1);
});

onPage("What is wrong is underlined where it is, and the rest is read", {}, async (opened, page) => {
  await opened.type("C | Xyz9 F |\nG7 | C", 5);
  assert.deepEqual(await opened.numerals(), ["I", "", "IV", "V7", "I"]);
  assert.deepEqual(await opened.texts(".marks mark"), ["Xyz9"]);
  const fault = page.locator(".faults button").first();
  assert.match(await fault.textContent(), /Line 1.*Xyz9/);
  await fault.click();
  const selected = await page.$eval("#song", (area) => area.value.slice(area.selectionStart, area.selectionEnd));
  assert.equal(selected, "Xyz9");
});

for (const [form, text, symbols] of [
  ["ChordPro", "{title: Grace}\nA[G]mazing [C]grace how [D7]sweet the [G]sound", ["G", "C", "D7", "G"]],
  ["chords above lyrics", "Title\nby Me\n\n[Verse]\nG        D7     G\nA line of song here", ["G", "D7", "G"]],
  ["a link with a chart", "irealbook://Tune=Me=Swing=C=n={*AT44C^7 |A-7 |D-7 |G7 }", ["C^7", "A-7", "D-7", "G7"]],
]) {
  onPage(`A song comes as ${form}`, {}, async (opened) => {
    await opened.type(text, symbols.length);
    assert.deepEqual((await opened.symbols()).map((symbol) => symbol.replace("\u25B3", "^").replace("\u2212", "-")), symbols);
  });
}

for (const [form, text, bars, parts] of [
  ["lyrics", "{time: 6/8}\n[Em]Oh [D]when [C]down\n{soc}\n[G]Sing [D]sing\n{eoc}", ["Em", "D", "C", "G", "D"], { 3: "Chorus" }],
  ["chords alone", "Dm7 G7 C", ["Dm7", "G7", "C"], {}],
  ["beats", "Dm7 . G7 . C . . .", ["Dm7G7", "C"], {}],
  ["bars", "Dm7 G7 | C", ["Dm7G7", "C"], {}],
]) {
  onPage(`Where nothing tells the time a chord has a bar: ${form}`, {}, async (opened, page) => {
    await opened.type(text, bars.join("").match(/[A-G]/g).length);
    const shown = await page.locator(".bar").evaluateAll((all) => all.map((bar) => [[...bar.querySelectorAll(".symbol")].map(({ textContent }) => textContent).join(""), bar.querySelector(".part")?.textContent]));
    assert.deepEqual(shown, bars.map((symbols, i) => [symbols, parts[i]]));
  });
}

/** A chart as such links hold it: of each block of fifty characters the ends are swapped. */
function scrambled(chart) {
  const text = [...chart];
  for (let begin = 0; begin + 52 <= text.length; begin += 50) {
    for (const i of [0, 1, 2, 3, 4, ...Array.from({ length: 14 }, (_, at) => 10 + at)]) {
      [text[begin + i], text[begin + 49 - i]] = [text[begin + 49 - i], text[begin + i]];
    }
  }
  return text.join("");
}

onPage("A scrambled link is a chart with its parts, endings, tempo and style", {}, async (opened, page) => {
  const chart = "*A{T44C^7   |A-7 D7  |D-7 G7  |N1E-7 A7  }            |N2C6   Z";
  const song = `Two Ends=Writer Some==Medium Swing=C==1r34LbKcu7${scrambled(chart)}==140=1`;
  await opened.type(`irealb://${encodeURIComponent(song)}`, 8);
  assert.equal(await page.textContent(".title"), "Two Ends");
  assert.equal(await page.textContent(".makers"), "Medium Swing, \u2669 = 140Writer Some");
  assert.deepEqual(await opened.symbols(), ["C\u25B37", "A\u22127", "D7", "D\u22127", "G7", "E\u22127", "A7", "C6"]);
  assert.deepEqual((await opened.numerals()).slice(0, 5), ["Imaj7", "vi7", "V7/V", "ii7", "V7"]);
  assert.deepEqual(await opened.texts(".ending-number"), ["1.", "2."]);
  assert.deepEqual(await opened.texts(".part"), ["A"]);
  assert.equal(await page.inputValue(".tempo input"), "140");
  const { bytes } = await opened.saves("ChordPro");
  assert.match(bytes.toString(), /Two Ends/);
});

onPage("A chord is explained, on a piano and as fingerings", {}, async (opened, page) => {
  await opened.type("Am | E7 | Am | Am7", 4);
  await page.click("[data-chord='1']");
  assert.equal(await page.textContent(".sentence"), "E7 is the dominant of A minor, which follows: V7");
  assert.equal(await page.locator(".piano").getAttribute("aria-label"), "Piano: E, G\u266F, B, D");
  assert.equal(await page.locator(".piano .down").count(), 4);
  await page.locator(".grid").nth(1).waitFor();
  await page.click("[data-chord='3']");
  await page.waitForSelector(".grid[aria-label='Frets x 0 2 0 1 0']");
});

onPage("Fingerings are those of the instrument, its tuning and a capo, and there are more", {}, async (opened, page) => {
  await opened.type("C | F | C | C", 4);
  await page.click("[data-chord='0']");
  const shows = (frets) => page.waitForFunction((label) => document.querySelector(".grid")?.ariaLabel === label, `Frets ${frets}`);
  await shows("x 3 2 0 1 0");
  await page.getByRole("button", { name: "more" }).click();
  const frets = await page.locator(".grid").evaluateAll((grids) => grids.map((grid) => grid.ariaLabel));
  assert.ok(frets.length > 8 && new Set(frets).size === frets.length, frets.join("\n"));
  assert.ok(frets.includes("Frets x 3 5 5 5 3"));
  await page.getByLabel("Capo").selectOption("5");
  await shows("3 2 0 0 0 3");
  await page.getByLabel("Capo").selectOption("0");
  await page.getByLabel("Instrument").selectOption("ukulele");
  await shows("0 0 0 3");
  await page.getByLabel("Instrument").selectOption("other");
  await page.fill(".hand input", "DGBX");
  await page.press(".hand input", "Tab");
  await page.locator(".chord-panel").getByRole("alert").waitFor();
  await page.fill(".hand input", "DGBE");
  await page.press(".hand input", "Tab");
  await shows("2 0 1 0");
  // What one plays on stays chosen.
  await page.click("[data-chord='1']");
  await shows("3 2 1 1");
});

onPage("What could come next is ranked, and one is inserted behind its chord", {}, async (opened, page) => {
  await opened.type("Dm7 . G7 . | C . . . | F | C", 5);
  await page.click("[data-chord='1']");
  await page.waitForSelector(".next button");
  const names = await page.locator(".next button").evaluateAll((buttons) => buttons.map((button) => button.ariaLabel));
  assert.ok(names.length >= 5);
  assert.match(names[0], /^Insert C, I, tonic, \d+ %$/);
  const percents = names.map((name) => (name.includes("<") ? 0 : Number(/(\d+) %/.exec(name)[1])));
  assert.deepEqual(percents, [...percents].sort((a, b) => b - a));
  assert.equal(await page.textContent(".next h3"), "What could come next, in C major");
  // Figures are raised as on the sheet.
  const raised = page.locator(".next-numeral .run", { hasText: /^7/ }).first();
  assert.ok((await raised.evaluate((run) => parseFloat(getComputedStyle(run).verticalAlign))) > 0);
  await page.locator(".next button").first().click();
  await opened.shows(6);
  assert.deepEqual((await opened.symbols()).slice(0, 4), ["Dm7", "G7", "C", "C"]);
  await page.click(".undo");
  await opened.shows(5);
});

onPage("What could come next is told in the key of the passage, not in one that it hints at", {}, async (opened, page) => {
  await opened.type("C | A7 | Dm | G7 | C", 5);
  await page.click("[data-chord='1']");
  assert.equal(await page.textContent(".sentence"), "A7 is the dominant of D minor, which follows: V7/ii");
  await page.waitForSelector(".next button");
  const told = await page.locator(".next button").evaluateAll((buttons) => buttons.map((button) => button.ariaLabel.split(", ").slice(0, 3)));
  assert.deepEqual(told.find(([insert]) => insert === "Insert Dm"), ["Insert Dm", "ii", "subdominant"]);
});

for (const [names, symbols] of [
  ["german", ["B7", "H7", "F#m", "Eb"]],
  ["solfege", ["Sib7", "Si7", "Fa#m", "Mib"]],
  ["nashville", ["b77", "77", "#4\u2212", "b3"]],
  ["roman", ["bVII7", "V7/iii", "#iv", "bIII"]],
]) {
  onPage(`Chords have other names: ${names}`, {}, async (opened, page) => {
    await opened.type("C | Bb7 | B7 | F#m | Eb | G7 | C", 7);
    await page.selectOption(".names select", names);
    await page.waitForFunction(() => document.querySelector("[data-chord='1'] .symbol").textContent !== "B\u266D7");
    const shown = (await opened.symbols()).slice(1, 5).map((text) => text.replaceAll("\u266D", "b").replaceAll("\u266F", "#"));
    assert.deepEqual(shown, symbols);
  });
}

onPage("A song is transposed up, down and back to what was typed", {}, async (opened, page) => {
  const typed = "Tune\nby Me\n\n[A]\nDm7 . G7 . | Cmaj7 . . . | Am . E7 . | Am . . .";
  await opened.type(typed, 6);
  await page.click("[aria-label='Up a semitone']");
  await page.waitForFunction(() => document.querySelector(".key-of-song").textContent.includes("D\u266D major"));
  assert.deepEqual(await opened.symbols(), ["E\u266Dm7", "A\u266D7", "D\u266Dmaj7", "B\u266Dm", "F7", "B\u266Dm"]);
  assert.equal(await page.locator(".bar").count(), 4);
  await page.click("[aria-label='Down a semitone']");
  await page.waitForFunction((text) => document.querySelector("#song").value === text, typed);
});

for (const [form, typed, up] of [
  ["ChordPro", "{title: Grace}\n{key: G}\n{sov}\nA[G]mazing [C]grace how [D7/F#]sweet\n{eov}", "{title: Grace}\n{key: Ab}\n{sov}\nA[Ab]mazing [Db]grace how [Eb7/G]sweet\n{eov}"],
  ["chords above lyrics", "Grace\nby Me\n\n[A]\nA     D    E7  A\nA line of a song", "Grace\nby Me\n\n[A]\nBb    Eb   F7  Bb\nA line of a song"],
  ["chords in one word", "C-G | Am→F,\n[A] C - E7", "Db-Ab | Bbm→Gb,\n[A] Db - F7"],
  ["bars with signs", "|: Dm7 | % | G7 [1 C :| [2 C N.C. | // end", "|: Ebm7 | % | Ab7 [1 Db :| [2 Db N.C. | // end"],
]) {
  onPage(`A transposed song keeps its words and lay-out: ${form}`, {}, async (opened, page) => {
    await page.fill("#song", typed);
    await page.click("[aria-label='Up a semitone']:enabled");
    await page.waitForFunction((text) => document.querySelector("#song").value === text, up);
    assert.equal(await page.textContent(".transpose output"), "+1");
  });
}

onPage("Quick clicks are as many steps, and each is taken back and done again", {}, async (opened, page) => {
  await opened.type("C | F | G7 | C", 4);
  await page.evaluate(() => [1, 2, 3].forEach(() => document.querySelector("[aria-label='Down a semitone']").click()));
  const shows = (text, semitones) =>
    page.waitForFunction(
      (wanted) => document.querySelector("#song").value === wanted[0] && document.querySelector(".transpose output").textContent === wanted[1],
      [text, semitones],
    );
  await shows("A | D | E7 | A", "\u22123");
  await page.click(".undo");
  await shows("Bb | Eb | F7 | Bb", "\u22122");
  await page.click(".redo");
  await shows("A | D | E7 | A", "\u22123");
});

onPage("A song is not lost when another one is opened", {}, async (opened, page) => {
  const typed = "My own\nby Me\n\n[A]\nAm | E7";
  const isBack = () => page.waitForFunction((text) => document.querySelector("#song")?.value === text, typed);
  await opened.type(typed, 2);
  await page.selectOption(".examples", { label: "Amazing Grace" });
  await page.waitForFunction(() => document.querySelector(".title")?.textContent === "Amazing Grace");
  await page.click(".undo");
  await isBack();
  await opened.drop("dream.musicxml", example("scores/beautiful-dreamer.musicxml"));
  await page.waitForSelector(".score-note");
  await page.click(".undo");
  await isBack();
});

onPage("A broken link is told, and the song before it stays", {}, async (opened, page) => {
  await opened.type("Am | E7", 2);
  await page.evaluate(() => (location.hash = "#song=broken"));
  await page.getByText("This link is broken").waitFor();
  assert.equal(await page.inputValue("#song"), "Am | E7");
});

onPage("A dropped score is read and can be written as chords", {}, async (opened, page) => {
  await opened.drop("dream.musicxml", example("scores/beautiful-dreamer.musicxml"));
  await page.waitForFunction(() => document.querySelector(".title")?.textContent === "Beautiful Dreamer");
  assert.equal(await page.locator(".time").first().getAttribute("aria-label"), "3/4 time");
  const symbols = await opened.symbols();
  // Transposed it is a text; back in its key it is the score again, with its repeats.
  await page.click("[aria-label='Up a semitone']");
  await page.waitForSelector("#song");
  await page.click("[aria-label='Down a semitone']");
  await page.waitForSelector(".score-note");
  await page.waitForFunction((count) => document.querySelectorAll("[data-chord]").length === count, symbols.length);
  await page.getByRole("button", { name: "Write it as chords" }).click();
  await page.waitForSelector("#song");
  await page.waitForFunction(() => document.querySelectorAll("[data-chord]").length > 0);
  assert.ok(symbols.length > 10);
});

onPage("A song plays: notes are sent, the clock moves and the bar is lit", {}, async (opened, page) => {
  await opened.type("C . . . | F . . . | G7 . . . | C . . .", 4);
  await page.fill(".tempo input", "240");
  await page.getByRole("button", { name: "Play", exact: true }).click();
  await page.waitForFunction(() => document.querySelector(".clock").textContent === "counting in");
  await page.waitForFunction(() => document.querySelector(".clock").textContent === "bar 2 of 4");
  assert.equal(await page.locator(".bar.lit [data-chord]").getAttribute("data-chord"), "1");
  assert.ok((await page.evaluate(() => window.sent)) >= 6);
  await page.getByRole("button", { name: "Stop" }).click();
  await page.waitForFunction(() => document.querySelector(".clock").textContent === "");
  assert.equal(await page.locator(".bar.lit").count(), 0);
  const sent = await page.evaluate(() => window.sent);
  await page.waitForTimeout(500);
  assert.equal(await page.evaluate(() => window.sent), sent);
});

onPage("What waits for its sound does not play once another song is there", {}, async (opened, page) => {
  await opened.type("C . . . | F . . .", 2);
  let release;
  const held = new Promise((resolve) => (release = resolve));
  await opened.context.route("**/*.mp3", async (route) => (await held, route.continue()));
  await page.getByRole("button", { name: "Play", exact: true }).click();
  await page.getByRole("button", { name: "Loading" }).waitFor();
  await opened.type("Am | E7 | Am", 3);
  release();
  await page.getByRole("button", { name: "Play", exact: true }).waitFor();
  assert.equal(await page.evaluate(() => window.sent), 0);
});

onPage("A song is taken away as SVG, MIDI, JSON and ChordPro", {}, async (opened) => {
  await opened.type("My Tune\nby Me\n\n[A]\nDm7 | G7 | C | C", 4);
  const svg = await opened.saves("SVG");
  assert.equal(svg.name, "my-tune.svg");
  assert.match(svg.bytes.toString(), /^<svg[^]*My Tune[^]*<\/svg>\s*$/);
  assert.equal((await opened.saves("MIDI")).bytes.subarray(0, 4).toString(), "MThd");
  const json = JSON.parse((await opened.saves("JSON")).bytes.toString());
  assert.deepEqual(json.Reading.Chords.map(({ Numeral }) => Numeral), ["ii7", "V7", "I", "I"]);
  const chordPro = (await opened.saves("ChordPro")).bytes.toString();
  assert.match(chordPro, /\{title: ?My Tune\}/);
  await opened.type(chordPro, 4);
  assert.deepEqual(await opened.symbols(), ["Dm7", "G7", "C", "C"]);
});

onPage("A link holds the song, its names and tempo", {}, async (opened, page) => {
  const typed = "Tune & <more>\nby Me\n\n[A]\nDm7 | G7 | C | C";
  await opened.type(typed, 4);
  await page.selectOption(".names select", "german");
  await page.fill(".tempo input", "96");
  await page.press(".tempo input", "Tab");
  await page.getByRole("button", { name: "Link", exact: true }).click();
  await page.waitForFunction(() => location.hash.startsWith("#song="));
  const other = await Page.open(browser, { hash: new URL(page.url()).hash });
  await other.shows(4);
  assert.equal(await other.page.inputValue("#song"), typed);
  assert.equal(await other.page.inputValue(".names select"), "german");
  assert.equal(await other.page.inputValue(".tempo input"), "96");
  await other.close();
});

onPage("The page works without a network once it is loaded", {}, async (opened, page) => {
  await page.evaluate(() => navigator.serviceWorker.ready);
  await page.waitForFunction(() => navigator.serviceWorker.controller !== null);
  await opened.context.setOffline(true);
  await page.reload();
  await opened.type("Gm | D7 | Gm | Gm", 4);
  assert.deepEqual(await opened.numerals(), ["i", "V7", "i", "i"]);
  await page.getByRole("button", { name: "Play", exact: true }).click();
  await page.waitForFunction(() => window.sent > 0);
});
