// node song.mjs "Dm7 G7 | C": what each chord of a song does. The package is built by ./test.sh js.
import { load } from "../../js/dist/index.js";

const brindle = await load();
const text = process.argv[2] ?? "Dm7 G7 | C . E7 . | Am . . .";
try {
  const analysis = brindle.read(text).analyse({ explain: true });
  console.log(`${analysis.key?.name ?? "no key"}`);
  for (const { symbol, numeral, explanation } of analysis.chords) {
    console.log(`${symbol.padEnd(8)} ${numeral.padEnd(8)} ${explanation}`);
  }
} catch (error) {
  console.error(`${error.line ?? 0}:${error.column ?? error.position}: ${error.text ?? error}`);
  process.exitCode = 1;
}
