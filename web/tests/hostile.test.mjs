// Hostile links and files do nothing bad, and the page goes on working.

import assert from "node:assert/strict";
import { deflateRawSync } from "node:zlib";
import { after, before, test } from "node:test";
import { openBrowser, Page } from "./browser.mjs";

let browser;
before(async () => (browser = await openBrowser()));
after(() => browser.close());

const script = `<img src=x onerror="window.pwned=1"><script>window.pwned=1</script>`;

function linkOf(value) {
  return `#song=${deflateRawSync(Buffer.from(JSON.stringify(value))).toString("base64url")}`;
}

function scoreWith(title) {
  const shown = title.replaceAll("&", "&amp;").replaceAll("<", "&lt;");
  return `<?xml version="1.0"?><score-partwise version="4.0"><work><work-title>${shown}</work-title></work>
<part-list><score-part id="P1"><part-name>${shown}</part-name></score-part></part-list><part id="P1"><measure number="1">
<attributes><divisions>1</divisions><time><beats>4</beats><beat-type>4</beat-type></time></attributes>
<harmony><root><root-step>C</root-step></root><kind>major</kind></harmony>
<note><pitch><step>C</step><octave>4</octave></pitch><duration>4</duration></note></measure></part></score-partwise>`;
}

const entities = `<?xml version="1.0"?><!DOCTYPE x [<!ENTITY a "${"a".repeat(50)}">${"bcdefgh"
  .split("")
  .map((name, i) => `<!ENTITY ${name} "${`&${"abcdefg"[i]};`.repeat(50)}">`)
  .join("")}<!ENTITY f SYSTEM "file:///etc/passwd">]><score-partwise>&h;&f;</score-partwise>`;

/** The page still reads a song. */
async function works(opened) {
  if (await opened.page.locator("#song").count()) return opened.type("C | F | G7 | C", 4);
  await opened.drop("good.txt", "C | F | G7 | C");
  await opened.page.waitForSelector("#song");
  return opened.shows(4);
}

for (const [name, hash] of [
  ["a script for a title", linkOf({ text: `{title: ${script}}\n[C]a [F]b`, names: "typed", tempo: 120 })],
  ["a script for names", linkOf({ text: "C | F", names: script, tempo: script })],
  ["a tempo out of range", linkOf({ text: "C | F", names: "typed", tempo: 1e9 })],
  ["no song", linkOf([null, { text: { length: 3 } }])],
  ["a text that unfolds to 100 MB", linkOf({ text: "C ".repeat(50_000_000) })],
  ["10 MB of address", `#song=${"A".repeat(1_900_000)}`],
  ["broken bytes", "#song=%%%\u0000--__!"],
]) {
  test(`A link with ${name}`, async () => {
    const opened = await Page.open(browser, { hash });
    await works(opened);
    await opened.close();
  });
}

const noise = Buffer.from(Array.from({ length: 200_000 }, (_, i) => (i * i * 31 + 7 * i) & 0xff));
for (const [name, file, bytes] of [
  ["a script for its title", "evil.musicxml", scoreWith(script)],
  ["10 MB of chords", "long.txt", "C | F | G7 | ".repeat(800_000)],
  ["10 MB of a score", "long.musicxml", scoreWith("x".repeat(10_000_000))],
  ["25 MB", "huge.xml", Buffer.alloc(25_000_000, 60)],
  ["broken bytes", "broken.mxl", Buffer.concat([Buffer.from("PK\x03\x04"), noise])],
  ["no text", "noise.txt", noise],
  ["entities without end", "bomb.xml", entities],
  ["half a score", "half.musicxml", scoreWith("Half").slice(0, 400)],
  ["nothing", "empty.musicxml", ""],
]) {
  test(`A file with ${name}`, async () => {
    const opened = await Page.open(browser);
    await opened.page.waitForSelector("[data-chord]");
    await opened.drop(file, bytes);
    await opened.page.waitForFunction(() => document.querySelector(".message").textContent || document.querySelector(".score-note"));
    await works(opened);
    await opened.close();
  });
}

test("A script in a song is shown as it is typed", async () => {
  const opened = await Page.open(browser);
  await opened.type(`{title: ${script}}\n{artist: ${script}}\n{start_of_verse: ${script}}\n[C]a [F]b [G7]c [C]d`, 4);
  assert.equal(await opened.page.textContent(".title"), script);
  const { bytes } = await opened.saves("SVG");
  assert.doesNotMatch(bytes.toString(), /<script|<img/);
  await opened.close();
});
