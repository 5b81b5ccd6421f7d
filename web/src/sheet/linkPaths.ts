// Arrows above the chords and brackets below them, in pixels of the sheet.

import type { SheetLink } from "../engine/Types";

/** Where a chord stands. */
export interface Place {
  line: number;
  /** Of the symbol. */
  left: number;
  right: number;
  /** Of the repeat sign behind it, or of its line. */
  back: number;
  /** Of the band with the chords of its line. */
  top: number;
  bottom: number;
}

/** A line of the sheet: where its chords may lie. */
export interface LinePlace {
  left: number;
  right: number;
  top: number;
  bottom: number;
}

/** A curve to be drawn; the last piece of an arrow has its head. */
export interface LinkPath {
  line: number;
  /** How many others an arrow has below it. */
  level: number;
  d: string;
  isDotted: boolean;
  hasHead: boolean;
}

interface Piece {
  line: number;
  from: number;
  to: number;
  comesFromBefore: boolean;
  goesOn: boolean;
}

const arrowGap = 4;
const bracketGap = 3;

/** A link as its pieces, one a line. */
function piecesOf(from: Place, to: Place, lines: LinePlace[], startX: number, endX: number): Piece[] {
  const last = to.line;
  const pieces: Piece[] = [];
  for (let line = from.line; line <= last; ++line) {
    const isFirst = line === from.line;
    const isLast = line === last;
    pieces.push({
      line,
      from: isFirst ? startX : lines[line]!.left - 8,
      to: isLast ? endX : lines[line]!.right + 4,
      comesFromBefore: !isFirst,
      goesOn: !isLast,
    });
  }
  return pieces;
}

/** The lowest level on which a piece touches no other; shorter ones come first. */
function levelsOf(pieces: Piece[]): number[] {
  const levels = pieces.map(() => 0);
  const order = pieces.map((_, i) => i).sort((a, b) => width(pieces[a]!) - width(pieces[b]!));
  const taken: Piece[][][] = [];
  for (const i of order) {
    const piece = pieces[i]!;
    const onLine = (taken[piece.line] ??= []);
    let level = 0;
    while (onLine[level]?.some((other) => piece.from < other.to - 6 && other.from < piece.to - 6)) ++level;
    (onLine[level] ??= []).push(piece);
    levels[i] = level;
  }
  return levels;
}

function width(piece: Piece): number {
  return piece.to - piece.from;
}

function arrowCurve(piece: Piece, y: number, level: number): string {
  const height = 13 + level * 9;
  const bend = Math.min(26, Math.abs(piece.to - piece.from) / 2);
  const top = y - height;
  const begin = piece.comesFromBefore
    ? `M${piece.from} ${top}`
    : `M${piece.from} ${y}C${piece.from + bend * 0.5} ${top} ${piece.from + bend} ${top} ${piece.from + bend} ${top}`;
  const end = piece.goesOn
    ? `L${piece.to} ${top}`
    : `L${piece.to - bend} ${top}C${piece.to - bend} ${top} ${piece.to - bend * 0.5} ${top} ${piece.to} ${y}`;
  return begin + end;
}

/** The arrows from dominants to what they resolve to. */
export function arrowPaths(links: SheetLink[], places: (Place | null)[], lines: LinePlace[]): LinkPath[] {
  const all: { piece: Piece; link: SheetLink; isLast: boolean }[] = [];
  for (const link of links) {
    const from = places[link.From];
    const to = link.To === null ? from : places[link.To];
    if (!from || !to) continue;
    const startX = from.left + Math.min(18, (from.right - from.left) * 0.6);
    // What leads back ends at the sign that leads back.
    const endX = link.To === null ? Math.max(from.back, startX + 8) : to.left + Math.min(8, (to.right - to.left) / 3);
    const pieces = piecesOf(from, to, lines, startX, endX);
    pieces.forEach((piece, i) => all.push({ piece, link, isLast: i === pieces.length - 1 }));
  }
  const levels = levelsOf(all.map(({ piece }) => piece));
  return all.map(({ piece, link, isLast }, i) => ({
    line: piece.line,
    level: levels[i]!,
    d: arrowCurve(piece, lines[piece.line]!.top - arrowGap, levels[i]!),
    isDotted: link.IsDotted,
    hasHead: isLast,
  }));
}

/** The brackets under a second and its dominant. */
export function bracketPaths(links: SheetLink[], places: (Place | null)[], lines: LinePlace[]): LinkPath[] {
  const paths: LinkPath[] = [];
  for (const link of links) {
    const from = places[link.From];
    const to = link.To === null ? null : places[link.To];
    if (!from || !to) continue;
    for (const piece of piecesOf(from, to, lines, from.left, to.right)) {
      const y = lines[piece.line]!.bottom + bracketGap;
      const begin = piece.comesFromBefore ? `M${piece.from} ${y + 6}` : `M${piece.from} ${y}v6`;
      const end = piece.goesOn ? `H${piece.to}` : `H${piece.to}v-6`;
      paths.push({ line: piece.line, level: 0, d: begin + end, isDotted: link.IsDotted, hasHead: false });
    }
  }
  return paths;
}
