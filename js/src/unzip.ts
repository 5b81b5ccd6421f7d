import { unzipSync } from "fflate";

// The limits of the library for containers.
const mostEntries = 10_000;
const mostBytes = 256 * 2 ** 20;

/** The files of a zip container by name; null for one that is damaged or too large. */
export function unzip(bytes: Uint8Array): [string, Uint8Array][] | null {
  let entries = 0;
  let size = 0;
  const filter = ({ originalSize }: { originalSize: number }): boolean => {
    entries += 1;
    size += originalSize;
    if (entries > mostEntries || size > mostBytes) throw new Error("too large");
    return true;
  };
  try {
    return Object.entries(unzipSync(bytes, { filter }));
  } catch {
    return null;
  }
}
