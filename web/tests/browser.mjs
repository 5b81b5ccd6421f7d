// A real browser on the built page, as the tests drive it.

import assert from "node:assert/strict";
import { existsSync } from "node:fs";
import { chromium } from "playwright-core";
import { builtPage, serve } from "../serve.mjs";

const usual = ["/usr/bin/chromium", "/usr/bin/chromium-browser", "/usr/bin/google-chrome"];
const executablePath = process.env.BRINDLE_CHROMIUM ?? usual.find((path) => existsSync(path));

/** Counts in `window.sent` what is given to the sound; `window.pwned` is what hostile input would set. */
function watch() {
  window.sent = 0;
  const { start } = AudioBufferSourceNode.prototype;
  AudioBufferSourceNode.prototype.start = function (...args) {
    ++window.sent;
    return start.apply(this, args);
  };
}

/** A server and a browser for the tests of a file. */
export async function openBrowser() {
  const server = await serve(builtPage);
  const browser = await chromium.launch({
    executablePath,
    args: ["--no-sandbox", "--disable-dev-shm-usage", "--autoplay-policy=no-user-gesture-required"],
  });
  const address = `http://127.0.0.1:${server.address().port}/`;
  const close = async () => {
    await browser.close();
    server.closeAllConnections();
    server.close();
  };
  return { address, browser, close };
}

/** The song editor, the sheet and what else tests look at. */
export class Page {
  /** What went wrong without being asked for: errors, breaches of the policy, requests to others. */
  wrong = [];

  static async open({ address, browser }, { hash = "", without, ...options } = {}) {
    const context = await browser.newContext({ viewport: { width: 1280, height: 900 }, ...options });
    const opened = new Page();
    opened.context = context;
    opened.page = await context.newPage();
    opened.page.setDefaultTimeout(10_000);
    opened.page.on("pageerror", (error) => opened.wrong.push(error.message));
    opened.page.on("console", (message) => message.type() === "error" && opened.wrong.push(message.text()));
    context.on("request", (request) => {
      const isOwn = request.url().startsWith(address) || /^(blob|data):/.test(request.url());
      if (!isOwn) opened.wrong.push(`asked ${request.url()}`);
    });
    if (without) await context.route(without, (route) => route.abort());
    await opened.page.addInitScript(watch);
    await opened.page.goto(address + hash);
    await opened.page.waitForSelector("#song, .score-note");
    return opened;
  }

  /** Nothing went wrong on the way, and no input has run. */
  async close() {
    assert.equal(await this.page.evaluate(() => window.pwned), undefined);
    assert.deepEqual(this.wrong, []);
    await this.context.close();
  }

  /** Types a song and waits until the sheet shows that many chords. */
  async type(text, chords) {
    await this.page.fill("#song", text);
    await this.shows(chords);
  }

  async shows(chords) {
    await this.page.waitForFunction((count) => document.querySelectorAll("[data-chord]").length === count, chords);
  }

  texts(selector) {
    return this.page.$$eval(selector, (elements) => elements.map(({ textContent }) => textContent));
  }

  symbols() {
    return this.texts("[data-chord] .symbol");
  }

  numerals() {
    return this.texts("[data-chord] .numeral");
  }

  /** Drops a file on the page, as a hand does. */
  async drop(name, bytes) {
    const data = await this.page.evaluateHandle(
      ([fileName, text]) => {
        const transfer = new DataTransfer();
        transfer.items.add(new File([Uint8Array.from(atob(text), (c) => c.charCodeAt(0))], fileName));
        return transfer;
      },
      [name, Buffer.from(bytes).toString("base64")],
    );
    await this.page.dispatchEvent("body", "dragover", { dataTransfer: data });
    await this.page.dispatchEvent("body", "drop", { dataTransfer: data });
  }

  /** What a button saves. */
  async saves(button) {
    const [download] = await Promise.all([
      this.page.waitForEvent("download"),
      this.page.getByRole("button", { name: button, exact: true }).click(),
    ]);
    const parts = [];
    for await (const part of await download.createReadStream()) parts.push(part);
    return { name: download.suggestedFilename(), bytes: Buffer.concat(parts) };
  }
}
