// The lead sheet as it lies on the screen: what stands where, and what touches nothing.

import assert from "node:assert/strict";
import { after, before, test } from "node:test";
import { openBrowser, Page } from "./browser.mjs";

let browser;
before(async () => (browser = await openBrowser()));
after(() => browser.close());

const endings = `Tune\n\n[Verse]\n|: Dm7 | G7 | Em7b5 A7 | Dm7 G7 [1 C6 A7 :| [2 C6 |\n[Bridge]\nD7 G7 | E7 | Am7 | D7 G7 |`;
const crowded = "Tune\n\n[A]\n|: C E7 | Am D7 | G7 C7 | F Bb7 [1 Em7b5 A7 | D7 G7 :| [2 Db7 | C |";

/** What of the sheet lies where, in pixels of the window. */
function places() {
  const boxOf = (element) => element.getBoundingClientRect().toJSON();
  return [...document.querySelectorAll(".line")].map((line) => ({
    box: boxOf(line),
    bars: [...line.children].map((bar) => ({ classes: bar.className, box: boxOf(bar.querySelector(".chords")) })),
    above: [...line.querySelectorAll(".above")].filter((above) => above.childNodes.length > 0 || above.parentElement.classList.contains("ending")).map(boxOf),
  }));
}

function arrows() {
  return [...document.querySelectorAll(".music .link[marker-end]")].map((arrow) => arrow.getBoundingClientRect().toJSON());
}

for (const [name, text, chords] of [["with endings", endings, 15], ["with many arrows", crowded, 14]]) {
  for (const width of [390, 900, 1400]) {
    test(`Arrows cross nothing that stands above the bars: a song ${name}, ${width} pixels`, async () => {
      const opened = await Page.open(browser, { viewport: { width, height: 900 } });
      await opened.type(text, chords);
      await opened.page.waitForTimeout(150);
      const lines = await opened.page.evaluate(places);
      const drawn = await opened.page.evaluate(arrows);
      assert.ok(drawn.length >= 6, `${drawn.length} arrows`);
      for (const arrow of drawn) {
        const line = lines.find(({ box }) => arrow.bottom > box.top && arrow.bottom <= box.bottom);
        assert.ok(line, "an arrow ends on its line");
        for (const above of line.above) assert.ok(arrow.top >= above.bottom - 1, `an arrow at ${arrow.top} above ${above.bottom}`);
        for (const { box } of line.bars) assert.ok(arrow.bottom <= box.top + 1, `an arrow down to ${arrow.bottom} in a bar from ${box.top}`);
      }
      await opened.close();
    });
  }
}

test("An arrow back ends at its repeat sign, and the other ending begins behind it", async () => {
  const opened = await Page.open(browser);
  await opened.type("|: C | F [1 G7 :| [2 C | F | C", 6);
  await opened.page.waitForTimeout(150);
  const [{ bars }] = await opened.page.evaluate(places);
  const sign = bars.find(({ classes }) => classes.includes("ends-repeat")).box;
  const back = (await opened.page.evaluate(arrows)).find(({ left }) => left > sign.left && left < sign.right);
  assert.ok(back.right <= sign.right + 1, `the arrow ends at ${back.right}, its bar at ${sign.right}`);
  await opened.close();
});

test("A bar is coloured from line to line, also beside signs and where its chord is late", async () => {
  const opened = await Page.open(browser);
  const { page } = opened;
  await opened.type("{title: T}\n{time: 3/4}\n{start_of_grid}\n|: C . . | . . G7 | C . . :|\n{end_of_grid}", 3);
  const bars = await page.$$eval(".bar", (all) =>
    all.map((bar) => {
      const band = bar.querySelector(".chords");
      const { left, width } = band.getBoundingClientRect();
      const lines = parseFloat(getComputedStyle(band).borderLeftWidth) + parseFloat(getComputedStyle(band).borderRightWidth);
      const parts = [...band.children].map((part) => ({ width: part.getBoundingClientRect().width, color: getComputedStyle(part).backgroundColor }));
      const symbol = bar.querySelector(".symbol").getBoundingClientRect().left - left;
      return { free: width - lines - parts.reduce((sum, part) => sum + part.width, 0), colors: new Set(parts.map(({ color }) => color)).size, at: symbol / width };
    }),
  );
  for (const { free, colors } of bars) assert.ok(Math.abs(free) < 1 && colors === 1, `${free} pixels bare, ${colors} colours`);
  // The chord of the third beat of three stands behind two thirds of its bar.
  assert.ok(bars[1].at > 0.6 && bars[1].at < 0.75, `${bars[1].at}`);
  await opened.close();
});

test("Equal neighbours in a bar are written once, and sound as one", async () => {
  const opened = await Page.open(browser);
  await opened.type("Tune\n\n[A]\nC C F F | F C C C", 4);
  assert.deepEqual(await opened.symbols(), ["C", "F", "F", "C"]);
  const shares = await opened.page.$$eval("[data-chord]", (chords) => chords.map((chord) => chord.style.flexGrow));
  assert.deepEqual(shares, ["2", "2", "1", "3"]);
  await opened.page.evaluate(() => {
    window.lit = [];
    const look = () => {
      const chord = document.querySelector(".chord.sounds")?.dataset.chord ?? null;
      if (chord !== window.lit.at(-1)) window.lit.push(chord);
      requestAnimationFrame(look);
    };
    look();
  });
  await opened.page.fill(".tempo input", "200");
  await opened.page.getByRole("button", { name: "Play", exact: true }).click();
  await opened.page.waitForFunction(() => window.lit.length > 2 && window.lit.at(-1) === null);
  assert.deepEqual(await opened.page.evaluate(() => window.lit), [null, "0", "2", "4", "5", null]);
  await opened.close();
});

test("A bar that is too full for the screen goes on below", async () => {
  const opened = await Page.open(browser, { viewport: { width: 390, height: 844 } });
  await opened.type("C Dm7 Em7 Fmaj7 G7sus4 Am7b5 Bm7b5 C6/9 | C", 9);
  const [wide, screen] = await opened.page.evaluate(() => [document.documentElement.scrollWidth, document.documentElement.clientWidth]);
  assert.ok(wide <= screen, `${wide} pixels on a screen of ${screen}`);
  const tops = await opened.page.$$eval("[data-chord]", (chords) => new Set(chords.slice(0, 8).map((chord) => chord.getBoundingClientRect().top)).size);
  assert.ok(tops > 1, "the chords of the bar stand in several rows");
  await opened.close();
});

test("A sheet is at no time wider than a phone, not even while it is laid out", async () => {
  const opened = await Page.open(browser, { viewport: { width: 390, height: 844 } });
  await opened.page.evaluate(() => {
    window.widest = 0;
    const look = () => {
      window.widest = Math.max(window.widest, document.documentElement.scrollWidth);
      requestAnimationFrame(look);
    };
    look();
  });
  await opened.type(endings, 15);
  await opened.page.click("[data-chord='2']");
  await opened.page.waitForSelector(".next button");
  await opened.page.setViewportSize({ width: 844, height: 390 });
  await opened.page.setViewportSize({ width: 390, height: 844 });
  await opened.page.evaluate(() => (window.widest = 0));
  await opened.page.waitForTimeout(300);
  assert.ok((await opened.page.evaluate(() => window.widest)) <= 390);
  await opened.close();
});

test("A song of 3,000 bars is read, shown in parts, walked and played", async () => {
  const opened = await Page.open(browser);
  const { page } = opened;
  await opened.type("Dm7 | G7 | Cmaj7 | A7 | ".repeat(750), 400);
  await page.getByRole("button", { name: "Show the other 2600 bars" }).click();
  await opened.shows(3000);
  assert.equal(await page.locator(".line").count(), 750);
  await page.focus("[data-chord='0']");
  await page.keyboard.press("End");
  await page.keyboard.press("Enter");
  await page.waitForSelector(".next button");
  assert.match(await page.textContent(".sentence"), /^A7 is the dominant/);
  await page.keyboard.press("Escape");
  await page.selectOption(".names select", "german");
  await page.waitForFunction(() => document.querySelectorAll("[data-chord]").length > 0);
  await page.getByRole("button", { name: "Play", exact: true }).click();
  await page.waitForFunction(() => document.querySelector(".clock").textContent === "bar 1 of 3000");
  await opened.close();
});

test("A library that cannot be fetched is told, and fetched again when the network is back", async () => {
  const opened = await Page.open(browser, { serviceWorkers: "block", without: "**/*.wasm" });
  const { page } = opened;
  await page.waitForFunction(() => document.querySelector(".message").textContent.startsWith("The library could not be loaded"));
  await opened.context.unroute("**/*.wasm");
  opened.wrong = opened.wrong.filter((text) => !/Failed to load resource/.test(text));
  await opened.type("C | G7 | C | C", 4);
  assert.equal(await page.textContent(".message"), "");
  await opened.close();
});

for (const width of [390, 1400]) {
  test(`On paper all bars are there, dark on white, with arrows where the chords are: from ${width} pixels`, async () => {
    const opened = await Page.open(browser, { colorScheme: "dark", viewport: { width, height: 900 } });
    const { page } = opened;
    await opened.type("Tune\n\n[A]\n" + "Dm7 | G7 | C | A7 |\n".repeat(110), 400);
    await page.evaluate(() => window.dispatchEvent(new Event("beforeprint")));
    // Paper is no wider than this, whatever the screen was.
    await page.setViewportSize({ width: 680, height: 1000 });
    await page.emulateMedia({ media: "print", colorScheme: "dark" });
    assert.equal(await page.locator(".bar").count(), 440);
    assert.equal(await page.evaluate(() => document.querySelectorAll(".line")[0].children.length), 4);
    const ink = await page.locator("[data-chord='0']").evaluate((chord) => getComputedStyle(chord).color);
    assert.equal(ink, "rgb(25, 24, 23)");
    assert.ok((await page.evaluate(() => document.documentElement.scrollWidth)) <= 680);
    const [{ right: head }] = await page.evaluate(arrows);
    const target = await page.locator("[data-chord='2'] .symbol").evaluate((symbol) => symbol.getBoundingClientRect().toJSON());
    assert.ok(head > target.left && head < target.right, `the arrow ends at ${head}`);
    await page.evaluate(() => window.dispatchEvent(new Event("afterprint")));
    await opened.shows(400);
    await opened.close();
  });
}
