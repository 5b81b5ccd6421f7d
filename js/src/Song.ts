import { analyse, type Analysis, type AnalyseOptions, type SheetOptions } from "./Analysis.js";
import { Chord, readChord, readingFlags, type ChordReading } from "./Chord.js";
import { SongError, type Fault } from "./errors.js";
import {
  songFingerings,
  songFingeringsJson,
  type Fingerings,
  type SongFingeringOptions,
} from "./Fingerings.js";
import type { GridsForJson } from "./generated/schemas.js";
import { Handle } from "./Handle.js";
import type { Native } from "./Native.js";
import { Record } from "./Record.js";
import { keyOf, putStyle, readKey, type Key, type Style } from "./values.js";

const formats = [
  "auto",
  "chord-text",
  "even-text",
  "chords-above-lyrics",
  "chord-pro",
  "chart",
  "chart-link",
  "chart-page",
  "chord-strings",
  "musicxml",
  "compressed-musicxml",
  "roman-text",
] as const;

/** The forms in which songs are written down. */
export type Format = (typeof formats)[number];

/** How a song is read. */
export interface ReadOptions extends ChordReading {
  /** Which form it has; "auto", the default, finds out. */
  format?: Format;
  /** Of a text that does not tell; 4 if it is not said. */
  beatsPerBar?: number;
  /** How far a chord moves on in such a text; 1 if it is not said. */
  beatsPerChord?: number;
  /** The chords of a bar without holds share it evenly. */
  even?: boolean;
  /** What is not understood is left out; faults are told in `faults` and never thrown. */
  lenient?: boolean;
}

/** A chord of a song where it sounds; position and length in beats. */
export interface SongChord {
  position: number;
  length: number;
  /** As it was written. */
  symbol: string;
  chord: Chord;
}

/** A bar as it is played; one that is played twice stands twice. */
export interface Bar {
  /** As printed. */
  number: string;
  position: number;
  length: number;
  /** [3, 4] for 3/4; null where the song does not tell. */
  time: [number, number] | null;
}

/** A rehearsal mark, a verse, a chorus. */
export interface Section {
  name: string;
  position: number;
}

const optionsSize = 40;
const notFound = 4;

/** A song from any source, played through its repeats and jumps. It never changes. */
export class Song extends Handle {
  /** @internal */
  constructor(native: Native, handle: number) {
    super(native, "_brindle_song_free", handle);
  }

  get title(): string {
    return this.#text("title");
  }
  /** Composers, artists and writers of the words. */
  get makers(): string {
    return this.#text("makers");
  }
  get style(): string {
    return this.#text("style");
  }
  /** What it was read as. */
  get format(): Format {
    return formats[this.native.module._brindle_song_format!(this.handle)]!;
  }
  /** Quarter notes a minute; 0 where the song does not tell. */
  get tempo(): number {
    return this.native.module._brindle_song_tempo!(this.handle);
  }
  get beatsPerBar(): number {
    return this.native.module._brindle_song_beats_per_bar!(this.handle);
  }
  /** The first key that the song states; null if it states none. */
  get statedKey(): Key | null {
    const { native } = this;
    const status = native.module._brindle_song_stated_key!(this.handle, native.result);
    if (status === notFound) return null;
    native.check(status);
    return keyOf(native, readKey(new Record(native, native.result)));
  }
  /** What is wrong with it or was left out, by places. */
  get faults(): Fault[] {
    return this.#list("fault", (record) => ({
      line: record.size(),
      column: record.size(),
      isNote: record.int() !== 0,
      text: record.text(),
    }));
  }
  get chords(): SongChord[] {
    const { native } = this;
    return this.#list("chord", (record) => ({
      position: record.double(),
      length: record.double(),
      symbol: record.text(),
      chord: new Chord(native, readChord(record)),
    }), "chord_at");
  }
  /** As played; empty for a text without bar lines. */
  get bars(): Bar[] {
    return this.#list("bar", (record) => {
      const bar = { number: record.text(), position: record.double(), length: record.double() };
      const time: [number, number] = [record.int(), record.int()];
      return { ...bar, time: time[0] > 0 && time[1] > 0 ? time : null };
    });
  }
  get sections(): Section[] {
    return this.#list("section", (record) => ({
      name: record.text(),
      position: record.double(),
    }));
  }

  analyse(options: AnalyseOptions = {}): Analysis {
    return analyse(this.native, this.handle, options);
  }
  /** Its lead sheet with numerals, keys and arrows. */
  svg(options: SheetOptions = {}): string {
    const analysis = this.analyse();
    try {
      return analysis.svg(options);
    } finally {
      analysis.free();
    }
  }
  /** Easy fingerings of its chords that are near each other, each different one once; without a capo
   * in the options under the one that makes it easiest. Names are those of the shapes. */
  fingerings(options: SongFingeringOptions = {}): Fingerings {
    return songFingerings(this.native, this.handle, options);
  }
  /** The same with the fingering of each chord, and what each capo makes of the song. */
  fingeringsJson(options: SongFingeringOptions = {}): GridsForJson {
    return songFingeringsJson(this.native, this.handle, options);
  }
  /** The song so many semitones higher, spelled for its new key. */
  transpose(semitones: number): Song {
    return this.#changed((out) =>
      this.native.module._brindle_song_transpose!(this.handle, semitones, out),
    );
  }
  /** The same song with its symbols written in a style. */
  named(style: Style): Song {
    const { native } = this;
    return native.withRoom(8, (place) => {
      putStyle(new Record(native, place), style);
      return this.#changed((out) => native.module._brindle_song_rename!(this.handle, place, out));
    });
  }
  /** Its chords as a grid in ChordPro. */
  chordPro(): string {
    return this.native.givenText((out) =>
      this.native.module._brindle_song_chord_pro!(this.handle, out),
    );
  }
  /** Chords and bass as a Standard MIDI File; without a tempo that of the song or 120. */
  midi(tempo = 0): Uint8Array {
    return this.native.givenBytes((out, size) =>
      this.native.module._brindle_song_midi!(this.handle, tempo, out, size),
    );
  }

  /** @internal */
  get hasFault(): boolean {
    return this.native.module._brindle_song_has_fault!(this.handle) !== 0;
  }

  #changed(call: (out: number) => number): Song {
    return new Song(this.native, this.native.givenHandle(call));
  }

  #text(what: string): string {
    return this.native.text(this.native.module[`_brindle_song_${what}`]!(this.handle));
  }

  #list<T>(what: string, read: (record: Record) => T, at = what): T[] {
    const { native, handle } = this;
    const count = native.module[`_brindle_song_${what}_count`]!(handle);
    return Array.from({ length: count }, (_, index) => {
      native.check(native.module[`_brindle_song_${at}`]!(handle, index, native.result));
      return read(new Record(native, native.result));
    });
  }
}

function putOptions(native: Native, place: number, options: ReadOptions): void {
  new Record(native, place)
    .putInt(formats.indexOf(options.format ?? "auto"))
    .putDouble(options.beatsPerBar ?? 4)
    .putDouble(options.beatsPerChord ?? 1)
    .putInt(options.even ? 1 : 0)
    .putInt(options.lenient ? 1 : 0)
    .putInt(readingFlags(options));
}

/** The offset of a line and a column in a text, in characters from 1; 0 where there is no line. */
function positionOf(text: string, { line, column }: Fault): number {
  if (line === 0) return 0;
  const before = text.split(/\r\n|\r|\n/).slice(0, line - 1);
  return before.reduce((sum, row) => sum + [...row].length + 1, 0) + column;
}

/** Reads a song; throws what is wrong with it, unless the reading is lenient. */
export function readSong(native: Native, source: string | Uint8Array, options: ReadOptions): Song {
  const bytes = typeof source === "string" ? new TextEncoder().encode(source) : source;
  const handle = native.withRoom(optionsSize, (place) => {
    putOptions(native, place, options);
    return native.withBytes(bytes, (at, size) =>
      native.givenHandle((out) => native.module._brindle_song_read!(at, size, place, out)),
    );
  });
  const song = new Song(native, handle);
  if (options.lenient || !song.hasFault) return song;
  const { faults } = song;
  song.free();
  const first = faults.find((fault) => !fault.isNote);
  const isText = typeof source === "string" && first !== undefined;
  throw new SongError(faults, isText ? positionOf(source, first) : 0);
}
