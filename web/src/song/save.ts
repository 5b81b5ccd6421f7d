/** Gives the visitor a file. */
export function save(name: string, type: string, bytes: Uint8Array): void {
  const address = URL.createObjectURL(new Blob([bytes as Uint8Array<ArrayBuffer>], { type }));
  const link = document.createElement("a");
  link.href = address;
  link.download = name;
  link.click();
  // The browser has begun to save by then.
  setTimeout(() => URL.revokeObjectURL(address), 10_000);
}

/** A title as the name of a file, whatever stands in it. */
export function fileName(title: string, ending: string): string {
  const plain = title.normalize("NFKD").replace(/[^\p{L}\p{N}]+/gu, "-").replace(/^-+|-+$/g, "").slice(0, 60);
  return `${plain.toLowerCase() || "song"}.${ending}`;
}
