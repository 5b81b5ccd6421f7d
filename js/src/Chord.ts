import type { Native } from "./Native.js";
import { Record } from "./Record.js";
import { putStyle, putTone, readTone, toneOf, tonesOf, type RawTone, type Style, type Tone } from "./values.js";

/** How a chord symbol is read. */
export interface ChordReading {
  /** The letter B is B flat, H is B natural. */
  bIsBFlat?: boolean;
  /** Roots may be syllables. */
  solfege?: boolean;
  /** A root in lower case without a quality is minor. */
  lowerCaseMinor?: boolean;
}

export function readingFlags(how: ChordReading = {}): number {
  return (how.bIsBFlat ? 1 : 0) | (how.solfege ? 2 : 0) | (how.lowerCaseMinor ? 4 : 0);
}

export const chordSize = 20;
const styleSize = 8;

/** A brindle_chord as it lies in memory. */
export interface RawChord {
  root: RawTone;
  bass: RawTone;
  mask: number;
}

export function readChord(record: Record): RawChord {
  return { root: readTone(record), bass: readTone(record), mask: record.size() };
}

export function putChord(record: Record, chord: RawChord): Record {
  return putTone(putTone(record, chord.root), chord.bass).putInt(chord.mask);
}

/** The tones of a chord and its spelling; a value. What is written of it is found when it is asked. */
export class Chord {
  readonly #native: Native;
  readonly #raw: RawChord;

  /** @internal */
  constructor(native: Native, raw: RawChord) {
    this.#native = native;
    this.#raw = raw;
  }

  /** Null where no chord sounds ("N.C."). */
  get root(): Tone | null {
    return toneOf(this.#native, this.#raw.root);
  }
  /** What stands behind the slash; null without one. */
  get bass(): Tone | null {
    return toneOf(this.#native, this.#raw.bass);
  }
  /** Bit n is n semitones above the root. */
  get mask(): number {
    return this.#raw.mask;
  }
  /** Semitones above the root, ascending. */
  get intervals(): number[] {
    return Array.from({ length: 12 }, (_, interval) => interval).filter(
      (interval) => (this.mask >> interval) & 1,
    );
  }
  /** The symbol as people type it: "E7b9". */
  get symbol(): string {
    return this.write();
  }
  /** From the root up, as the chord spells them; without a bass that is none of them. */
  get tones(): Tone[] {
    return this.withRecord((chord) => tonesOf(this.#native, "_brindle_chord_tones", chord));
  }

  /** The symbol in a style; it reads back as the same chord. */
  write(style: Style = {}): string {
    const native = this.#native;
    return this.withRecord((chord) => {
      putStyle(new Record(native, chord + chordSize), style);
      return native.givenText((out) =>
        native.module._brindle_chord_write!(chord, chord + chordSize, out),
      );
    });
  }

  toString(): string {
    return this.symbol;
  }
  toJSON(): object {
    const { symbol, root, bass, mask, intervals, tones } = this;
    return { symbol, root, bass, mask, intervals, tones };
  }

  /** @internal */
  get raw(): RawChord {
    return this.#raw;
  }

  private withRecord<T>(call: (place: number) => T): T {
    return this.#native.withRoom(chordSize + styleSize, (place) => {
      putChord(new Record(this.#native, place), this.#raw);
      return call(place);
    });
  }
}

/** The chord of a symbol. */
export function chordOfSymbol(native: Native, symbol: string, flags: number): Chord {
  native.withText(symbol, (place) =>
    native.check(native.module._brindle_chord_read!(place, flags, native.result)),
  );
  return new Chord(native, readChord(new Record(native, native.result)));
}
