import { chordOfSymbol, readingFlags, type Chord, type ChordReading } from "./Chord.js";
import { BrindleError } from "./errors.js";
import {
  findFingerings,
  fingeringOfFrets,
  searchFingerings,
  type FingeringOptions,
  type Fingerings,
  type SearchOptions,
} from "./Fingerings.js";
import type { ImportLineJson } from "./generated/schemas.js";
import { markovOf, type Markov } from "./Markov.js";
import { namesOfNotes, type NamedChord, type NamingOptions } from "./names.js";
import type { Native } from "./Native.js";
import { NextAsker, type NextChords, type NextOptions } from "./next.js";
import { songModelOf, type SongModel } from "./SongModel.js";
import { readSong, type ReadOptions, type Song } from "./Song.js";
import { keyOf, rawKeyOfText, scaleOf, type Key, type Scale } from "./values.js";

const usualOrder = 4;

/** A piece of a text in one size: text, size in em, base line above that of the whole in em. */
export type TextRun = [text: string, size: number, raise: number];

/** The library; load() gives it. */
export class Brindle {
  readonly #native: Native;
  readonly #next: NextAsker;
  #grids = 0;

  /** @internal */
  constructor(native: Native) {
    this.#native = native;
    this.#next = new NextAsker(native);
  }

  get version(): string {
    return this.#native.text(this.#native.module._brindle_version!());
  }
  /** Reads a chord symbol as people write it: "F#m7/C#", "Co7", "Ab:min7/b3". */
  chord(symbol: string, how: ChordReading = {}): Chord {
    return chordOfSymbol(this.#native, symbol, readingFlags(how));
  }
  /** Reads "F# minor", "Bb", "am". */
  key(text: string): Key {
    return keyOf(this.#native, rawKeyOfText(this.#native, text))!;
  }
  /** Reads "D dorian", "Bb blues minor". */
  scale(text: string): Scale {
    return scaleOf(this.#native, text);
  }
  /** Names notes, MIDI numbers of 0 to 127, the likeliest name first. */
  name(notes: number[], options: NamingOptions = {}): NamedChord[] {
    return namesOfNotes(this.#native, notes, options);
  }
  /** Reads a song in any form; throws a SongError with its faults, unless the reading is lenient. */
  read(source: string | Uint8Array, options: ReadOptions = {}): Song {
    return readSong(this.#native, source, options);
  }
  /** Reads a score in MusicXML, plain or compressed; anything else is an error. */
  readScore(bytes: Uint8Array, options: ReadOptions = {}): Song {
    const song = this.read(bytes, options);
    const { format } = song;
    if (format.endsWith("musicxml")) return song;
    song.free();
    throw new BrindleError("input", `this is no score but looks like ${format}`);
  }
  /** The fingerings of a chord symbol, the best first. */
  fingerings(symbol: string, options: FingeringOptions = {}): Fingerings {
    return findFingerings(this.#native, this.#gridPackage(), symbol, options);
  }
  /** The same without those that come with the library, as a hand and its player allow. */
  searchFingerings(symbol: string, options: SearchOptions = {}): Fingerings {
    return searchFingerings(this.#native, symbol, options);
  }
  /** The fingering that frets are, "x32010" or "x-10-12-12-11-10", with its name. */
  fingeringsOf(frets: string, options: FingeringOptions = {}): Fingerings {
    return fingeringOfFrets(this.#native, frets, options);
  }
  /** An empty model of chord sequences of an order, or the model of a text. */
  markov(from: string | number = usualOrder): Markov {
    return markovOf(this.#native, from);
  }
  /** A model that knows what may come next and writes songs: of the songs that come with the library,
   * of the text of a model file, or of songs. */
  songModel(from?: string | readonly Song[]): SongModel {
    return songModelOf(this.#native, from);
  }
  /** What may come behind chords, by the songs that come with the library. */
  next(chords: readonly (Chord | string)[], options: NextOptions = {}): NextChords {
    return this.#next.ask(chords, options);
  }
  /** How a lead sheet sets a chord symbol or a numeral, for pages that draw it themselves. */
  typeset(text: string, what: "symbol" | "numeral" = "symbol"): TextRun[] {
    const native = this.#native;
    const json = native.withText(text, (place) =>
      native.givenText((out) => native.module._brindle_text_runs_json!(place, what === "numeral" ? 1 : 0, out)),
    );
    return JSON.parse(json) as TextRun[];
  }
  /** All notes of a score as a Standard MIDI File. */
  scoreMidi(bytes: Uint8Array): Uint8Array {
    const native = this.#native;
    return native.withBytes(bytes, (place, length) =>
      native.givenBytes((out, size) => native.module._brindle_score_midi!(place, length, out, size)),
    );
  }
  /** What stands in a score, note by note. */
  scoreEvents(bytes: Uint8Array): ImportLineJson[] {
    const native = this.#native;
    const lines = native.withBytes(bytes, (place, length) =>
      native.givenText((out) => native.module._brindle_score_json_lines!(place, length, out)),
    );
    return lines.split("\n").filter(Boolean).map((line) => JSON.parse(line) as ImportLineJson);
  }

  /** The fingerings that come with the library. */
  #gridPackage(): number {
    const native = this.#native;
    if (this.#grids === 0) {
      this.#grids = native.givenHandle((out) => native.module._brindle_grid_package_read!(0, out));
    }
    return this.#grids;
  }
}
