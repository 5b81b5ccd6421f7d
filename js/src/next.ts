import { Chord, chordOfSymbol, chordSize, putChord } from "./Chord.js";
import type { MarkovNextJson } from "./generated/schemas.js";
import type { Native } from "./Native.js";
import { Record } from "./Record.js";
import { keyOf, putKey, rawKeyOfText, type Key } from "./values.js";

/** What is asked of the next chord. */
export interface NextOptions {
  /** In which the chords are; found if it is not said. */
  key?: string;
  /** Most chords that are wanted; 10 if it is not said. */
  count?: number;
  /** Where it begins: in which of four bars, in the middle of one, or elsewhere. */
  place?: 1 | 2 | 3 | 4 | "middle" | "weak";
  /** Most chords before that are looked at, 1 to 5; 5 if it is not said. */
  order?: number;
  /** Of the songs that come with the library: "Hymn", "Blues". */
  style?: string;
}

/** A chord that may come next. */
export interface NextChord {
  symbol: string;
  chord: Chord;
  /** Of all chords that may come, 0 to 1. */
  probability: number;
  numeral: string;
  function: string;
}

/** What may come, the likeliest first, and the key in which that is said. */
export interface NextChords {
  key: Key | null;
  chords: NextChord[];
}

function placeCode(place: NextOptions["place"] = 1): number {
  if (place === "middle") return 4;
  return place === "weak" ? 5 : place - 1;
}

const optionsSize = 24;

/** What may come behind chords by the model of a handle. */
export function nextChords(
  native: Native,
  model: number,
  chords: readonly (Chord | string)[],
  options: NextOptions,
): NextChords {
  const key = rawKeyOfText(native, options.key);
  const known = chords.map((c) => (typeof c === "string" ? chordOfSymbol(native, c, 0) : c));
  const json = native.withRoom(optionsSize + chordSize * known.length, (place) => {
    putKey(new Record(native, place), key)
      .putInt(options.count ?? 10)
      .putInt(placeCode(options.place))
      .putInt(options.order ?? 5);
    const at = place + optionsSize;
    const list = new Record(native, at);
    for (const chord of known) putChord(list, chord.raw);
    const ask = native.module._brindle_song_model_next_json!;
    return native.givenText((out) => ask(model, at, known.length, place, out));
  });
  return told(native, JSON.parse(json) as MarkovNextJson);
}

function told(native: Native, json: MarkovNextJson): NextChords {
  return {
    key: json.Key === "" ? null : keyOf(native, rawKeyOfText(native, json.Key)),
    chords: json.Chords.map((next) => ({
      symbol: next.Symbol,
      chord: chordOfSymbol(native, next.Symbol, 0),
      probability: next.Probability,
      numeral: next.Numeral,
      function: next.Function,
    })),
  };
}

/** Asks models of the built-in songs, each of which is made once. */
export class NextAsker {
  readonly #models = new Map<string, number>();

  constructor(private readonly native: Native) {}

  ask(chords: readonly (Chord | string)[], options: NextOptions): NextChords {
    return nextChords(this.native, this.#model(options.style ?? ""), chords, options);
  }

  #model(style: string): number {
    const { native } = this;
    let model = this.#models.get(style);
    if (model === undefined) {
      model = native.withText(style, (place) =>
        native.givenHandle((out) => native.module._brindle_song_model_built_in!(place, out)),
      );
      this.#models.set(style, model);
    }
    return model;
  }
}
