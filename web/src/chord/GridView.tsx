import type { Grid } from "../engine/Types";

const step = 13;
const fretHeight = 16;
const top = 24;
const left = 22;

/** The frets that are drawn: from the nut if the fingering allows it. */
function windowOf(frets: (number | null)[]): { first: number; count: number } {
  const held = frets.filter((fret): fret is number => fret !== null && fret > 0);
  const last = Math.max(0, ...held);
  const first = last <= 4 ? 1 : Math.min(...held);
  return { first, count: Math.max(4, last - first + 1) };
}

/** "x 3 2 0 1 0", as guitarists say it. */
export function spokenFrets(grid: Grid): string {
  return grid.Frets.map((fret) => (fret === null ? "x" : fret)).join(" ");
}

/** What is not played of a chord: ", without 5 and 9", as degrees. */
function spokenOmitted({ Omitted }: Grid): string {
  return Omitted.length === 0 ? "" : `, without ${Omitted.join(" and ")}`;
}

/** A fingering as a diagram; strings from left to right, the nut on top. */
export function GridView({ grid }: { grid: Grid }) {
  const { first, count } = windowOf(grid.Frets);
  const strings = grid.Frets.length;
  const right = left + (strings - 1) * step;
  const bottom = top + count * fretHeight;
  const x = (string: number) => left + string * step;
  const y = (fret: number) => top + (fret - first + 0.5) * fretHeight;
  return (
    <svg class="grid" viewBox={`0 0 ${right + 12} ${bottom + 6}`} role="img" aria-label={`Frets ${spokenFrets(grid)}${spokenOmitted(grid)}`}>
      {grid.Omitted.length > 0 && <title>{spokenOmitted(grid).slice(2)}</title>}
      {grid.Frets.map((_, string) => (
        <line key={string} x1={x(string)} x2={x(string)} y1={top} y2={bottom} />
      ))}
      {Array.from({ length: count + 1 }, (_, fret) => (
        <line key={fret} class={fret === 0 && first === 1 ? "nut" : undefined} x1={left} x2={right} y1={top + fret * fretHeight} y2={top + fret * fretHeight} />
      ))}
      {first > 1 && <text class="fret" x={left - 9} y={y(first) + 4} text-anchor="end">{first}</text>}
      {grid.Frets.map((fret, string) =>
        fret === null ? (
          <path key={string} class="muted" d={`M${x(string) - 3} ${top - 10}l6 6m0-6l-6 6`} />
        ) : fret === 0 ? (
          <circle key={string} class="open" cx={x(string)} cy={top - 7} r="3.2" />
        ) : null,
      )}
      {grid.Elements.map(({ Finger, Fret, Strings: [from, to] }, i) => (
        <g key={i} class="finger">
          <line x1={x(from)} x2={x(to)} y1={y(Fret)} y2={y(Fret)} />
          {Finger > 0 && <text x={(x(from) + x(to)) / 2} y={y(Fret) + 3.3} text-anchor="middle">{Finger}</text>}
        </g>
      ))}
    </svg>
  );
}
