// With the keyboard alone, with a screen reader, on small screens and at large sizes.

import assert from "node:assert/strict";
import { readFileSync } from "node:fs";
import { createRequire } from "node:module";
import { after, before, test } from "node:test";
import { openBrowser, Page } from "./browser.mjs";

const axe = readFileSync(createRequire(import.meta.url).resolve("axe-core/axe.min.js"), "utf8");
const song = "Tune\nby Me\n\n[Verse]\n|: Dm7 | Db7 | Cmaj7 | Xx E7 [1 Am :| [2 A7 |\n[Bridge]\nBbm7 | Eb7 | Abmaj7 | G7";

let browser;
before(async () => (browser = await openBrowser()));
after(() => browser.close());

for (const colorScheme of ["light", "dark"]) {
  for (const viewport of [{ width: 390, height: 844 }, { width: 1400, height: 900 }]) {
    test(`A checker of access finds nothing: ${colorScheme}, ${viewport.width} pixels`, async () => {
      // The checker is put into the page from outside, which its policy would forbid.
      const opened = await Page.open(browser, { colorScheme, viewport, bypassCSP: true });
      await opened.type(song, 11);
      await opened.page.click("[data-chord='0']");
      await opened.page.waitForSelector(".next button");
      await opened.page.evaluate(axe);
      const { violations } = await opened.page.evaluate(() => window.axe.run());
      const found = violations.map(({ id, impact, nodes }) => `${impact} ${id}: ${nodes.map(({ html }) => html).slice(0, 3).join(" ")}`);
      assert.deepEqual(found, []);
      await opened.close();
    });
  }
}

for (const [name, options] of [
  ["a phone", { viewport: { width: 390, height: 844 }, isMobile: true, hasTouch: true }],
  ["a narrow phone", { viewport: { width: 320, height: 568 } }],
  ["200 %", { viewport: { width: 640, height: 450 }, deviceScaleFactor: 2 }],
]) {
  test(`Nothing is wider than the screen: ${name}`, async () => {
    const opened = await Page.open(browser, options);
    await opened.type(song, 11);
    await opened.page.click("[data-chord='2']");
    await opened.page.waitForSelector(".next button");
    const [wide, screen] = await opened.page.evaluate(() => [document.documentElement.scrollWidth, document.documentElement.clientWidth]);
    assert.ok(wide <= screen, `${wide} pixels on a screen of ${screen}`);
    await opened.close();
  });
}

test("The sheet is walked, opened and left with the keyboard alone", async () => {
  const opened = await Page.open(browser);
  const { page } = opened;
  await opened.type("Dm7 | G7 | C | Am", 4);
  const focused = () => page.evaluate(() => document.activeElement?.dataset.chord ?? null);
  for (let i = 0; i < 30 && (await focused()) === null; ++i) await page.keyboard.press("Tab");
  assert.equal(await focused(), "0");
  await page.keyboard.press("ArrowRight");
  await page.keyboard.press("ArrowRight");
  assert.equal(await focused(), "2");
  await page.keyboard.press("Enter");
  await page.waitForSelector(".chord-panel");
  assert.equal(await page.textContent(".sentence"), "C is the tonic of C major: I");
  await page.keyboard.press("Escape");
  await page.waitForSelector(".chord-panel", { state: "detached" });
  assert.equal(await focused(), "2");
  await page.keyboard.press("End");
  assert.equal(await focused(), "3");
  await opened.close();
});

test("A screen reader hears of each chord its bar, its numeral and its key", async () => {
  const opened = await Page.open(browser);
  await opened.type("Dm7 | G7 | C | C", 4);
  const names = await opened.page.locator("[data-chord]").evaluateAll((chords) => chords.map((chord) => chord.ariaLabel));
  assert.equal(names[1], "Bar 2: G7, V7 in C major");
  assert.equal(await opened.page.getByRole("article", { name: "Lead sheet" }).count(), 1);
  await opened.page.getByRole("button", { name: names[1] }).click();
  await opened.page.getByRole("complementary", { name: "Chord G7" }).waitFor();
  await opened.close();
});
