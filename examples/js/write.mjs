// node write.mjs [FORM [SEED]]: writes a song after hymns, and tells what may come behind it. The
// package is built by ./test.sh js.
import { load } from "../../js/dist/index.js";

const brindle = await load();
const [form = "AABA", seed = "1"] = process.argv.slice(2);
try {
  const model = brindle.songModel().ofStyle("hymn");
  const { song, text, quote } = model.writeSong({ key: "G", form, seed: BigInt(seed) });
  console.log(text);
  if (quote) console.log(`${quote.bars} bars from bar ${quote.bar} on stand in ${quote.title}`);
  const last = song.chords.slice(-2).map(({ chord }) => chord);
  for (const next of model.next(last, { key: "G", count: 3 }).chords) {
    console.log(`${next.symbol.padEnd(6)} ${next.numeral.padEnd(6)} ${next.probability.toFixed(2)}`);
  }
} catch (error) {
  console.error(error.text ?? `${error}`);
  process.exitCode = 1;
}
