import type { Grid, Hand, NextChords as Next, PianoNote, Sentence, SheetChord } from "../engine/Types";
import { Runs, Signs } from "../sheet/Runs";
import { Fingerings } from "./Fingerings";
import { NextChords } from "./NextChords";
import { Piano } from "./Piano";
import { useLoaded } from "./useLoaded";

interface ChordPanelProps {
  chord: SheetChord;
  index: number;
  sentence: Sentence | undefined;
  loadNotes(chord: number): Promise<PianoNote[]>;
  loadGrids(chord: number, hand: Hand): Promise<Grid[]>;
  loadNext(chord: number): Promise<Next>;
  onHear(notes: number[]): void;
  onPlayFrom(position: number): void;
  onInsert(symbol: string): void;
  onClose(): void;
}

/** What a chord is: a sentence, its notes on a piano, its fingerings, and what could follow. */
export function ChordPanel(props: ChordPanelProps) {
  const { chord, index, sentence } = props;
  const { value: notes, error } = useLoaded(() => props.loadNotes(index), [chord, index]);
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
      {notes && notes.length > 0 && (
        <>
          <Piano notes={notes} />
          <p class="quiet-buttons">
            <button type="button" onClick={() => props.onHear(notes.map(({ NoteNr }) => NoteNr))}>Hear it</button>
            <button type="button" onClick={() => props.onPlayFrom(chord.Position)}>Play from here</button>
          </p>
          <Fingerings of={chord} load={(hand) => props.loadGrids(index, hand)} />
        </>
      )}
      {next && next.chords.length > 0 && <NextChords next={next} onInsert={props.onInsert} />}
    </aside>
  );
}
