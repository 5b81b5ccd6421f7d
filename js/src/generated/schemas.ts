// Made by scripts/schemas.mjs of docs/schema; not to be edited.

export namespace AnalyseJsonSchema {
/**
 * The tones of the mask, ascending.
 */
export type Intervals = number[];

export interface AnalyseJson {
  /**
   * The song of this line, where several are told
   */
  Song?: string;
  Score?: Score;
  HarmSignKeys: SignKey[];
  Readings?: Center[];
  KeyOfSong: {
    SignKey: null | Tonality;
    Confidence: number | null;
  };
  KeyRegions: KeyRegion[];
  Reading?: Reading;
}
/**
 * What a score tells beside its chords.
 */
export interface Score {
  Title: string;
  TimeSignatures: {
    /**
     * In beats from the begin of the song; null where it is undefined.
     */
    Position: number | null;
    Numerator: number;
    Denominator: number;
  }[];
  Sections: {
    /**
     * In beats from the begin of the song; null where it is undefined.
     */
    Position: number | null;
    IsFirst: boolean;
  }[];
  Copies: {
    /**
     * In beats from the begin of the song; null where it is undefined.
     */
    Position: number | null;
    SourceOffsetBars: number;
    LengthBars: number;
  }[];
  Bars: (number | null)[];
}
export interface SignKey {
  Probability: number | null;
  /**
   * In beats from the begin of the song; null where it is undefined.
   */
  Position: number | null;
  SignKey: Tonality;
  HarmCenters: Center[];
}
/**
 * A major or minor key.
 */
export interface Tonality {
  Name: string | null;
  /**
   * A note with its spelling; null for none.
   */
  CKeyEnh: null | {
    Name: string;
    /**
     * Semitones above C.
     */
    KeyNr: number;
    Enh:
      | "triple flat"
      | "double flat"
      | "flat"
      | "neutral"
      | "sharp"
      | "double sharp"
      | "triple sharp"
      | "undef";
  };
  Type: "major" | "minor" | null;
}
export interface Center {
  Probability: number | null;
  /**
   * In beats from the begin of the song; null where it is undefined.
   */
  Position: number | null;
  HarmCenter: {
    Name: string | null;
    /**
     * A note with its spelling; null for none.
     */
    CKeyEnh: null | {
      Name: string;
      /**
       * Semitones above C.
       */
      KeyNr: number;
      Enh:
        | "triple flat"
        | "double flat"
        | "flat"
        | "neutral"
        | "sharp"
        | "double sharp"
        | "triple sharp"
        | "undef";
    };
    /**
     * Bit n is the tone n semitones above the root.
     */
    Semitones: number;
    Intervals: Intervals;
  };
  HarmChords: Chord[];
}
export interface Chord {
  /**
   * In beats from the begin of the song; null where it is undefined.
   */
  Position: number | null;
  Symbol: string | null;
  /**
   * A note with its spelling; null for none.
   */
  RootKeyEnh: null | {
    Name: string;
    /**
     * Semitones above C.
     */
    KeyNr: number;
    Enh:
      | "triple flat"
      | "double flat"
      | "flat"
      | "neutral"
      | "sharp"
      | "double sharp"
      | "triple sharp"
      | "undef";
  };
  /**
   * A note with its spelling; null for none.
   */
  BassKeyEnh: null | {
    Name: string;
    /**
     * Semitones above C.
     */
    KeyNr: number;
    Enh:
      | "triple flat"
      | "double flat"
      | "flat"
      | "neutral"
      | "sharp"
      | "double sharp"
      | "triple sharp"
      | "undef";
  };
  /**
   * Bit n is the tone n semitones above the root.
   */
  Semitones: number;
  Intervals: Intervals;
  /**
   * Semitones up from the root of the center; null for none.
   */
  RootDistToHarmCenter: number | null;
  /**
   * Semitones up from the root of the center; null for none.
   */
  BassDistToHarmCenter: number | null;
  Numeral: string | null;
}
/**
 * A passage in one key.
 */
export interface KeyRegion {
  SignKey: null | Tonality;
  /**
   * In beats from the begin of the song; null where it is undefined.
   */
  Position: number | null;
  /**
   * In beats from the begin of the song; null where it is undefined.
   */
  EndPosition: number | null;
  Chords: {
    /**
     * In beats from the begin of the song; null where it is undefined.
     */
    Position: number | null;
    Symbol: string | null;
    Numeral: string | null;
  }[];
}
/**
 * A song as a teacher reads it.
 */
export interface Reading {
  SignKey: null | Tonality;
  Confidence: number | null;
  /**
   * Where keys contradict, in words.
   */
  Notes: string[];
  Regions: {
    SignKey: null | Tonality;
    /**
     * In beats from the begin of the song; null where it is undefined.
     */
    Position: number | null;
    /**
     * In beats from the begin of the song; null where it is undefined.
     */
    EndPosition: number | null;
  }[];
  Chords: {
    /**
     * In beats from the begin of the song; null where it is undefined.
     */
    Position: number | null;
    Symbol: string | null;
    SignKey: null | Tonality;
    Numeral: string | null;
    Function: "tonic" | "subdominant" | "dominant" | "none" | null;
    Relation:
      | "none"
      | "tonic"
      | "dominant"
      | "related second"
      | "substitute dominant"
      | "leading diminished"
      | "passing diminished"
      | "common-tone diminished"
      | "backdoor"
      | "plagal"
      | "borrowed"
      | "chromatic mediant"
      | "Neapolitan"
      | "augmented sixth"
      | "blues"
      | "line cliche"
      | null;
    Serves: null | {
      Degree: string;
      Semitones: number;
    };
    ResolvesTo: number | null;
    Under: number | null;
    IsDeceptive: boolean;
    /**
     * Only with --explain.
     */
    Explanation?: string | null;
  }[];
}
}
export type AnalyseJson = AnalyseJsonSchema.AnalyseJson;

export namespace GridJsonSchema {
/**
 * Pitches from the lowest string on.
 *
 * @minItems 3
 * @maxItems 16
 */
export type OpenStrings =
  | [number, number, number]
  | [number, number, number, number]
  | [number, number, number, number, number]
  | [number, number, number, number, number, number]
  | [number, number, number, number, number, number, number]
  | [number, number, number, number, number, number, number, number]
  | [number, number, number, number, number, number, number, number, number]
  | [number, number, number, number, number, number, number, number, number, number]
  | [number, number, number, number, number, number, number, number, number, number, number]
  | [number, number, number, number, number, number, number, number, number, number, number, number]
  | [
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number
    ]
  | [
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number
    ]
  | [
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number
    ]
  | [
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number
    ];

export interface GridJson {
  /**
   * Whether the strings are drawn from the highest on the left. The values count them alike.
   */
  LeftHanded: boolean;
  Grids: {
    Symbol: string;
    Name: string;
    OtherNames: string[];
    /**
     * Degrees of the chord that do not sound, such as 5 and 11.
     */
    Omitted: string[];
    RootKeyNr: number | null;
    /**
     * Of each string; null for a muted one.
     */
    Frets: (number | null)[];
    Pitches: (number | null)[];
    PitchNames: (string | null)[];
    Elements: Element[];
    OpenStrings: OpenStrings;
    Capo: number;
    /**
     * How hard it is to hold; null if one hand cannot.
     */
    Difficulty: number | null;
    Library: string | null;
  }[];
}
/**
 * A finger that is put down.
 */
export interface Element {
  Finger: number;
  Fret: number;
  /**
   * The lowest and the highest string, from 0.
   *
   * @minItems 2
   * @maxItems 2
   */
  Strings: [number, number];
  Optional: boolean;
}
}
export type GridJson = GridJsonSchema.GridJson;

export namespace GridsForJsonSchema {
/**
 * Pitches from the lowest string on.
 *
 * @minItems 3
 * @maxItems 16
 */
export type OpenStrings =
  | [number, number, number]
  | [number, number, number, number]
  | [number, number, number, number, number]
  | [number, number, number, number, number, number]
  | [number, number, number, number, number, number, number]
  | [number, number, number, number, number, number, number, number]
  | [number, number, number, number, number, number, number, number, number]
  | [number, number, number, number, number, number, number, number, number, number]
  | [number, number, number, number, number, number, number, number, number, number, number]
  | [number, number, number, number, number, number, number, number, number, number, number, number]
  | [
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number
    ]
  | [
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number
    ]
  | [
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number
    ]
  | [
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number,
      number
    ];
export type Grids = {
  Symbol: string;
  Name: string;
  OtherNames: string[];
  /**
   * Degrees of the chord that do not sound, such as 5 and 11.
   */
  Omitted: string[];
  RootKeyNr: number | null;
  /**
   * Of each string; null for a muted one.
   */
  Frets: (number | null)[];
  Pitches: (number | null)[];
  PitchNames: (string | null)[];
  Elements: Element[];
  OpenStrings: OpenStrings;
  Capo: number;
  /**
   * How hard it is to hold; null if one hand cannot.
   */
  Difficulty: number | null;
  Library: string | null;
}[];

export interface GridsForJson {
  /**
   * Places of the capodaster, the easiest first; the grids are those of the first.
   */
  Capos: {
    Capo: number;
    /**
     * Less is easier.
     */
    Cost: number;
    /**
     * Mean of the chords that can be held.
     */
    Difficulty: number;
    /**
     * How many chords cannot be held.
     */
    Holes: number;
    /**
     * The different chords by the names of their shapes under the capodaster.
     */
    Shapes: string[];
  }[];
  /**
   * The chords of the song, each with the index of its grid; null for a rest and a chord that cannot be held.
   */
  Chords: {
    Symbol: string;
    Grid: number | null;
  }[];
  /**
   * Whether the strings are drawn from the highest on the left. The values count them alike.
   */
  LeftHanded: boolean;
  Grids: Grids;
}
/**
 * A finger that is put down.
 */
export interface Element {
  Finger: number;
  Fret: number;
  /**
   * The lowest and the highest string, from 0.
   *
   * @minItems 2
   * @maxItems 2
   */
  Strings: [number, number];
  Optional: boolean;
}
}
export type GridsForJson = GridsForJsonSchema.GridsForJson;

export namespace MarkovNextJsonSchema {
export interface MarkovNextJson {
  Key: string;
  Chords: {
    Symbol: string;
    Probability: number;
    Numeral: string;
    Function: string;
  }[];
}
}
export type MarkovNextJson = MarkovNextJsonSchema.MarkovNextJson;

export namespace MarkovGenerateJsonSchema {
export type MarkovGenerateJson =
  | {
      ChordString: string;
      Symbols: {
        Symbol: string;
        Length?: number;
        /**
         * A note with its spelling; null for none.
         */
        RootKeyEnh?: null | {
          Name: string;
          /**
           * Semitones above C.
           */
          KeyNr: number;
          Enh:
            | "triple flat"
            | "double flat"
            | "flat"
            | "neutral"
            | "sharp"
            | "double sharp"
            | "triple sharp"
            | "undef";
        };
        /**
         * A note with its spelling; null for none.
         */
        BassKeyEnh?: null | {
          Name: string;
          /**
           * Semitones above C.
           */
          KeyNr: number;
          Enh:
            | "triple flat"
            | "double flat"
            | "flat"
            | "neutral"
            | "sharp"
            | "double sharp"
            | "triple sharp"
            | "undef";
        };
        /**
         * Bit n is the tone n semitones above the root.
         */
        Semitones?: number;
        Intervals?: Intervals;
        Probability: number | null;
        NormalizedEntropy: number | null;
        HistoryLength: number;
      }[];
      Sequences: {
        Share: number;
        Count: number;
        LogProbability: number | null;
        ChordString: string;
      }[];
    }
  | {
      Key: string;
      Form: string;
      Bars: number;
      BeatsPerBar: number;
      Seed: number;
      Text: string;
      Chords: {
        Symbol: string;
        Position: number;
        Length: number;
        Section: string;
        Numeral: string;
        Function: string;
      }[];
      LongestQuote: null | {
        Title: string;
        SourceBar: number;
        Bar: number;
        Bars: number;
      };
    };
/**
 * The tones of the mask, ascending.
 */
export type Intervals = number[];
}
export type MarkovGenerateJson = MarkovGenerateJsonSchema.MarkovGenerateJson;

export namespace MarkovSongsJsonSchema {
export interface MarkovSongsJson {
  Chords: number;
  Songs: {
    Title: string;
    Makers: string;
    Style: string;
    Key: string;
    Chords: number;
  }[];
}
}
export type MarkovSongsJson = MarkovSongsJsonSchema.MarkovSongsJson;

export namespace MarkovScoreJsonSchema {
export interface MarkovScoreJson {
  Songs: number;
  Chords: number;
  Smoothing: "interpolation";
  Orders: {
    Order: number;
    BitsPerChord: number;
    BitsPerChordWithoutKeys: number;
  }[];
}
}
export type MarkovScoreJson = MarkovScoreJsonSchema.MarkovScoreJson;

export namespace ImportLineJsonSchema {
export interface ImportLineJson {
  /**
   * The method of the host; song before each of several scores, and result behind it.
   */
  call: string;
  /**
   * The values of a call without a record.
   */
  in?: unknown[];
  /**
   * The file of a score, with song.
   */
  name?: string;
}
}
export type ImportLineJson = ImportLineJsonSchema.ImportLineJson;
