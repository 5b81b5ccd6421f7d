import type { Fault } from "../engine/Types";

/** A piece of the text; `fault` is the number of the fault that stands there. */
export interface MarkedPiece {
  text: string;
  fault: number | null;
}

/** Where a fault stands in a text, in UTF-16 units: up to the next blank or bar line. */
export function placeOf(text: string, fault: Fault): [begin: number, end: number] | null {
  if (fault.line < 1) return null;
  const lines = text.split("\n");
  const line = lines[fault.line - 1];
  if (line === undefined) return null;
  const lineBegin = lines.slice(0, fault.line - 1).reduce((sum, before) => sum + before.length + 1, 0);
  const before = Array.from(line).slice(0, Math.max(0, fault.column - 1)).join("").length;
  const tail = /^[^\s|\]]*/.exec(line.slice(before))?.[0].length ?? 0;
  const head = /[^\s|\[]*$/.exec(line.slice(0, before))?.[0].length ?? 0;
  if (head + tail === 0) return null;
  return [lineBegin + before - head, lineBegin + before + tail];
}

/** The text in pieces, those with a fault apart. */
export function markFaults(text: string, faults: Fault[]): MarkedPiece[] {
  const places = faults
    .map((fault, number) => ({ place: placeOf(text, fault), number }))
    .filter((mark) => mark.place !== null)
    .sort((a, b) => a.place![0] - b.place![0]);
  const pieces: MarkedPiece[] = [];
  let end = 0;
  for (const { place, number } of places) {
    const [from, to] = place!;
    if (from < end) continue;
    pieces.push({ text: text.slice(end, from), fault: null }, { text: text.slice(from, to), fault: number });
    end = to;
  }
  pieces.push({ text: text.slice(end), fault: null });
  return pieces;
}
