// Reads the notes of the MIDI files that the library writes, so that what plays is what is saved.

import type { Note } from "../engine/Types";

const headLength = 14;

/** A number of up to four bytes of seven bits each, and where the next byte is. */
function variable(bytes: Uint8Array, at: number): [value: number, next: number] {
  let value = 0;
  for (let i = at; ; ++i) {
    const byte = bytes[i] ?? 0;
    value = (value << 7) | (byte & 0x7f);
    if (byte < 0x80) return [value, i + 1];
  }
}

/** The notes of a Standard MIDI File by their beginnings, in quarter notes. */
export function midiNotes(bytes: Uint8Array): Note[] {
  const view = new DataView(bytes.buffer, bytes.byteOffset, bytes.byteLength);
  const ticks = view.getUint16(12);
  const notes: Note[] = [];
  for (let at = headLength; at + 8 <= bytes.length; ) {
    const length = view.getUint32(at + 4);
    readTrack(bytes.subarray(at + 8, at + 8 + length), ticks, notes);
    at += 8 + length;
  }
  return notes.sort((a, b) => a.Position - b.Position);
}

function readTrack(bytes: Uint8Array, ticks: number, notes: Note[]): void {
  const sounding = new Map<number, Note>();
  let tick = 0;
  let status = 0;
  for (let at = 0; at < bytes.length; ) {
    const [wait, next] = variable(bytes, at);
    tick += wait;
    at = next;
    if (bytes[at]! >= 0x80) status = bytes[at++]!;
    if (status >= 0xf0) {
      // Text, tempo and the like.
      const [length, data] = variable(bytes, status === 0xff ? at + 1 : at);
      at = data + length;
      continue;
    }
    const kind = status & 0xf0;
    const key = ((status & 0x0f) << 7) | bytes[at]!;
    const begun = sounding.get(key);
    if ((kind === 0x80 || kind === 0x90) && begun) {
      begun.Length = tick / ticks - begun.Position;
      sounding.delete(key);
    }
    if (kind === 0x90 && bytes[at + 1]! > 0) {
      const note = { Position: tick / ticks, Length: 0, NoteNr: bytes[at]!, Velocity: bytes[at + 1]! };
      sounding.set(key, note);
      notes.push(note);
    }
    at += kind === 0xc0 || kind === 0xd0 ? 1 : 2;
  }
}
