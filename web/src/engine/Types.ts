// What the page and the worker with the library say to each other. Records with capital members are
// JSON of the library as it comes.

/** How chords are written on the sheet. */
export type Names = "typed" | "letters" | "german" | "solfege" | "nashville" | "roman";

/** What a song is read from. */
export type Source =
  | { kind: "text"; text: string }
  | { kind: "score"; name: string; bytes: Uint8Array };

/** A piece of a text in one size: text, size in em, base line above that of the whole in em. */
export type Run = [text: string, size: number, raise: number];

export interface SheetKey {
  Name: string;
  Paper: string;
  Ink: string;
  NightPaper: string;
  NightInk: string;
}

/** A bar that is drawn, with the chords [Begin, End). */
export interface SheetBar {
  Number: string;
  Position: number;
  Length: number;
  BarCount: number;
  Begin: number;
  End: number;
  Held: number | null;
  IsUpbeat: boolean;
  Time: string | null;
  BeginsSection: boolean;
  Section: string;
  BeginsRepeat: boolean;
  EndsRepeat: boolean;
  Times: number;
  Ending: string;
  IsInEnding: boolean;
  ClosesEnding: boolean;
  Remark: string;
  Sign: "segno" | "coda" | null;
  Words: string;
}

export interface SheetChord {
  Position: number;
  Symbol: string;
  Runs: Run[];
  Numeral: string;
  NumeralRuns: Run[];
  Key: number | null;
}

/** From a chord to another; `To` is null for an arrow that leads back over a repeat sign. */
export interface SheetLink {
  From: number;
  To: number | null;
  IsDotted: boolean;
}

export interface Sheet {
  Title: string;
  Makers: string;
  Style: string;
  Tempo: number | null;
  Key: string | null;
  Confidence: number;
  BeatsPerBar: number;
  Bars: SheetBar[];
  PlayedBars: { Position: number; Length: number; Bar: number }[];
  DrawnAs: number[];
  Chords: SheetChord[];
  Keys: SheetKey[];
  Arrows: SheetLink[];
  Brackets: SheetLink[];
  Notes: string[];
}

/** Lines and columns count characters from 1; line 0 is the whole text. */
export interface Fault {
  line: number;
  column: number;
  text: string;
  isNote: boolean;
}

/** A song with all that is drawn of it; without a sheet where nothing can be read. */
export interface Reading {
  sheet: Sheet | null;
  faults: Fault[];
  /** Of each chord what it does. */
  sentences: Sentence[];
}

/** A sentence with the numeral of its chord at its place. */
export interface Sentence {
  before: string;
  numeral: boolean;
  after: string;
}

export interface Note {
  Position: number;
  Length: number;
  NoteNr: number;
  Velocity: number;
}

export interface Grid {
  Name: string;
  Frets: (number | null)[];
  Elements: { Finger: number; Fret: number; Strings: [number, number] }[];
  Capo: number;
  Omitted: string[];
}

/** What fingerings are for. */
export interface Hand {
  /** A name or the notes of the strings; "" for a guitar in its usual one. */
  tuning: string;
  /** A fret; 0 without one. */
  capo: number;
}

export interface PianoNote {
  Name: string;
  NoteNr: number;
}

export interface NextChord {
  Symbol: string;
  /** As a publisher sets the symbol and the numeral. */
  Runs: Run[];
  NumeralRuns: Run[];
  Probability: number;
  Numeral: string;
  Function: string;
}

/** What may come, and the key in which its numerals are. */
export interface NextChords {
  key: string;
  chords: NextChord[];
}

export type Export = "svg" | "midi" | "json" | "chordpro";

/** What the worker can do. All of it is the library's work. */
export interface Calls {
  read(source: Source, names: Names): Promise<Reading>;
  /** The tones of a chord on a piano, the bass lowest. */
  tones(source: Source, chord: number): Promise<PianoNote[]>;
  /** Its fingerings, the best first. */
  grids(source: Source, chord: number, hand: Hand): Promise<Grid[]>;
  next(source: Source, chord: number): Promise<NextChords>;
  notes(source: Source): Promise<Note[]>;
  transpose(source: Source, semitones: number): Promise<string>;
  insert(source: Source, chord: number, symbol: string): Promise<string>;
  text(source: Source): Promise<string>;
  file(source: Source, form: Export, names: Names, tempo: number): Promise<Uint8Array>;
}

export interface Call {
  id: number;
  name: keyof Calls;
  args: unknown[];
}

export interface Answer {
  id: number;
  value?: unknown;
  error?: string;
  /** The worker cannot go on. */
  isFatal?: boolean;
}
