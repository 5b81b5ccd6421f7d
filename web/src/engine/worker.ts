// The library at work, beside the page. All music comes from it.

import { load, SongError, type Analysis, type Brindle, type ChordNaming, type Key, type Song } from "brindle";
import wasm from "brindle/brindle.wasm?url";
import { midiNotes } from "../player/midiNotes";
import { insertChord } from "./insertChord";
import { printedNames, sentenceAround } from "./sentence";
import { transposeText, type Heard } from "./transposeText";
import type { Answer, Call, Calls, Export, Grid, Hand, Names, PianoNote, Sheet, Source } from "./Types";

/** The key below the lowest note that a chord is shown with: the B below the C under middle C. */
const belowPiano = 47;
const mostGrids = 16;
const mostNext = 8;

let library: Promise<Brindle> | null = null;
let kept: { source: Source; song: Song; analysis: Analysis } | null = null;

function isSame(a: Source, b: Source): boolean {
  if (a.kind === "text" || b.kind === "text") return a.kind === b.kind && (a as { text: string }).text === (b as { text: string }).text;
  return a.bytes.length === b.bytes.length && a.bytes.every((byte, i) => byte === b.bytes[i]);
}

/** The library; where it could not be fetched, the next call tries again. */
async function brindle(): Promise<Brindle> {
  library ??= load({ wasm: new URL(wasm, self.location.href) }).catch((error: Error) => {
    library = null;
    throw new Error(`The library could not be loaded: ${error.message}. Reload the page to try again.`);
  });
  return library;
}

/**
 * A typed song. Where neither bars nor beats are told, as in most lyrics with chords, each chord has a
 * bar, which is nearer to the song than a beat; so its parts begin bars, too.
 */
function readText(library: Brindle, text: string): Song {
  const song = library.read(text, { lenient: true });
  const { chords, beatsPerBar } = song;
  if (chords.length === 0 || song.bars.length > 0 || chords.some(({ position }, i) => position !== i)) return song;
  song.free();
  return library.read(text, { lenient: true, beatsPerChord: beatsPerBar });
}

/** The song of a source with its analysis; the last one is kept, as most calls ask for it again. */
async function readSong(source: Source): Promise<{ song: Song; analysis: Analysis }> {
  if (kept && isSame(kept.source, source)) return kept;
  const library = await brindle();
  const song = source.kind === "text" ? readText(library, source.text) : library.readScore(source.bytes);
  const analysis = song.analyse({ explain: true });
  kept?.analysis.free();
  kept?.song.free();
  kept = { source, song, analysis };
  return kept;
}

/** "E\u266D major" */
function keyName(key: Key): string {
  return `${printedNames(key.tonic.name)} ${key.mode}`;
}

function namingOf(names: Names): { naming?: ChordNaming } {
  return names === "typed" ? {} : { naming: names };
}

/** The fingerings that people wrote down, then others that a hand can play. */
function fingeringsOf(library: Brindle, symbol: string, { tuning, capo }: Hand): Grid[] {
  const options = { capo, ...(tuning ? { tuning } : {}) };
  const found = new Map<string, Grid>();
  for (const fingerings of [library.fingerings(symbol, options), library.searchFingerings(symbol, { ...options, limit: mostGrids })]) {
    for (const grid of fingerings.json().Grids.slice(0, mostGrids) as unknown as Grid[]) {
      const frets = grid.Frets.join();
      if (!found.has(frets)) found.set(frets, grid);
    }
    fingerings.free();
  }
  return [...found.values()].slice(0, mostGrids);
}

/** Tones one above the other, the bass lowest, as a hand could play them. */
function stacked(tones: { pitchClass: number; name: string }[]): PianoNote[] {
  let last = belowPiano;
  return tones.map(({ pitchClass, name }) => {
    last += ((pitchClass - last - 1 + 144) % 12) + 1;
    return { Name: printedNames(name), NoteNr: last };
  });
}

/** What is asked of a song that nobody needs behind it. */
function freed<Value>(song: Song, ask: (song: Song) => Value): Value {
  try {
    return ask(song);
  } finally {
    song.free();
  }
}

function symbolsOf(song: Song): string[] {
  return song.chords.map(({ symbol }) => symbol);
}

function heard(song: Song): Heard {
  const chords = song.chords.map(({ symbol, position, chord: { root, bass, mask } }) => ({
    symbol,
    position,
    tones: `${root?.pitchClass}/${bass?.pitchClass}/${mask}`,
  }));
  const words = [song.title, song.makers, ...song.sections.map(({ name }) => name)];
  return { words, tonic: song.statedKey?.tonic.pitchClass ?? null, chords };
}

/** "Ebm" */
function typedKey({ tonic, mode }: Key): string {
  return tonic.name + (mode === "minor" ? "m" : "");
}

const calls: Calls = {
  async read(source, names) {
    try {
      const { song, analysis } = await readSong(source);
      const sheet = analysis.sheet(namingOf(names)) as unknown as Sheet;
      sheet.Notes = sheet.Notes.map(printedNames);
      const sentences = analysis.chords.map(({ explanation, numeral }) => sentenceAround(explanation, numeral));
      return { sheet, faults: song.faults, sentences };
    } catch (error) {
      if (error instanceof SongError && error.faults.length > 0) return { sheet: null, faults: error.faults, sentences: [] };
      throw error;
    }
  },

  async tones(source, chord) {
    const found = (await readSong(source)).song.chords[chord]?.chord;
    if (!found?.root) return [];
    const { bass, tones } = found;
    return stacked(bass ? [bass, ...tones.filter(({ pitchClass }) => pitchClass !== bass.pitchClass)] : tones);
  },

  async grids(source, chord, hand) {
    const found = (await readSong(source)).song.chords[chord]?.chord;
    return found?.root ? fingeringsOf(await brindle(), found.symbol, hand) : [];
  },

  async next(source, chord) {
    const { song, analysis } = await readSong(source);
    const before = song.chords.slice(0, chord + 1).map(({ chord }) => chord);
    const library = await brindle();
    const key = analysis.chords[chord]?.key?.name;
    const found = library.next(before, { count: mostNext, ...(key ? { key } : {}) });
    const chords = found.chords.map(({ symbol, probability, numeral, function: does }) => ({
      Symbol: symbol,
      Runs: library.typeset(symbol),
      Probability: probability,
      Numeral: numeral,
      NumeralRuns: library.typeset(numeral, "numeral"),
      Function: does,
    }));
    return { key: found.key === null ? "" : keyName(found.key), chords };
  },

  async notes(source) {
    return midiNotes((await readSong(source)).song.midi());
  },

  async transpose(source, semitones) {
    const library = await brindle();
    const { song } = await readSong(source);
    const transposed = song.transpose(semitones);
    const after = heard(transposed);
    const key = transposed.statedKey && typedKey(transposed.statedKey);
    const readHeard = (text: string) => freed(readText(library, text), heard);
    const text = source.kind === "text" ? transposeText(source.text, heard(song), after, key, readHeard) : null;
    const told = text ?? transposed.chordPro();
    transposed.free();
    return told;
  },

  async insert(source, chord, symbol) {
    const library = await brindle();
    const readSymbols = (text: string) => freed(library.read(text, { lenient: true }), symbolsOf);
    const text = insertChord(await calls.text(source), chord, symbol, readSymbols);
    if (text === null) throw new Error(`There is no place for ${symbol} behind this chord in the text.`);
    return text;
  },

  async text(source) {
    return source.kind === "text" ? source.text : (await readSong(source)).song.chordPro();
  },

  async file(source, form, names, tempo) {
    const { song, analysis } = await readSong(source);
    const makers: Record<Export, () => string | Uint8Array> = {
      svg: () => analysis.svg(namingOf(names)),
      midi: () => song.midi(tempo),
      json: () => JSON.stringify(analysis.json(), null, 2),
      chordpro: () => song.chordPro(),
    };
    const made = makers[form]();
    return typeof made === "string" ? new TextEncoder().encode(made) : made;
  },
};

/** What went wrong, in words for people. Behind a trap of WebAssembly the library is of no more use. */
function failure(id: number, error: Error): Answer {
  if (!(error instanceof WebAssembly.RuntimeError || error instanceof RangeError)) return { id, error: error.message };
  return { id, error: `This song is too much for the library (${error.message}).`, isFatal: true };
}

self.onmessage = async ({ data }: MessageEvent<Call>) => {
  const { id, name, args } = data;
  let answer: Answer;
  try {
    const call = calls[name] as (...args: unknown[]) => Promise<unknown>;
    answer = { id, value: await call(...args) };
  } catch (error) {
    answer = failure(id, error as Error);
  }
  self.postMessage(answer);
};
