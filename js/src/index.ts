export { load, type LoadOptions } from "./load.js";
export { BrindleError, SongError, type Fault, type Status } from "./errors.js";
export type { Brindle, TextRun } from "./Brindle.js";
export type { Chord, ChordReading } from "./Chord.js";
export type { Bar, Format, ReadOptions, Section, Song, SongChord } from "./Song.js";
export type {
  AnalyseOptions,
  Analysis,
  ChordNaming,
  ChordReadingInSong,
  Region,
  SheetOptions,
} from "./Analysis.js";
export type {
  Fingering,
  FingeringOptions,
  Fingerings,
  GridStyle,
  SearchOptions,
  SongFingeringOptions,
} from "./Fingerings.js";
export type { GenerateOptions, Markov } from "./Markov.js";
export type { NamedChord, NamingOptions } from "./names.js";
export type { NextChord, NextChords, NextOptions } from "./next.js";
export type { ModelSong, Quote, SongModel, SongRequest, WrittenSong } from "./SongModel.js";
export type { Key, Naming, Scale, Style, Tone } from "./values.js";
export type * from "./generated/schemas.js";
