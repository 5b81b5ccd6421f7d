import type { Source } from "../engine/Types";

/** Larger files are no songs. */
export const largestFile = 20_000_000;
/** Longer texts are shown in part only: a browser types no longer smoothly in them. */
const longestTyped = 200_000;

/** What a dropped or chosen file holds; an error tells in words for people why it cannot be read. */
export async function readFile(file: File): Promise<Source> {
  if (file.size > largestFile) {
    throw new Error(`${file.name} has ${Math.round(file.size / 1e6)} MB, more than a song has.`);
  }
  const bytes = new Uint8Array(await file.arrayBuffer());
  if (isScore(file.name, bytes)) return { kind: "score", name: file.name, bytes };
  const text = asText(bytes);
  if (text === null) throw new Error(`${file.name} is neither a score nor a text.`);
  if (text.length > longestTyped) {
    throw new Error(`${file.name} has ${text.length} characters, more than a song has.`);
  }
  return { kind: "text", text };
}

/** By its first bytes, as names of files lie: a package (.mxl) or an XML document. */
function isScore(name: string, bytes: Uint8Array): boolean {
  if (bytes[0] === 0x50 && bytes[1] === 0x4b) return true;
  if (/\.(musicxml|mxl)$/i.test(name)) return true;
  const head = new TextDecoder("latin1").decode(bytes.subarray(0, 200));
  return /^[\s\xef\xbb\xbf\xff\xfe\0]*<[\s\0]*[?!]/.test(head) && /x\0?m\0?l|score/i.test(head);
}

function asText(bytes: Uint8Array): string | null {
  try {
    const text = new TextDecoder("utf-8", { fatal: true }).decode(bytes);
    return text.includes("\0") ? null : text;
  } catch {
    return null;
  }
}
