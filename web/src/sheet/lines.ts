import type { Run, Sheet, SheetBar, SheetChord } from "../engine/Types";

/** A bar of a line, by its index in the sheet. */
export interface LineBar {
  index: number;
  bar: SheetBar;
}

/** A line of the sheet and how many bars fit on it. */
export interface Line {
  bars: LineBar[];
  columns: number;
  /** A single bar that is wider than the sheet; its chords go on below. */
  isTooFull: boolean;
}

/** Sizes in pixels that lines are broken by. */
export interface LineSizes {
  /** Of the whole sheet. */
  width: number;
  symbol: number;
  numeral: number;
}

const usualBars = 4;
const narrowestBar = 118;

/** The width of a text, a little more than fonts need. */
function widthOf(runs: Run[], size: number): number {
  return runs.reduce((sum, [text, part]) => sum + text.length * part, 0) * size * 0.58;
}

function isSame(a: SheetChord, b: SheetChord): boolean {
  return a.Symbol === b.Symbol && a.Numeral === b.Numeral;
}

/** The chords that are written in a bar, by their indices: equal neighbours once. */
export function writtenChords(sheet: Sheet, bar: SheetBar): number[] {
  const all = Array.from({ length: bar.End - bar.Begin }, (_, i) => bar.Begin + i);
  return all.filter((chord, i) => i === 0 || !isSame(sheet.Chords[chord - 1]!, sheet.Chords[chord]!));
}

function barWidth(sheet: Sheet, bar: SheetBar, sizes: LineSizes): number {
  const chords = writtenChords(sheet, bar).map((chord) => sheet.Chords[chord]!);
  if (bar.Held !== null && sheet.Chords[bar.Held]) chords.push(sheet.Chords[bar.Held]!);
  const signs = (bar.BeginsRepeat ? 14 : 0) + (bar.EndsRepeat ? 14 : 0) + (bar.Time ? 20 : 0);
  const texts = chords.map((chord) =>
    Math.max(widthOf(chord.Runs, sizes.symbol), widthOf(chord.NumeralRuns, sizes.numeral)),
  );
  return texts.reduce((sum, width) => sum + width + 18, signs);
}

/** Bars that a line has at that width: 4, 2 or 1, so that phrases stay at their places. */
function barsPerLine(width: number): number {
  let bars = usualBars;
  while (bars > 1 && width / bars < narrowestBar) bars /= 2;
  return bars;
}

/** A segno stands where it stands; the eye looks for a coda at the begin of a line. */
function beginsLine(bar: SheetBar): boolean {
  return bar.BeginsSection || bar.Remark !== "" || bar.Sign === "coda";
}

/** The bars in lines. A line ends before a part; one that is too full is halved. */
export function breakLines(sheet: Sheet, bars: SheetBar[], sizes: LineSizes): Line[] {
  const most = barsPerLine(sizes.width);
  const lines: Line[] = [];
  for (let begin = 0; begin < bars.length; ) {
    let end = begin;
    let count = 0;
    while (end < bars.length && (end === begin || !beginsLine(bars[end]!))) {
      if (!bars[end]!.IsUpbeat && ++count > most) break;
      ++end;
    }
    pushLine(lines, sheet, bars, begin, end, most, sizes);
    begin = end;
  }
  return lines;
}

function pushLine(
  lines: Line[],
  sheet: Sheet,
  bars: SheetBar[],
  begin: number,
  end: number,
  columns: number,
  sizes: LineSizes,
): void {
  const part = bars.slice(begin, end);
  const width = part.reduce((sum, bar) => sum + barWidth(sheet, bar, sizes), 0);
  if (width > sizes.width && part.length > 1) {
    const half = begin + Math.ceil(part.length / 2);
    const halved = Math.max(1, Math.ceil(columns / 2));
    pushLine(lines, sheet, bars, begin, half, halved, sizes);
    pushLine(lines, sheet, bars, half, end, halved, sizes);
    return;
  }
  const line = part.map((bar, i) => ({ index: begin + i, bar }));
  lines.push({
    bars: line,
    columns: Math.max(columns, part.length),
    isTooFull: width > sizes.width,
  });
}
