import { useCallback, useEffect, useState } from "preact/hooks";
import { ChordPanel } from "../chord/ChordPanel";
import { Editor } from "../editor/Editor";
import type { Export } from "../engine/Types";
import { Transport } from "../player/Transport";
import { SheetView } from "../sheet/SheetView";
import { readFile } from "../song/files";
import { writeLink } from "../song/link";
import { fileName, save } from "../song/save";
import { Changes, TakeAway } from "./Controls";
import { Masthead } from "./Masthead";
import { ScoreNote } from "./ScoreNote";
import { useFileDrop } from "./useFileDrop";
import { usePlayer } from "./usePlayer";
import { longestTyped, useSong } from "./useSong";

const fileForms: Record<Export, [ending: string, type: string]> = {
  svg: ["svg", "image/svg+xml"],
  midi: ["mid", "audio/midi"],
  json: ["json", "application/json"],
  chordpro: ["cho", "text/plain"],
};

/** The page: the song as it is typed, the sheet, and what the chosen chord is. */
export function App() {
  const song = useSong();
  const [message, setMessage] = useState("");
  const [selected, setSelected] = useState<number | null>(null);
  const player = usePlayer(song, setMessage);
  const { reading } = song;
  const sheet = reading?.sheet ?? null;
  const hasChords = sheet !== null && sheet.Chords.length > 0;

  /** Does something that can fail, and tells why it did. */
  const attempt = async (action: () => Promise<void>) => {
    setMessage("");
    try {
      await action();
    } catch (error) {
      setMessage((error as Error).message);
    }
  };
  const openFile = useCallback((file: File) => void attempt(async () => song.open(await readFile(file))), []);
  const isOver = useFileDrop(openFile);
  useEffect(() => {
    setSelected((chord) => (chord !== null && sheet && chord < sheet.Chords.length ? chord : null));
    document.title = sheet?.Title ? `${sheet.Title} \u2013 Brindle` : "Brindle";
  }, [sheet]);

  const type = (text: string) => {
    if (text.length > longestTyped) return setMessage(`This text has ${text.length} characters, more than a song has.`);
    setMessage("");
    song.type(text);
  };
  const takeFile = (form: Export) =>
    attempt(async () => {
      const [ending, type] = fileForms[form];
      save(fileName(sheet?.Title ?? "", ending), type, await song.engine.call("file", song.source, form, song.names, player.tempo));
    });
  const takeLink = () =>
    attempt(async () => {
      const text = await song.engine.call("text", song.source);
      const hash = await writeLink({ text, names: song.names, tempo: player.tempo });
      history.replaceState(null, "", hash);
      // A browser may forbid this; the address has the link all the same.
      const isCopied = await navigator.clipboard?.writeText(location.href).then(() => true, () => false);
      setMessage(isCopied ? "The link is copied; it holds the whole song." : "The address of the page now holds the whole song.");
    });
  const leaveChord = () => {
    const chord = selected;
    setSelected(null);
    if (chord !== null) document.querySelector<HTMLElement>(`[data-chord="${chord}"]`)?.focus();
  };
  const chord = selected === null ? undefined : sheet?.Chords[selected];
  return (
    <div class={`page${chord ? " with-chord" : ""}`} onKeyDown={(event) => event.key === "Escape" && leaveChord()}>
      <Masthead onFile={openFile} onExample={(example) => void attempt(async () => song.open(await example.load()))} />
      <main>
        <section class="writing" aria-label="Song">
          {song.source.kind === "text" ? (
            <Editor text={song.source.text} faults={reading?.faults ?? []} onText={type} />
          ) : (
            <ScoreNote name={song.source.name} faults={reading?.faults ?? []} onText={() => void attempt(async () => song.change(await song.engine.call("text", song.source)))} />
          )}
          {song.canUndo && <button type="button" class="undo" onClick={song.undo}>Undo the last change</button>}
          {song.canRedo && <button type="button" class="undo redo" onClick={song.redo}>Redo it</button>}
          <p class="message" role="status">{message || song.error}</p>
        </section>
        <section class="reading" aria-label="Reading">
          <div class="controls">
            <Transport
              isPlaying={player.isPlaying}
              isLoading={player.isLoading}
              canPlay={hasChords}
              tempo={player.tempo}
              countsIn={player.countsIn}
              clock={player.clock}
              onPlay={() => void player.play()}
              onStop={player.stop}
              onTempo={player.setTempo}
              onCountIn={player.setCountsIn}
            />
            <Changes names={song.names} semitones={song.semitones} canChange={hasChords} onNames={song.setNames} onTranspose={(by) => void attempt(() => song.transpose(by))} />
          </div>
          {sheet && hasChords && (
            <SheetView
              sheet={sheet}
              selected={selected}
              soundingBar={player.bar}
              soundingChord={player.chord}
              onSelect={(index) => setSelected(index === selected ? null : index)}
              onLeave={leaveChord}
            />
          )}
          {sheet && !hasChords && <p class="no-chords">There is no chord in this song.</p>}
          <TakeAway canTake={hasChords} onFile={(form) => void takeFile(form)} onLink={() => void takeLink()} />
        </section>
        {chord && selected !== null && (
          <ChordPanel
            chord={chord}
            index={selected}
            sentence={reading?.sentences[selected]}
            loadNotes={(index) => song.engine.call("tones", song.source, index)}
            loadGrids={(index, hand) => song.engine.call("grids", song.source, index, hand)}
            loadNext={(index) => song.engine.call("next", song.source, index)}
            onHear={(notes) => void player.hear(notes)}
            onPlayFrom={(position) => void player.play(position)}
            onInsert={(symbol) => void attempt(async () => song.change(await song.engine.call("insert", song.source, selected, symbol)))}
            onClose={leaveChord}
          />
        )}
      </main>
      <footer class="colophon">
        <p>Works without a network once loaded; no song leaves this browser. Piano: Salamander Grand by Alexander Holm, CC BY 3.0.</p>
      </footer>
      {isOver && <div class="drop-here" aria-hidden="true">Drop the song here</div>}
    </div>
  );
}
