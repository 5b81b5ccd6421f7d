import { BrindleError, statusOf } from "./errors.js";

/** The module of emscripten: its memory and the C functions, numbers in and out. */
export interface Module {
  HEAPU8: Uint8Array<ArrayBuffer>;
  _malloc(size: number): number;
  _free(place: number): void;
  [name: `_brindle_${string}`]: (...args: number[]) => number;
}

const scratchSize = 1024;
const resultSize = 256;
const encoder = new TextEncoder();
const decoder = new TextDecoder();

/** Calls of the C interface: texts, records and errors cross the border here. */
export class Native {
  /** Room for a record that a function fills. */
  readonly result: number;
  /** By pitch class and accidental. */
  readonly toneNames = new Map<number, string>();
  readonly #scratch: number;
  #view: DataView;
  #isScratchUsed = false;

  constructor(readonly module: Module) {
    this.result = module._malloc(resultSize);
    this.#scratch = module._malloc(scratchSize);
    this.#view = new DataView(module.HEAPU8.buffer);
  }

  /** The memory as it is now: it is another one after it has grown. */
  get view(): DataView {
    const { buffer } = this.module.HEAPU8;
    if (this.#view.buffer !== buffer) this.#view = new DataView(buffer);
    return this.#view;
  }

  /** Throws what the library says, unless the status is 0. */
  check(status: number): void {
    if (status !== 0) throw this.lastError(status);
  }

  lastError(status: number): BrindleError {
    const text = this.text(this.module._brindle_last_error!());
    return new BrindleError(statusOf(status), text, this.module._brindle_last_error_position!());
  }

  /** A text that belongs to the library. */
  text(place: number): string {
    if (place === 0) return "";
    const bytes = this.module.HEAPU8;
    // Most are short and ASCII, for which a loop is quickest.
    const near = place + 64;
    let end = place;
    let ascii = 0;
    for (; end < near && bytes[end] !== 0; ++end) ascii |= bytes[end]!;
    if (ascii > 127 || end === near) return decoder.decode(bytes.subarray(place, bytes.indexOf(0, end)));
    let text = "";
    for (let at = place; at < end; ++at) text += String.fromCharCode(bytes[at]!);
    return text;
  }

  /** Calls with a text that ends with a NUL. */
  withText<T>(text: string, call: (place: number) => T): T {
    if (this.#putShortText(text)) return this.#withScratch(call);
    if (text.includes("\0")) throw new BrindleError("argument", "a text has no NUL in it");
    return this.withBytes(encoder.encode(text + "\0"), call);
  }

  withBytes<T>(bytes: Uint8Array, call: (place: number, size: number) => T): T {
    const place = this.allocate(bytes.length);
    try {
      this.module.HEAPU8.set(bytes, place);
      return call(place, bytes.length);
    } finally {
      this.module._free(place);
    }
  }

  /** Calls with room for so many bytes. */
  withRoom<T>(size: number, call: (place: number) => T): T {
    const place = this.allocate(size);
    try {
      return call(place);
    } finally {
      this.module._free(place);
    }
  }

  /** The text that a function gives to its last argument. */
  givenText(call: (out: number) => number): string {
    this.check(call(this.result));
    const place = this.view.getUint32(this.result, true);
    try {
      return this.text(place);
    } finally {
      this.module._brindle_free!(place);
    }
  }

  /** The bytes that a function gives to its last two arguments. */
  givenBytes(call: (out: number, size: number) => number): Uint8Array {
    const sizeAt = this.result + 8;
    this.check(call(this.result, sizeAt));
    const place = this.view.getUint32(this.result, true);
    const size = this.view.getUint32(sizeAt, true);
    try {
      return this.module.HEAPU8.slice(place, place + size);
    } finally {
      this.module._brindle_free!(place);
    }
  }

  /** The handle that a function gives to its last argument. */
  givenHandle(call: (out: number) => number): number {
    this.check(call(this.result));
    return this.view.getUint32(this.result, true);
  }

  private allocate(size: number): number {
    const place = this.module._malloc(Math.max(1, size));
    if (place === 0) throw new BrindleError("memory", "there is not enough memory");
    return place;
  }

  #withScratch<T>(call: (place: number) => T): T {
    this.#isScratchUsed = true;
    try {
      return call(this.#scratch);
    } finally {
      this.#isScratchUsed = false;
    }
  }

  /** Puts a short text in ASCII, which most are, into the scratch; false for any other. */
  #putShortText(text: string): boolean {
    if (this.#isScratchUsed || text.length >= scratchSize) return false;
    const bytes = this.module.HEAPU8;
    for (let at = 0; at < text.length; ++at) {
      const unit = text.charCodeAt(at);
      if (unit === 0 || unit > 127) return false;
      bytes[this.#scratch + at] = unit;
    }
    bytes[this.#scratch + text.length] = 0;
    return true;
  }
}
