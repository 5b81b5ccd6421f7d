// A link holds the whole song behind its "#", which browsers never send to a server.

import type { Names } from "../engine/Types";

/** What a link holds. */
export interface SharedSong {
  text: string;
  names: Names;
  tempo: number;
}

const prefix = "#song=";
/** Characters of a link that are looked at; longer ones do not come from this page. */
const longestLink = 100_000;
/** Bytes of a song that a link may unfold to. */
export const longestText = 1_000_000;

const namesOfLinks: readonly string[] = ["typed", "letters", "german", "solfege", "nashville", "roman"];

/** The link to a song, as the part of an address from "#" on; an error for one that no link can hold. */
export async function writeLink(song: SharedSong): Promise<string> {
  const bytes = new TextEncoder().encode(JSON.stringify(song));
  const packed = new Blob([bytes]).stream().pipeThrough(new CompressionStream("deflate-raw"));
  const text = Array.from(new Uint8Array(await new Response(packed).arrayBuffer()), (byte) =>
    String.fromCharCode(byte),
  ).join("");
  const link = prefix + btoa(text).replaceAll("+", "-").replaceAll("/", "_").replace(/=+$/, "");
  if (link.length > longestLink || bytes.length > longestText) throw new Error("This song is too long for a link.");
  return link;
}

/** Whether an address means to hold a song, readable or not. */
export function isLink(hash: string): boolean {
  return hash.startsWith(prefix);
}

/** The song of a link; null for what is none, is broken or unfolds to too much. */
export async function readLink(hash: string): Promise<SharedSong | null> {
  if (!isLink(hash) || hash.length > longestLink) return null;
  try {
    const text = atob(hash.slice(prefix.length).replaceAll("-", "+").replaceAll("_", "/"));
    return songOf(JSON.parse(await unfold(Uint8Array.from(text, (c) => c.charCodeAt(0)))));
  } catch {
    return null;
  }
}

async function unfold(bytes: Uint8Array<ArrayBuffer>): Promise<string> {
  const reader = new Blob([bytes])
    .stream()
    .pipeThrough(new DecompressionStream("deflate-raw"))
    .getReader();
  const parts: Uint8Array<ArrayBuffer>[] = [];
  let size = 0;
  for (;;) {
    const { done, value } = await reader.read();
    if (done) return new Blob(parts).text();
    size += value.length;
    if (size > longestText) {
      await reader.cancel();
      throw new Error("too long");
    }
    parts.push(value as Uint8Array<ArrayBuffer>);
  }
}

function songOf(value: unknown): SharedSong | null {
  if (typeof value !== "object" || value === null) return null;
  const { text, names, tempo } = value as Record<string, unknown>;
  if (typeof text !== "string") return null;
  const isNames = typeof names === "string" && namesOfLinks.includes(names);
  const isTempo = typeof tempo === "number" && tempo >= 30 && tempo <= 300;
  return { text, names: isNames ? (names as Names) : "typed", tempo: isTempo ? tempo : 120 };
}
