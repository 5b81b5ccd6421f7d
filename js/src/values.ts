import type { Native } from "./Native.js";
import { Record } from "./Record.js";

/** What tones are called: C D E F G A B; with H and B; Do Re Mi. */
export type Naming = "letters" | "german" | "solfege";

/** How names are written. */
export interface Style {
  naming?: Naming;
  /** ♯ and ♭ in place of # and b. */
  unicode?: boolean;
}

/** A spelled pitch class. */
export interface Tone {
  /** 0 (C) to 11 (B). */
  pitchClass: number;
  /** -3 (triple flat) to 3; null without a spelling. */
  accidental: number | null;
  /** In letters and ASCII: "Bb". */
  name: string;
}

/** A major or minor key. */
export interface Key {
  tonic: Tone;
  mode: "major" | "minor";
  /** "Bb Minor" */
  name: string;
  /** Sharps of the signature, flats as a negative number. */
  signature: number;
}

/** The tones of a scale. */
export interface Scale {
  root: Tone;
  /** Bit n is n semitones above the root. */
  mask: number;
  /** "D Dorian" */
  name: string;
  /** From the root up. */
  tones: Tone[];
}

const unspelled = 127;
const namings: Naming[] = ["letters", "german", "solfege"];

export function namingOf(naming: Naming | undefined): number {
  return naming === undefined ? 0 : namings.indexOf(naming);
}

/** Writes a brindle_style. */
export function putStyle(record: Record, style: Style = {}): Record {
  return record.putInt(namingOf(style.naming)).putInt(style.unicode ? 1 : 0);
}

/** What is read from a record before any other call of the library overwrites it. */
export interface RawTone {
  pitchClass: number;
  accidental: number;
}

export function readTone(record: Record): RawTone {
  return { pitchClass: record.int(), accidental: record.int() };
}

export function putTone(record: Record, tone: RawTone): Record {
  return record.putInt(tone.pitchClass).putInt(tone.accidental);
}

const toneSize = 8;

/** Null for no tone. Names are kept, as there are so many tones and so few names. */
export function toneOf(native: Native, raw: RawTone): Tone | null {
  if (raw.pitchClass < 0) return null;
  const accidental = raw.accidental === unspelled ? null : raw.accidental;
  const code = raw.pitchClass * 256 + raw.accidental;
  let name = native.toneNames.get(code);
  if (name === undefined) {
    name = writtenTone(native, raw, {});
    native.toneNames.set(code, name);
  }
  return { pitchClass: raw.pitchClass, accidental, name };
}

export function rawTone(tone: Tone): RawTone {
  return { pitchClass: tone.pitchClass, accidental: tone.accidental ?? unspelled };
}

/** The name of a tone in a style. */
export function writtenTone(native: Native, tone: RawTone, style: Style): string {
  return native.withRoom(2 * toneSize, (place) => {
    putStyle(putTone(new Record(native, place), tone), style);
    return native.givenText((out) =>
      native.module._brindle_tone_write!(place, place + toneSize, out),
    );
  });
}

export interface RawKey {
  tonic: RawTone;
  mode: number;
}

export const noKey: RawKey = { tonic: { pitchClass: -1, accidental: unspelled }, mode: 0 };

export function readKey(record: Record): RawKey {
  return { tonic: readTone(record), mode: record.int() };
}

export function putKey(record: Record, key: RawKey): Record {
  return putTone(record, key.tonic).putInt(key.mode);
}

const keySize = 12;

export function keyOf(native: Native, raw: RawKey): Key | null {
  const tonic = toneOf(native, raw.tonic);
  if (tonic === null || raw.mode === 0) return null;
  return native.withRoom(keySize, (place) => {
    putKey(new Record(native, place), raw);
    return {
      tonic,
      mode: raw.mode === 1 ? "major" : "minor",
      name: native.givenText((out) => native.module._brindle_key_write!(place, out)),
      signature: native.module._brindle_key_signature!(place),
    };
  });
}

/** The key of a text, such as "F# minor"; no text is no key. */
export function rawKeyOfText(native: Native, text: string | undefined): RawKey {
  if (text === undefined) return noKey;
  return native.withText(text, (place) => {
    native.check(native.module._brindle_key_read!(place, native.result));
    return readKey(new Record(native, native.result));
  });
}

const scaleSize = 12;

export function scaleOf(native: Native, text: string): Scale {
  return native.withRoom(scaleSize, (scale) => {
    native.withText(text, (at) => native.check(native.module._brindle_scale_read!(at, scale)));
    const record = new Record(native, scale);
    return {
      root: toneOf(native, readTone(record))!,
      mask: record.size(),
      name: native.givenText((out) => native.module._brindle_scale_write!(scale, out)),
      tones: tonesOf(native, "_brindle_scale_tones", scale),
    };
  });
}

/** The tones that a function of scales or chords gives to an array of 12. */
export function tonesOf(native: Native, name: `_brindle_${string}`, of: number): Tone[] {
  return native.withRoom(12 * toneSize, (room) => {
    native.check(native.module[name]!(of, room, native.result));
    const count = native.view.getUint32(native.result, true);
    const record = new Record(native, room);
    const tones = Array.from({ length: count }, () => readTone(record));
    return tones.map((tone) => toneOf(native, tone)!);
  });
}
