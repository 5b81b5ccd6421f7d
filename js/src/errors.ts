/** What kind of fault it is. */
export type Status = "argument" | "input" | "file" | "not-found" | "memory" | "internal";

const statuses: Status[] = ["argument", "input", "file", "not-found", "memory", "internal"];

/** The name of a status of the library, from 1. */
export function statusOf(code: number): Status {
  return statuses[code - 1] ?? "internal";
}

/** What the library says is wrong. */
export class BrindleError extends Error {
  override name = "BrindleError";
  constructor(
    readonly status: Status,
    /** What is wrong, a line for people. */
    readonly text: string,
    /** The character, from 1, of what was handed in; 0 for nowhere. */
    readonly position = 0,
  ) {
    super(text);
  }
}

/** What is wrong with a song, or was left out of it. */
export interface Fault {
  /** From 1; 0 where it is the whole song. */
  line: number;
  /** In characters from 1. */
  column: number;
  /** All chords are there, something else was left out. */
  isNote: boolean;
  text: string;
}

/** A song that cannot be read; its first fault is the message. */
export class SongError extends BrindleError {
  override name = "SongError";
  readonly line: number;
  readonly column: number;
  constructor(readonly faults: Fault[], position: number) {
    const first = faults.find((fault) => !fault.isNote) ?? faults[0];
    super("input", first?.text ?? "this is no song", position);
    this.line = first?.line ?? 0;
    this.column = first?.column ?? 0;
  }
}
