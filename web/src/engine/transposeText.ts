// A typed song is transposed in its own text, so that its words, marks and lay-out stay. The library
// does not tell where in a text a chord stands, so words are taken for chords line by line, and what
// comes of that counts only where the library reads it as the transposed song.

/** What has to be the same of a changed text and the transposed song. */
export interface Heard {
  /** Titles and names of parts, which are no chords. */
  words: string[];
  /** Of the stated key; null without one. */
  tonic: number | null;
  chords: HeardChord[];
}

export interface HeardChord {
  symbol: string;
  position: number;
  /** Tells chords of other tones or another bass apart. */
  tones: string;
}

/** A chord and the blanks behind it. */
const wordWithBlanks = /([^\s|]+)([ \t]*)/g;
const bracketed = /\[([^\s\][]+)\]/g;

/** What may part chords within a word, as in `C-G-Am`. */
const separators = /(->|[-–—→>,;])/;

type Names = Map<string, string>;

/** The name of a word in the other key, or of each chord between its separators; undefined for other words. */
function renamed(word: string, names: Names): string | undefined {
  const isChord = (piece: string, i: number) => i % 2 === 1 || piece === "" || names.has(piece);
  const pieces = names.has(word) ? [word] : word.split(separators);
  return pieces.every(isChord) ? pieces.map((piece) => names.get(piece) ?? piece).join("") : undefined;
}

/** Chords of a line with those below words kept above them where there are blanks for it. */
function renamedChords(line: string, names: Names): string {
  let late = 0;
  return line.replace(wordWithBlanks, (_, word: string, blanks: string) => {
    const name = renamed(word, names) ?? word;
    late += name.length - word.length;
    if (blanks.length < 2) return name + blanks;
    const kept = Math.max(1, blanks.length - late);
    late -= blanks.length - kept;
    return name + " ".repeat(kept);
  });
}

function renamedInBrackets(line: string, names: Names): string {
  return line.replace(bracketed, (whole, word: string) => {
    const name = renamed(word, names);
    return name === undefined ? whole : `[${name}]`;
  });
}

/** How much of a line is chords, 0 to 1; signs between them do not count. */
function shareOfChords(line: string, names: Names): number {
  const words = line.split(/[\s|]+/).filter((word) => /^\p{L}/u.test(word));
  return words.length === 0 ? 0 : words.filter((word) => renamed(word, names) !== undefined).length / words.length;
}

interface Guess {
  /** The least share of chords in a line of them. */
  share: number;
  /** Whether a bracket on a line by itself is a chord and not the name of a part. */
  isPartChord: boolean;
}

const guesses: Guess[] = [
  { share: 1, isPartChord: false },
  { share: 0.5, isPartChord: false },
  { share: 1, isPartChord: true },
  { share: 0.5, isPartChord: true },
];

function renamedLine(line: string, names: Names, key: string | null, { share, isPartChord }: Guess): string {
  if (key !== null && /^\s*\{\s*key\s*:/i.test(line)) return `{key: ${key}}`;
  if (/^\s*\{/.test(line)) return line;
  if (/^\s*\[[^\]]*\]\s*$/.test(line) && !isPartChord) return line;
  return shareOfChords(line, names) >= share ? renamedChords(line, names) : renamedInBrackets(line, names);
}

function isSame(a: Heard, b: Heard): boolean {
  return (
    a.tonic === b.tonic &&
    a.words.join("\n") === b.words.join("\n") &&
    a.chords.length === b.chords.length &&
    a.chords.every(({ position, tones }, i) => tones === b.chords[i]!.tones && Math.abs(position - b.chords[i]!.position) < 1e-6)
  );
}

/**
 * The text with its chords in another key; null where that cannot be had in the text as it is.
 * `before` is what it is read as and `after` the transposed song, whose stated key is named `key`.
 */
export function transposeText(text: string, before: Heard, after: Heard, key: string | null, read: (text: string) => Heard): string | null {
  const names: Names = new Map(before.chords.map(({ symbol }, i) => [symbol, after.chords[i]?.symbol ?? symbol]));
  const lines = text.split("\n");
  for (const guess of guesses) {
    const changed = lines.map((line) => renamedLine(line, names, key, guess)).join("\n");
    if (isSame(read(changed), after)) return changed;
  }
  return null;
}
