import { useEffect, useState } from "preact/hooks";
import type { ChordDetail, NextChord, SheetChord } from "../engine/Types";
import { Runs } from "../sheet/Runs";
import { GridView } from "./GridView";
import { NextChords } from "./NextChords";
import { Piano } from "./Piano";

interface ChordPanelProps {
  chord: SheetChord;
  index: number;
  sentence: string;
  loadDetail(chord: number): Promise<ChordDetail>;
  loadNext(chord: number): Promise<NextChord[]>;
  onHear(notes: number[]): void;
  onPlayFrom(position: number): void;
  onInsert(symbol: string): void;
  onClose(): void;
}

/** What a promise gives, once it does; nothing while another one is awaited. */
function useLoaded<Value>(load: () => Promise<Value>, inputs: unknown[]): Value | null {
  const [value, setValue] = useState<Value | null>(null);
  useEffect(() => {
    let isWanted = true;
    setValue(null);
    load().then((loaded) => isWanted && setValue(loaded), () => undefined);
    return () => {
      isWanted = false;
    };
  }, inputs);
  return value;
}

/** What a chord is: a sentence, its notes on a piano, its fingerings, and what could follow. */
export function ChordPanel(props: ChordPanelProps) {
  const { chord, index, sentence } = props;
  const detail = useLoaded(() => props.loadDetail(index), [chord, index]);
  const next = useLoaded(() => props.loadNext(index), [chord, index]);
  return (
    <aside class="chord-panel" aria-label={`Chord ${chord.Symbol}`}>
      <button type="button" class="close" aria-label="Close" onClick={props.onClose}>×</button>
      <h2 class="symbol"><Runs runs={chord.Runs} /></h2>
      <p class="sentence" role="status">{sentence}</p>
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
      {next && next.length > 0 && <NextChords chords={next} onInsert={props.onInsert} />}
    </aside>
  );
}
