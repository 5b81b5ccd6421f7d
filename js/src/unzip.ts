import { unzipSync } from "fflate";
import { crc32 } from "./crc32.js";

// The limits of the library for containers.
const mostEntries = 10_000;
const mostBytes = 256 * 2 ** 20;

const endMark = 0x06054b50;
const endSize = 22;
const longestComment = 0xffff;
const entrySize = 46;

/** Where the directory of a container begins, behind all files; -1 if there is none. */
function directoryOf(view: DataView): number {
  const last = view.byteLength - endSize;
  for (let at = last; at >= Math.max(0, last - longestComment); --at) {
    if (view.getUint32(at, true) !== endMark) continue;
    const place = view.getUint32(at + 16, true);
    if (place !== 0xffffffff) return place;
    // Written with 64 bits: a locator in front tells where another end is.
    return Number(view.getBigUint64(Number(view.getBigUint64(at - 12, true)) + 48, true));
  }
  return -1;
}

/** The files of a zip container by name; null for one that is damaged or too large. */
export function unzip(bytes: Uint8Array): [string, Uint8Array][] | null {
  const view = new DataView(bytes.buffer, bytes.byteOffset, bytes.byteLength);
  const checksums = new Map<string, number>();
  let entries = 0;
  let size = 0;
  try {
    let entry = directoryOf(view);
    // Is asked in the order of the directory.
    const filter = ({ name, originalSize }: { name: string; originalSize: number }): boolean => {
      entries += 1;
      size += originalSize;
      if (entries > mostEntries || size > mostBytes) throw new Error("too large");
      checksums.set(name, view.getUint32(entry + 16, true));
      const lengths = [28, 30, 32].map((at) => view.getUint16(entry + at, true));
      entry += lengths.reduce((sum, length) => sum + length, entrySize);
      return true;
    };
    const files = Object.entries(unzipSync(bytes, { filter }));
    return files.every(([name, contents]) => crc32(contents) === checksums.get(name)) ? files : null;
  } catch {
    return null;
  }
}
