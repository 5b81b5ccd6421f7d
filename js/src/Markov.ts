import { Handle } from "./Handle.js";
import type { Native } from "./Native.js";
import { Record } from "./Record.js";
import type { Song } from "./Song.js";

/** What sequence is wanted. */
export interface GenerateOptions {
  /** Its length, 1 to 10000; 32 if it is not said. */
  beats?: number;
  /** The same seed and model give the same sequence. */
  seed?: number | bigint;
  /** The longest history; that of the model if it is not said. */
  maxOrder?: number;
  /** Sequences to choose from, 1 to 100000; 10 if it is not said. */
  samples?: number;
}

/** A model of which chords follow which, and how long. */
export class Markov extends Handle {
  /** @internal */
  constructor(native: Native, handle: number) {
    super(native, "_brindle_markov_free", handle);
  }

  /** Chords of its longest history. */
  get order(): number {
    return this.native.module._brindle_markov_order!(this.handle);
  }
  /** Different chords with their lengths, marks of begin and end. */
  get symbolCount(): number {
    return this.native.module._brindle_markov_symbol_count!(this.handle);
  }
  /** Learns the chords of a song; throws for a song without chords. */
  learn(song: Song): this {
    this.native.check(this.native.module._brindle_markov_learn!(this.handle, song.handle));
    return this;
  }
  /** A new sequence in the manner of what was learned, which `read` reads: "(4,C);(2,G7)". */
  generate({ beats = 32, seed = 0, maxOrder = 0, samples = 10 }: GenerateOptions = {}): string {
    const { native } = this;
    return native.withRoom(24, (place) => {
      new Record(native, place)
        .putDouble(beats)
        .putLong(BigInt(seed))
        .putInt(maxOrder)
        .putInt(samples);
      return native.givenText((out) =>
        native.module._brindle_markov_generate!(this.handle, place, out),
      );
    });
  }
  /** The text of a model file, which `markov` reads. */
  toText(): string {
    return this.native.givenText((out) =>
      this.native.module._brindle_markov_write!(this.handle, out),
    );
  }
}

/** An empty model of an order, or the model of a text. */
export function markovOf(native: Native, from: string | number): Markov {
  const handle =
    typeof from === "number"
      ? native.givenHandle((out) => native.module._brindle_markov_new!(from, out))
      : native.withText(from, (place) =>
          native.givenHandle((out) => native.module._brindle_markov_read!(place, out)),
        );
  return new Markov(native, handle);
}
