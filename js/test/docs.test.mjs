import assert from "node:assert/strict";
import { execFileSync } from "node:child_process";
import { readFileSync } from "node:fs";
import { test } from "node:test";
import { brindle, root } from "./support.mjs";

const exports = readFileSync(`${root}js/exports.txt`, "utf8").trim().split("\n");

/** `expression; // => what it is`, a text as it is and anything else as JSON. */
function checked(line) {
  const found = /^(.*?);?\s*\/\/ => (.*)$/.exec(line);
  return found ? `check(${found[1]}, ${JSON.stringify(found[2])});` : line;
}

for (const page of ["README.md", "docs/javascript.md", "js/README.md"]) {
  test(`the examples of ${page} are true`, async () => {
    const blocks = [...readFileSync(root + page, "utf8").matchAll(/```js\n([^]*?)```/g)].map((m) => m[1]);
    const code = blocks.join("\n").split("\n").filter((line) => !/^import |await load\(/.test(line));
    assert.ok(code.some((line) => line.includes("// =>")));
    const check = (value, expected) =>
      assert.equal(typeof value === "string" ? value : JSON.stringify(value), expected);
    const AsyncFunction = (async () => {}).constructor;
    await new AsyncFunction("brindle", "check", code.map(checked).join("\n"))(brindle, check);
  });
}

test("the program of the README runs", () => {
  const shown = execFileSync(process.execPath, [`${root}examples/js/song.mjs`, "Dm7 G7 | C"], { encoding: "utf8" });
  assert.match(shown, /^C Major\nDm7 +ii7 .*\nG7 +V7 .*\nC +I /);
});

test("the functions that are exported are those that the header has", () => {
  const header = readFileSync(`${root}brindle/c/brindle.h`, "utf8");
  for (const name of exports) assert.match(header, new RegExp(`\\b${name}\\(`), name);
});
