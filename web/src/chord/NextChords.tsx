import type { NextChords as Next } from "../engine/Types";
import { Runs, Signs } from "../sheet/Runs";

interface NextChordsProps {
  next: Next;
  onInsert(symbol: string): void;
}

function percent(probability: number): string {
  return probability < 0.005 ? "< 1 %" : `${Math.round(probability * 100)} %`;
}

/** Chords that could come next, the likeliest first; one is inserted by a click. */
export function NextChords({ next, onInsert }: NextChordsProps) {
  return (
    <section class="next" aria-label="What could come next">
      <h3>What could come next{next.key && <Signs text={`, in ${next.key}`} />}</h3>
      <ol>
        {next.chords.map((chord) => (
          <li key={chord.Symbol}>
            <button type="button" onClick={() => onInsert(chord.Symbol)} aria-label={`Insert ${chord.Symbol}, ${chord.Numeral}, ${chord.Function}, ${percent(chord.Probability)}`}>
              <span class="next-symbol"><Runs runs={chord.Runs} /></span>{" "}
              <span class="next-numeral"><Runs runs={chord.NumeralRuns} /></span>{" "}
              <span class="next-function">{chord.Function}</span>{" "}
              <span class="next-percent">{percent(chord.Probability)}</span>
            </button>
          </li>
        ))}
      </ol>
    </section>
  );
}
