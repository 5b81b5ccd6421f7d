import { useCallback, useEffect, useMemo, useRef, useState } from "preact/hooks";
import { Engine } from "../engine/Engine";
import type { Names, Reading, Source } from "../engine/Types";
import { readLink } from "../song/link";
import { examples } from "../song/examples";
import { recall, remember } from "./store";

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
  /** Replaces the song. */
  open(source: Source): void;
  /** Takes what was typed. */
  type(text: string): void;
  /** Puts a text in place of the song that "Undo" takes back. */
  change(text: string): void;
  transpose(by: number): Promise<void>;
  undo(): void;
  setNames(names: Names): void;
}

/** The song of the page and its reading, which follows it. */
export function useSong(): SongState {
  const engine = useMemo(() => new Engine(), []);
  const [source, setSource] = useState<Source>({ kind: "text", text: recall("text") ?? "" });
  const [origin, setOrigin] = useState<{ source: Source; semitones: number } | null>(null);
  const [before, setBefore] = useState<Source[]>([]);
  const [names, setNames] = useState<Names>("typed");
  const [linkedTempo, setLinkedTempo] = useState<number | null>(null);
  const [state, setState] = useState<{ reading: Reading | null; error: string }>({ reading: null, error: "" });
  const newest = useRef(0);

  const open = useCallback((opened: Source) => {
    setSource(opened);
    setOrigin(null);
    setBefore([]);
  }, []);

  useEffect(() => {
    const openLinked = async () => {
      const linked = await readLink(location.hash);
      if (linked) {
        open({ kind: "text", text: linked.text.slice(0, longestTyped) });
        setNames(linked.names);
        setLinkedTempo(linked.tempo);
      } else if (!recall("text")) {
        open(await examples[0]!.load());
      }
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

  const replace = (by: Source) => {
    setBefore([...before, source].slice(-50));
    setSource(by);
  };
  const transpose = async (by: number) => {
    const from = origin ?? { source, semitones: 0 };
    const semitones = ((from.semitones + by + 23) % 12) - 11;
    if (semitones === 0) replace(from.source);
    else replace({ kind: "text", text: await engine.call("transpose", from.source, semitones) });
    setOrigin({ source: from.source, semitones });
  };
  return {
    engine,
    source,
    names,
    ...state,
    semitones: origin?.semitones ?? 0,
    linkedTempo,
    canUndo: before.length > 0,
    open,
    type: (text) => {
      setSource({ kind: "text", text });
      setOrigin(null);
    },
    change: (text) => {
      replace({ kind: "text", text });
      setOrigin(null);
    },
    transpose,
    undo: () => {
      const last = before[before.length - 1];
      if (!last) return;
      setSource(last);
      setOrigin(null);
      setBefore(before.slice(0, -1));
    },
    setNames,
  };
}
