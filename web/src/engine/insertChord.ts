// A chord is put into the text that the visitor typed, whatever its form. The library does not tell
// where in a text a chord stands, so places are tried until it reads the text as it is meant.

const mostPlaces = 200;

/** The symbols of the chords that a text is read as. */
export type ReadSymbols = (text: string) => string[];

interface Place {
  begin: number;
  end: number;
}

/** Where a symbol stands in a text by itself. */
function placesOf(text: string, symbol: string): Place[] {
  const places: Place[] = [];
  const isOpen = (character: string | undefined) => character === undefined || /[\s|[\](),;:{}]/.test(character);
  for (let at = text.indexOf(symbol); at >= 0 && places.length < mostPlaces; at = text.indexOf(symbol, at + 1)) {
    const end = at + symbol.length;
    if (isOpen(text[at - 1]) && isOpen(text[end])) places.push({ begin: at, end });
  }
  return places;
}

/** The text with a chord behind the one at a place: on one of its holds, or beside it. */
function textsWith(text: string, { end }: Place, symbol: string): string[] {
  const behind = text.slice(end);
  if (behind.startsWith("]")) return [`${text.slice(0, end)}][${symbol}${behind}`];
  const texts = [`${text.slice(0, end)} ${symbol}${behind}`];
  const holds = /^(?:[ \t]+\.)+/.exec(behind)?.[0];
  if (holds) {
    // The later half of its time goes to the new chord.
    const dots = [...holds.matchAll(/\./g)].map(({ index }) => end + index);
    const dot = dots[Math.floor((dots.length - 1) / 2)]!;
    texts.unshift(text.slice(0, dot) + symbol + text.slice(dot + 1));
  }
  return texts;
}

/** The text with a chord in a bar or on a line of its own at the end. */
function textsWithLast(text: string, symbol: string): string[] {
  const body = text.trimEnd();
  const bar = body.endsWith("|") ? `${body} ${symbol}` : `${body} | ${symbol}`;
  return [bar, `${body}\n${symbol}`, `${body}\n[${symbol}]`];
}

/** The text with `symbol` behind chord `index`; null where no place is found that reads so. */
export function insertChord(text: string, index: number, symbol: string, read: ReadSymbols): string | null {
  const before = read(text);
  const isMeant = (changed: string) => {
    const after = read(changed);
    return after.length > before.length && after[index + 1] === symbol && before.slice(0, index + 1).every((known, i) => after[i] === known);
  };
  const isLast = index === before.length - 1;
  const changes = isLast ? textsWithLast(text, symbol) : [];
  for (const place of placesOf(text, before[index] ?? "")) changes.push(...textsWith(text, place, symbol));
  return changes.find(isMeant) ?? null;
}
