import type { GridJson, GridsForJson } from "./generated/schemas.js";
import { Handle } from "./Handle.js";
import type { Native } from "./Native.js";
import { Record } from "./Record.js";

/** For which instrument. */
export interface FingeringOptions {
  /** "DADGAD", "E2A2D3G3B3E4", "drop d", "ukulele"; the standard guitar if it is not said. */
  tuning?: string;
  /** A fret of 0 to 24. */
  capo?: number;
}

const basses = ["usual", "required", "free"] as const;
const dots = ["fingers", "notes", "intervals"] as const;

/** What a hand and its player allow. */
export interface SearchOptions extends FingeringOptions {
  /** The last fret of the neck, 1 to 24; 15 if it is not said. */
  highestFret?: number;
  /** Frets under the hand, 2 to 6, one more from the seventh on; 4 if it is not said. */
  span?: number;
  /** What the lowest note has to be: "usual" is what stands behind a slash, else preferably the root. */
  bass?: (typeof basses)[number];
  /** Nothing is left out. */
  whole?: boolean;
  /** The root may be left to a bass player. */
  rootless?: boolean;
  /** Most fingerings of a chord, 1 to 1000; 10 if it is not said. */
  limit?: number;
}

/** How the fingerings of a song are chosen. */
export interface SongFingeringOptions extends SearchOptions {
  /** The last fret that is tried, 0 to 12, where no capo is said; 7 if it is not said. */
  highestCapo?: number;
}

/** How diagrams are drawn. */
export interface GridStyle {
  /** What stands on the dots; fingers if it is not said. */
  dots?: (typeof dots)[number];
  /** The lowest string stands on the right. */
  leftHanded?: boolean;
}

/** A fingering and what it sounds, from the lowest string up. */
export interface Fingering {
  /** Told from what sounds: "Am7". */
  name: string;
  /** Where it comes from; "" for typed frets. */
  library: string;
  capo: number;
  /** -1 muted, 0 open. */
  frets: number[];
  /** MIDI numbers; -1 muted. */
  pitches: number[];
}

const mostStrings = 16;
const gridSize = 144;

/** Fingerings of one chord, the best first. */
export class Fingerings extends Handle implements Iterable<Fingering> {
  /** @internal */
  constructor(native: Native, handle: number) {
    super(native, "_brindle_grids_free", handle);
  }

  get length(): number {
    return this.native.module._brindle_grids_count!(this.handle);
  }
  get list(): Fingering[] {
    return Array.from({ length: this.length }, (_, index) => this.#at(index));
  }
  [Symbol.iterator](): Iterator<Fingering> {
    return this.list[Symbol.iterator]();
  }
  /** What `brindle grid --json` prints. */
  json(): GridJson {
    return JSON.parse(
      this.native.givenText((out) => this.native.module._brindle_grids_json!(this.handle, out)),
    ) as GridJson;
  }
  /** A sheet of diagrams. */
  svg(title = "", style: GridStyle = {}): string {
    const { native } = this;
    const onDots = dots.indexOf(style.dots ?? "fingers");
    const left = style.leftHanded ? 1 : 0;
    const draw = native.module._brindle_grids_draw!;
    return native.withText(title, (place) =>
      native.givenText((out) => draw(this.handle, place, onDots, left, out)),
    );
  }

  #at(index: number): Fingering {
    const { native } = this;
    return native.withRoom(gridSize, (place) => {
      native.check(native.module._brindle_grids_get!(this.handle, index, place));
      const record = new Record(native, place);
      const head = { name: record.text(), library: record.text(), capo: record.int() };
      const count = record.size();
      const frets = record.ints(mostStrings).slice(0, count);
      return { ...head, frets, pitches: record.ints(mostStrings).slice(0, count) };
    });
  }
}

/** Calls with a tuning, 0 for the standard one. */
function withTuning<T>(native: Native, tuning: string | undefined, call: (at: number) => T): T {
  return tuning === undefined ? call(0) : native.withText(tuning, call);
}

/** The fingerings of a chord symbol in a package. */
export function findFingerings(
  native: Native,
  grids: number,
  symbol: string,
  { tuning, capo = 0 }: FingeringOptions,
): Fingerings {
  const find = native.module._brindle_grids_find!;
  const handle = native.withText(symbol, (at) =>
    withTuning(native, tuning, (tuned) =>
      native.givenHandle((out) => find(grids, at, tuned, capo, out)),
    ),
  );
  return new Fingerings(native, handle);
}

/** The one fingering that frets are. */
export function fingeringOfFrets(
  native: Native,
  frets: string,
  { tuning, capo = 0 }: FingeringOptions,
): Fingerings {
  const read = native.module._brindle_grids_of_frets!;
  const handle = native.withText(frets, (at) =>
    withTuning(native, tuning, (tuned) =>
      native.givenHandle((out) => read(at, tuned, capo, out)),
    ),
  );
  return new Fingerings(native, handle);
}

const searchOptionsSize = 32;

/** Calls with a record of options. */
function withSearch<T>(native: Native, options: SearchOptions, call: (at: number) => T): T {
  return withTuning(native, options.tuning, (tuning) =>
    native.withRoom(searchOptionsSize, (place) => {
      new Record(native, place)
        .putInt(tuning)
        .putInt(options.capo ?? 0)
        .putInt(options.highestFret ?? 15)
        .putInt(options.span ?? 4)
        .putInt(basses.indexOf(options.bass ?? "usual"))
        .putInt(options.whole ? 1 : 0)
        .putInt(options.rootless ? 1 : 0)
        .putInt(options.limit ?? 10);
      return call(place);
    }),
  );
}

/** The fingerings of a chord symbol, searched and not looked up. */
export function searchFingerings(
  native: Native,
  symbol: string,
  options: SearchOptions,
): Fingerings {
  const search = native.module._brindle_grids_search!;
  const handle = native.withText(symbol, (at) =>
    withSearch(native, options, (place) =>
      native.givenHandle((out) => search(at, place, out)),
    ),
  );
  return new Fingerings(native, handle);
}

const toldCapo = -1;

/** The highest capo that is tried; a capo that is said stays. */
function highestCapoOf({ capo, highestCapo = 7 }: SongFingeringOptions): number {
  return capo === undefined ? highestCapo : toldCapo;
}

/** The different fingerings of a song. */
export function songFingerings(
  native: Native,
  song: number,
  options: SongFingeringOptions,
): Fingerings {
  const choose = native.module._brindle_grids_of_song!;
  const handle = withSearch(native, options, (place) =>
    native.givenHandle((out) => choose(song, place, highestCapoOf(options), out)),
  );
  return new Fingerings(native, handle);
}

/** All that `brindle grids for --json` prints. */
export function songFingeringsJson(
  native: Native,
  song: number,
  options: SongFingeringOptions,
): GridsForJson {
  const choose = native.module._brindle_song_grids_json!;
  const text = withSearch(native, options, (place) =>
    native.givenText((out) => choose(song, place, highestCapoOf(options), out)),
  );
  return JSON.parse(text) as GridsForJson;
}
