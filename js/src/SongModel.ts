import type { Chord } from "./Chord.js";
import type { MarkovGenerateJson, MarkovScoreJson, MarkovSongsJson } from "./generated/schemas.js";
import { Handle } from "./Handle.js";
import type { Native } from "./Native.js";
import { nextChords, type NextChords, type NextOptions } from "./next.js";
import { Record } from "./Record.js";
import { Song } from "./Song.js";
import { putKey, rawKeyOfText } from "./values.js";

/** What song is wanted. What is not said asks for nothing. */
export interface SongRequest {
  /** "Eb", "A minor"; C major if it is not said. */
  key?: string;
  /** A letter for each part, "AABA", or "blues". */
  form?: string;
  /** 1 to 256; those of the sheet, or 12 of a blues, or 32 if it is not said. */
  bars?: number;
  /** 1 to 24; 4 if it is not said. */
  beatsPerBar?: number;
  /** Chords that are fixed, and _ for gaps: "C . Am . | _ | G7". */
  sheet?: string;
  /** The first chord, or its numeral. */
  begins?: string;
  /** The last one; a chord on the tonic if it is not said. */
  ends?: string;
  /** Rows of chords that stand somewhere, "ii-V-I of F"; several between ;. */
  contains?: string;
  /** Chords or numerals that do not occur. */
  never?: string;
  /** The longest passage that may stand just so in a song of the model, in bars; 0 for any, 4 if it
   * is not said. */
  mostQuotedBars?: number;
  /** The longest history, 1 to 5 chords; 5 if it is not said. */
  order?: number;
  /** The same seed, model and wishes give the same song; 0 if it is not said. */
  seed?: number | bigint;
}

/** A passage of a written song that stands just so in a song of the model; in bars from 1. */
export interface Quote {
  title: string;
  sourceBar: number;
  bar: number;
  bars: number;
}

/** A song that a model wrote. */
export interface WrittenSong {
  /** To be analysed, transposed, drawn; it is freed as any other song. */
  song: Song;
  /** As a chord text, each part under its letter in brackets. */
  text: string;
  /** The longest of all that stand in it; null for none. */
  quote: Quote | null;
}

/** A song that a model was made of. */
export interface ModelSong {
  title: string;
  /** With years, of a song that comes with the library. */
  makers: string;
  style: string;
  /** "G major" */
  key: string;
  /** How many it has. */
  chords: number;
}

type WrittenJson = Extract<MarkovGenerateJson, { Text: string }>;

const requestSize = 72;

/** What songs have in common: which chord follows which in a key, where in the bar, how long. It
 * never changes. */
export class SongModel extends Handle {
  /** @internal */
  constructor(native: Native, handle: number) {
    super(native, "_brindle_song_model_free", handle);
  }

  /** The songs that it was made of. */
  get songs(): ModelSong[] {
    const told = this.#json("songs_json", (call, out) => call(this.handle, out)) as MarkovSongsJson;
    return told.Songs.map((song) => ({
      title: song.Title,
      makers: song.Makers,
      style: song.Style,
      key: song.Key,
      chords: song.Chords,
    }));
  }
  /** The model of its songs of a style; throws if there are none. */
  ofStyle(style: string): SongModel {
    const { native } = this;
    return native.withText(style, (place) =>
      this.#made((out) => native.module._brindle_song_model_of_style!(this.handle, place, out)),
    );
  }
  /** The model of the songs of both. */
  join(other: SongModel): SongModel {
    const { module } = this.native;
    return this.#made((out) => module._brindle_song_model_join!(this.handle, other.handle, out));
  }
  /** What may come behind chords; `style` counts only where the library is asked. */
  next(chords: readonly (Chord | string)[], options: NextOptions = {}): NextChords {
    return nextChords(this.native, this.handle, chords, options);
  }
  /** Writes a new song; throws what is not understood, and the smallest set of wishes that
   * contradicts itself. */
  writeSong(request: SongRequest = {}): WrittenSong {
    const { native } = this;
    return withRequest(native, request, (place) => {
      const out = native.result;
      const write = native.module._brindle_song_model_write_song!;
      native.check(write(this.handle, place, out, out + 8));
      const song = new Song(native, native.view.getUint32(out, true));
      const text = native.view.getUint32(out + 8, true);
      try {
        return written(song, JSON.parse(native.text(text)) as WrittenJson);
      } finally {
        native.module._brindle_free!(text);
      }
    });
  }
  /** How well it foretells songs, in bits a chord; its own songs if there are none. */
  score(songs: readonly Song[] = []): MarkovScoreJson {
    return withHandles(this.native, songs, (place) =>
      this.#json("score_json", (call, out) => call(this.handle, place, songs.length, out)),
    ) as MarkovScoreJson;
  }
  /** The text of a model file, which `songModel` reads. */
  toText(): string {
    return this.native.givenText((out) =>
      this.native.module._brindle_song_model_write!(this.handle, out),
    );
  }

  #made(call: (out: number) => number): SongModel {
    return new SongModel(this.native, this.native.givenHandle(call));
  }
  #json(what: string, call: (of: (...args: number[]) => number, out: number) => number): unknown {
    const { native } = this;
    const of = native.module[`_brindle_song_model_${what}`]!;
    return JSON.parse(native.givenText((out) => call(of, out)));
  }
}

/** The model of the songs that come with the library, of a text, or of songs. */
export function songModelOf(native: Native, from: string | readonly Song[] | undefined): SongModel {
  const { module } = native;
  if (typeof from === "string") {
    const handle = native.withText(from, (place) =>
      native.givenHandle((out) => module._brindle_song_model_read!(place, out)),
    );
    return new SongModel(native, handle);
  }
  if (from === undefined) {
    return new SongModel(native, native.givenHandle((out) => module._brindle_song_model_built_in!(0, out)));
  }
  const handle = withHandles(native, from, (place) =>
    native.givenHandle((out) => module._brindle_song_model_learn!(place, from.length, out)),
  );
  return new SongModel(native, handle);
}

function withHandles<T>(native: Native, songs: readonly Song[], call: (place: number) => T): T {
  return native.withRoom(4 * songs.length, (place) => {
    const list = new Record(native, place);
    for (const song of songs) list.putInt(song.handle);
    return call(place);
  });
}

/** Calls with texts, 0 for one that is not told. */
function withTexts<T>(
  native: Native,
  texts: readonly (string | undefined)[],
  call: (places: number[]) => T,
): T {
  const [first, ...others] = texts;
  if (texts.length === 0) return call([]);
  if (!first) return withTexts(native, others, (places) => call([0, ...places]));
  return native.withText(first, (place) =>
    withTexts(native, others, (places) => call([place, ...places])),
  );
}

function withRequest<T>(native: Native, request: SongRequest, call: (place: number) => T): T {
  const { form, sheet, begins, ends, contains, never } = request;
  const key = rawKeyOfText(native, request.key ?? "C");
  return withTexts(native, [form, sheet, begins, ends, contains, never], (texts) =>
    native.withRoom(requestSize, (place) => {
      const record = putKey(new Record(native, place), key)
        .putInt(texts[0]!)
        .putInt(request.bars ?? 0)
        .putInt(request.beatsPerBar ?? 4);
      for (const text of texts.slice(1)) record.putInt(text);
      record
        .putDouble(request.mostQuotedBars ?? 4)
        .putInt(request.order ?? 5)
        .putLong(BigInt(request.seed ?? 0));
      return call(place);
    }),
  );
}

function written(song: Song, json: WrittenJson): WrittenSong {
  const quote = json.LongestQuote;
  const told = quote && {
    title: quote.Title,
    sourceBar: quote.SourceBar,
    bar: quote.Bar,
    bars: quote.Bars,
  };
  return { song, text: json.Text, quote: told };
}
