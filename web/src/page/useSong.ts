import { useCallback, useEffect, useMemo, useRef, useState } from "preact/hooks";
import { Engine } from "../engine/Engine";
import type { Names, Reading, Source } from "../engine/Types";
import { isLink, readLink } from "../song/link";
import { examples } from "../song/examples";
import { recall, remember } from "./store";
import { shown, useHistory } from "./useHistory";

/** Milliseconds without a key stroke after which a song is read. */
const pause = 140;

/** Longer texts are not taken into the editor. */
export const longestTyped = 200_000;

export interface SongState {
  engine: Engine;
  source: Source;
  names: Names;
  reading: Reading | null;
  /** Why there is no reading. */
  error: string;
  /** Semitones from the song as it was typed. */
  semitones: number;
  /** The tempo that a link asks for. */
  linkedTempo: number | null;
  canUndo: boolean;
  canRedo: boolean;
  /** Replaces the song by another one; "Undo" takes it back. */
  open(source: Source): void;
  /** Takes what was typed. */
  type(text: string): void;
  /** Puts a text in place of the song that "Undo" takes back. */
  change(text: string): void;
  transpose(by: number): Promise<void>;
  undo(): void;
  redo(): void;
  setNames(names: Names): void;
}

/** Why a link cannot be opened. */
const brokenLink = "This link is broken or too long: it holds no song. The song below is the one from before.";

/** The song of the page and its reading, which follows it. */
export function useSong(): SongState {
  const engine = useMemo(() => new Engine(), []);
  const { now, latest, canUndo, canRedo, edit, replace, undo, redo } = useHistory(() => shown({ kind: "text", text: recall("text") ?? "" }));
  const { source } = now;
  const [names, setNames] = useState<Names>("typed");
  const [linkError, setLinkError] = useState("");
  const [state, setState] = useState<{ reading: Reading | null; error: string }>({ reading: null, error: "" });
  const newest = useRef(0);
  const transposing = useRef(Promise.resolve());

  const open = useCallback((opened: Source, tempo: number | null = null) => {
    setLinkError("");
    replace(() => ({ ...shown(opened), tempo }));
  }, []);

  useEffect(() => {
    const openLinked = async () => {
      const linked = await readLink(location.hash);
      if (linked) {
        open({ kind: "text", text: linked.text.slice(0, longestTyped) }, linked.tempo);
        setNames(linked.names);
        return;
      }
      if (isLink(location.hash)) setLinkError(brokenLink);
      if (!recall("text")) open(await examples[0]!.load());
    };
    void openLinked();
    window.addEventListener("hashchange", openLinked);
    return () => window.removeEventListener("hashchange", openLinked);
  }, []);

  useEffect(() => {
    const number = ++newest.current;
    const read = async () => {
      try {
        const reading = await engine.call("read", source, names);
        if (number === newest.current) setState({ reading, error: "" });
      } catch (error) {
        if (number === newest.current) setState({ reading: null, error: (error as Error).message });
      }
    };
    if (source.kind === "text") {
      if (source.text.trim() === "") return setState({ reading: null, error: "" });
      remember("text", source.text);
    }
    const timer = setTimeout(read, pause);
    return () => clearTimeout(timer);
  }, [source, names]);

  const transposeOnce = async (by: number) => {
    const start = latest();
    const from = start.origin ?? { source: start.source, semitones: 0 };
    const semitones = (from.semitones + by) % 12;
    const changed: Source = semitones === 0 ? from.source : { kind: "text", text: await engine.call("transpose", from.source, semitones) };
    // What was typed meanwhile stays.
    if (latest() !== start) return;
    replace((last) => ({ ...last, source: changed, origin: { source: from.source, semitones } }));
  };
  return {
    engine,
    source,
    names,
    reading: state.reading,
    error: linkError || state.error,
    semitones: now.origin?.semitones ?? 0,
    linkedTempo: now.tempo,
    canUndo,
    canRedo,
    open,
    type: (text) => {
      setLinkError("");
      edit((last) => ({ ...last, source: { kind: "text", text }, origin: null }));
    },
    change: (text) => replace((last) => ({ ...last, source: { kind: "text", text }, origin: null })),
    transpose: (by) => {
      // One after the other, so that two quick clicks are two steps.
      const done = transposing.current.then(() => transposeOnce(by));
      transposing.current = done.catch(() => undefined);
      return done;
    },
    undo,
    redo,
    setNames,
  };
}
