/** What eight further bits make of each byte of the remainder. */
const table = Uint32Array.from({ length: 256 }, (_, byte) => {
  let rest = byte;
  for (let bit = 0; bit < 8; ++bit) rest = rest & 1 ? 0xedb88320 ^ (rest >>> 1) : rest >>> 1;
  return rest;
});

/** The checksum of zip containers; what unzips them does not look at it. */
export function crc32(bytes: Uint8Array): number {
  let rest = 0xffffffff;
  for (const byte of bytes) rest = table[(rest ^ byte) & 0xff]! ^ (rest >>> 8);
  return (rest ^ 0xffffffff) >>> 0;
}
