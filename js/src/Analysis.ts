import { Chord, chordSize, readChord } from "./Chord.js";
import type { AnalyseJson } from "./generated/schemas.js";
import { Handle } from "./Handle.js";
import type { Native } from "./Native.js";
import { Record } from "./Record.js";
import { keyOf, namingOf, putKey, rawKeyOfText, readKey, type Key, type Naming } from "./values.js";

/** What is asked of an analysis. */
export interface AnalyseOptions {
  /** Instead of what the song states: "A minor". */
  key?: string;
  /** All readings that progressions to a tonic allow, in `json()`. */
  alternatives?: boolean;
  /** Passages that repeat earlier ones, in the picture of the time axis. */
  copies?: boolean;
  /** A sentence for each chord. */
  explain?: boolean;
}

/** What stands for chords: symbols as written, in a style, or numbers in the key of each passage. */
export type ChordNaming = "written" | Naming | "nashville" | "roman";

/** How a song is drawn. */
export interface SheetOptions {
  /** Bars with symbols, numerals and arrows, or chords and keys along a time axis. */
  picture?: "lead-sheet" | "time-axis";
  naming?: ChordNaming;
  /** ♯ and ♭ in place of # and b, where the naming is a style. */
  unicode?: boolean;
  /** 1 to 16. */
  barsPerLine?: number;
  /** 200 to 4000 pixels. */
  width?: number;
  /** "auto" takes what the viewer prefers. */
  theme?: "auto" | "light" | "dark";
}

/** One chord as a teacher reads it. Indices are those of chords. */
export interface ChordReadingInSong {
  position: number;
  length: number;
  symbol: string;
  chord: Chord;
  /** Of its passage; null for no chord. */
  key: Key | null;
  /** In that key: "V7/ii"; "" for no chord. */
  numeral: string;
  /** "tonic", "subdominant", "dominant", "none"; "" for no chord. */
  function: string;
  /** "related second", "substitute dominant", "backdoor" and so on. */
  relation: string;
  /** The chord that it leads to. */
  resolvesTo: number | null;
  /** The later chord that it stands under in the tree of the song. */
  under: number | null;
  isDeceptive: boolean;
  /** "" unless it was asked for. */
  explanation: string;
}

/** A passage in one key. */
export interface Region {
  key: Key;
  position: number;
  end: number;
  firstChord: number;
  chordCount: number;
}

const themes = ["auto", "light", "dark"];

function namingCode(naming: ChordNaming = "written"): number {
  const code = ["written", "", "nashville", "roman"].indexOf(naming);
  return code < 0 ? 1 : code;
}

function styleCode(naming: ChordNaming | undefined): number {
  return namingCode(naming) === 1 ? namingOf(naming as Naming) : 0;
}

/** What was found in a song. It never changes. */
export class Analysis extends Handle {
  /** @internal */
  constructor(native: Native, handle: number) {
    super(native, "_brindle_analysis_free", handle);
  }

  /** Null for a song without chords. */
  get key(): Key | null {
    const { native } = this;
    const status = native.module._brindle_analysis_key!(this.handle, native.result);
    return status === 0 ? keyOf(native, readKey(new Record(native, native.result))) : null;
  }
  /** How sure the key is against all others, 0 to 1; -1 without a key. */
  get confidence(): number {
    return this.native.module._brindle_analysis_confidence!(this.handle);
  }
  get chords(): ChordReadingInSong[] {
    const count = this.native.module._brindle_analysis_chord_count!(this.handle);
    return Array.from({ length: count }, (_, index) => this.#chord(index));
  }
  /** They follow each other without a gap. */
  get regions(): Region[] {
    const { native, handle } = this;
    const count = native.module._brindle_analysis_region_count!(handle);
    return Array.from({ length: count }, (_, index) => {
      native.check(native.module._brindle_analysis_region!(handle, index, native.result));
      const record = new Record(native, native.result);
      const key = readKey(record);
      const place = { position: record.double(), end: record.double() };
      const chords = { firstChord: record.size(), chordCount: record.size() };
      return { key: keyOf(native, key)!, ...place, ...chords };
    });
  }

  /** The name of each chord. */
  symbols(naming: ChordNaming, unicode = false): string[] {
    const { native } = this;
    return native.withRoom(8, (style) => {
      new Record(native, style).putInt(styleCode(naming)).putInt(unicode ? 1 : 0);
      const lines = native.givenText((out) =>
        native.module._brindle_analysis_symbols!(this.handle, namingCode(naming), style, out),
      );
      return lines.split("\n").slice(0, -1);
    });
  }
  /** What `brindle analyse --json` prints. */
  json(): AnalyseJson {
    return JSON.parse(this.#text("json")) as AnalyseJson;
  }
  /** For people, in lines of 80 characters. */
  text(): string {
    return this.#text("text");
  }
  svg(options: SheetOptions = {}): string {
    const { native, handle } = this;
    if (options.picture === "time-axis") {
      return native.givenText((out) => native.module._brindle_analysis_svg!(handle, 1, out));
    }
    return this.#sheet("sheet", options);
  }
  /** What the lead sheet shows, for pages that draw it themselves; docs/json.md has the members. */
  sheet(options: Pick<SheetOptions, "naming" | "unicode"> = {}): object {
    return JSON.parse(this.#sheet("sheet_json", options)) as object;
  }

  #sheet(what: string, options: SheetOptions): string {
    const { native } = this;
    return native.withRoom(32, (place) => {
      new Record(native, place)
        .putInt(namingCode(options.naming))
        .putInt(styleCode(options.naming))
        .putInt(options.unicode ? 1 : 0)
        .putInt(options.barsPerLine ?? 4)
        .putInt(Math.max(0, themes.indexOf(options.theme ?? "auto")))
        .putDouble(options.width ?? 800);
      const draw = native.module[`_brindle_analysis_${what}`]!;
      return native.givenText((out) => draw(this.handle, place, out));
    });
  }

  #text(what: string): string {
    return this.native.givenText((out) =>
      this.native.module[`_brindle_analysis_${what}`]!(this.handle, out),
    );
  }

  #chord(index: number): ChordReadingInSong {
    const { native } = this;
    native.check(native.module._brindle_analysis_chord!(this.handle, index, native.result));
    const record = new Record(native, native.result);
    const head = { position: record.double(), length: record.double(), symbol: record.text() };
    const chord = new Chord(native, readChord(record));
    const rawKey = readKey(record);
    const reading = {
      numeral: record.text(),
      function: native.text(native.module._brindle_function_name!(record.int())),
      relation: native.text(native.module._brindle_relation_name!(record.int())),
      resolvesTo: record.index(),
      under: record.index(),
      isDeceptive: record.int() !== 0,
      explanation: record.text(),
    };
    return { ...head, chord, key: keyOf(native, rawKey), ...reading };
  }
}

/** Analyses a song by its handle. */
export function analyse(native: Native, song: number, options: AnalyseOptions): Analysis {
  const key = rawKeyOfText(native, options.key);
  const flags =
    (options.alternatives ? 1 : 0) | (options.copies ? 2 : 0) | (options.explain ? 4 : 0);
  return native.withRoom(chordSize, (place) => {
    putKey(new Record(native, place), key).putInt(flags);
    const handle = native.givenHandle((out) => native.module._brindle_analyse!(song, place, out));
    return new Analysis(native, handle);
  });
}
