// What a visitor finds again: kept in this browser alone.

const keys = { text: "brindle.text", theme: "brindle.theme", tuning: "brindle.tuning" } as const;

/** Storage may be switched off or full; the page works without. */
export function recall(key: keyof typeof keys): string | null {
  try {
    return localStorage.getItem(keys[key]);
  } catch {
    return null;
  }
}

export function remember(key: keyof typeof keys, value: string): void {
  try {
    localStorage.setItem(keys[key], value);
  } catch {
    // Nothing is lost but the memory.
  }
}
