import type { PianoNote } from "../engine/Types";

/** White keys of an octave as their distance from C in semitones; the order of the picture. */
const whites = [0, 2, 4, 5, 7, 9, 11];
const blacks: [semitone: number, place: number][] = [[1, 1], [3, 2], [6, 4], [8, 5], [10, 6]];
const keyWidth = 22;
const height = 92;
const blackHeight = 56;
/** Above the keys, for the names of the black ones, which are too narrow for theirs. */
const nameHeight = 17;

interface PianoProps {
  notes: PianoNote[];
}

/** The notes of a chord on as many octaves of a piano as they need. */
export function Piano({ notes }: PianoProps) {
  if (notes.length === 0) return null;
  const numbers = notes.map(({ NoteNr }) => NoteNr);
  const first = Math.floor(Math.min(...numbers) / 12);
  const octaves = Math.max(2, Math.floor(Math.max(...numbers) / 12) - first + 1);
  const names = new Map(notes.map(({ NoteNr, Name }) => [NoteNr, Name]));
  const width = octaves * 7 * keyWidth;
  const each = Array.from({ length: octaves }, (_, octave) => octave);
  return (
    <svg class="piano" viewBox={`-1 ${-nameHeight} ${width + 2} ${height + nameHeight + 1}`} role="img" aria-label={`Piano: ${notes.map(({ Name }) => Name).join(", ")}`}>
      {each.flatMap((octave) =>
        whites.map((semitone, i) => (
          <Key key={`${octave}-${semitone}`} name={names.get((first + octave) * 12 + semitone)} x={(octave * 7 + i) * keyWidth} width={keyWidth} height={height} kind="white" />
        )),
      )}
      {each.flatMap((octave) =>
        blacks.map(([semitone, place]) => (
          <Key key={`${octave}-${semitone}`} name={names.get((first + octave) * 12 + semitone)} x={(octave * 7 + place) * keyWidth - 7} width={14} height={blackHeight} kind="black" />
        )),
      )}
    </svg>
  );
}

interface KeyProps {
  name: string | undefined;
  x: number;
  width: number;
  height: number;
  kind: "white" | "black";
}

function Key({ name, x, width, height, kind }: KeyProps) {
  return (
    <g class={`${kind}-key${name ? " down" : ""}`}>
      <rect x={x} y="0" width={width} height={height} rx="2" />
      {name && (
        <text x={x + width / 2} y={kind === "white" ? height - 8 : -5} text-anchor="middle">
          {name}
        </text>
      )}
    </g>
  );
}
