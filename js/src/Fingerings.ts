import type { GridJson } from "./generated/schemas.js";
import { Handle } from "./Handle.js";
import type { Native } from "./Native.js";
import { Record } from "./Record.js";

/** For which instrument. */
export interface FingeringOptions {
  /** "DADGAD", "E2A2D3G3B3E4"; the standard guitar if it is not said. */
  tuning?: string;
  /** A fret of 0 to 24. */
  capo?: number;
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
  svg(title = ""): string {
    const { native } = this;
    return native.withText(title, (place) =>
      native.givenText((out) => native.module._brindle_grids_svg!(this.handle, place, out)),
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
