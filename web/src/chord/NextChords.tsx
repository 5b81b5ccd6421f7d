import type { NextChord } from "../engine/Types";

interface NextChordsProps {
  chords: NextChord[];
  onInsert(symbol: string): void;
}

function percent(probability: number): string {
  return probability < 0.005 ? "< 1 %" : `${Math.round(probability * 100)} %`;
}

/** Chords that could come next, the likeliest first; one is inserted by a click. */
export function NextChords({ chords, onInsert }: NextChordsProps) {
  return (
    <section class="next" aria-label="What could come next">
      <h3>What could come next</h3>
      <ol>
        {chords.map((chord) => (
          <li key={chord.Symbol}>
            <button type="button" onClick={() => onInsert(chord.Symbol)} aria-label={`Insert ${chord.Symbol}, ${chord.Numeral}, ${chord.Function}, ${percent(chord.Probability)}`}>
              <span class="next-symbol">{chord.Symbol}</span>{" "}
              <span class="next-numeral">{chord.Numeral}</span>{" "}
              <span class="next-function">{chord.Function}</span>{" "}
              <span class="next-percent">{percent(chord.Probability)}</span>
            </button>
          </li>
        ))}
      </ol>
    </section>
  );
}
