import { Chord, readChord } from "./Chord.js";
import type { Native } from "./Native.js";
import { Record } from "./Record.js";
import { putKey, rawKeyOfText } from "./values.js";

/** What is known about some notes besides themselves. */
export interface NamingOptions {
  /** Of the piece: "A minor". */
  key?: string;
  /** Pitch class of the root before and behind, 0 to 11. */
  previousRoot?: number;
  nextRoot?: number;
  /** What the lowest note means: it is the bass ("usual"), only that, or nothing ("none"). */
  bass?: "usual" | "only" | "none";
  /** Most names that are wanted; 12 if it is not said. */
  limit?: number;
}

/** A name of some notes. */
export interface NamedChord {
  /** "Dm7/C" */
  symbol: string;
  /** The same with all that is left out: "C7(no5)". */
  exactSymbol: string;
  chord: Chord;
  /** How unusual the name is, in tenths of a bit. */
  cost: number;
}

const basses = ["usual", "only", "none"];
const optionsSize = 28;

function putOptions(native: Native, place: number, options: NamingOptions): void {
  const key = rawKeyOfText(native, options.key);
  putKey(new Record(native, place), key)
    .putInt(options.previousRoot ?? -1)
    .putInt(options.nextRoot ?? -1)
    .putInt(basses.indexOf(options.bass ?? "usual"))
    .putInt(options.limit ?? 12);
}

/** The names of notes, MIDI numbers, the likeliest first. */
export function namesOfNotes(native: Native, notes: number[], options: NamingOptions): NamedChord[] {
  const { module } = native;
  const names = native.withRoom(optionsSize + 4 * notes.length, (place) => {
    putOptions(native, place, options);
    const list = new Record(native, place + optionsSize);
    for (const note of notes) list.putInt(note);
    return native.givenHandle((out) =>
      module._brindle_names_of_notes!(place + optionsSize, notes.length, place, out),
    );
  });
  try {
    return Array.from({ length: module._brindle_names_count!(names) }, (_, index) => {
      native.check(module._brindle_names_get!(names, index, native.result));
      const record = new Record(native, native.result);
      return {
        symbol: record.text(),
        exactSymbol: record.text(),
        chord: new Chord(native, readChord(record)),
        cost: record.int(),
      };
    });
  } finally {
    module._brindle_names_free!(names);
  }
}
