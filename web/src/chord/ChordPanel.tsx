import { useEffect, useState } from "preact/hooks";
import type { ChordDetail, NextChords as Next, Sentence, SheetChord } from "../engine/Types";
import { Runs, Signs } from "../sheet/Runs";
import { GridView } from "./GridView";
import { NextChords } from "./NextChords";
import { Piano } from "./Piano";

interface ChordPanelProps {
  chord: SheetChord;
  index: number;
  sentence: Sentence | undefined;
  loadDetail(chord: number): Promise<ChordDetail>;
  loadNext(chord: number): Promise<Next>;
  onHear(notes: number[]): void;
  onPlayFrom(position: number): void;
  onInsert(symbol: string): void;
  onClose(): void;
}

/** What a promise gives, once it does, or why it does not; nothing while another one is awaited. */
function useLoaded<Value>(load: () => Promise<Value>, inputs: unknown[]): { value: Value | null; error: string } {
  const [state, setState] = useState<{ value: Value | null; error: string }>({ value: null, error: "" });
  useEffect(() => {
    let isWanted = true;
    const tell = (value: Value | null, error = "") => isWanted && setState({ value, error });
    tell(null);
    load().then((value) => tell(value), (error: Error) => tell(null, error.message));
    return () => {
      isWanted = false;
    };
  }, inputs);
  return state;
}

/** What a chord is: a sentence, its notes on a piano, its fingerings, and what could follow. */
export function ChordPanel(props: ChordPanelProps) {
  const { chord, index, sentence } = props;
  const { value: detail, error } = useLoaded(() => props.loadDetail(index), [chord, index]);
  const { value: next, error: nextError } = useLoaded(() => props.loadNext(index), [chord, index]);
  return (
    <aside class="chord-panel" aria-label={`Chord ${chord.Symbol}`}>
      <button type="button" class="close" aria-label="Close" onClick={props.onClose}>×</button>
      <h2 class="symbol"><Runs runs={chord.Runs} /></h2>
      <p class="sentence" role="status">
        {sentence && <Signs text={sentence.before} />}
        {sentence?.numeral && <span class="numeral"><Runs runs={chord.NumeralRuns} /></span>}
        {sentence && <Signs text={sentence.after} />}
      </p>
      {(error || nextError) && <p class="message" role="alert">{error || nextError}</p>}
      {detail && detail.notes.length > 0 && (
        <>
          <Piano notes={detail.notes} />
          <p class="quiet-buttons">
            <button type="button" onClick={() => props.onHear(detail.notes.map(({ NoteNr }) => NoteNr))}>Hear it</button>
            <button type="button" onClick={() => props.onPlayFrom(chord.Position)}>Play from here</button>
          </p>
        </>
      )}
      {detail && detail.grids.length > 0 && (
        <section aria-label="Fingerings for guitar">
          <h3>On the guitar</h3>
          <div class="grids">{detail.grids.map((grid, i) => <GridView key={i} grid={grid} />)}</div>
        </section>
      )}
      {next && next.chords.length > 0 && <NextChords next={next} onInsert={props.onInsert} />}
    </aside>
  );
}
