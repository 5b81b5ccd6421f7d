import { useMemo, useRef, useState } from "preact/hooks";
import type { Source } from "../engine/Types";

/** A song of the page and how it came there. */
export interface Shown {
  source: Source;
  /** What it was transposed from, and how far. */
  origin: { source: Source; semitones: number } | null;
  /** The tempo that a link asks for. */
  tempo: number | null;
}

export function shown(source: Source): Shown {
  return { source, origin: null, tempo: null };
}

interface History {
  before: Shown[];
  now: Shown;
  after: Shown[];
}

type Change = (last: Shown) => Shown;

const mostKept = 50;

function isBlank({ source }: Shown): boolean {
  return source.kind === "text" && source.text.trim() === "";
}

/** The songs that were on the page. What is typed changes the last one; all else can be undone. */
export function useHistory(first: () => Shown) {
  const [history, setHistory] = useState<History>(() => ({ before: [], now: first(), after: [] }));
  // Ahead of what is drawn, for changes that follow each other quickly.
  const newest = useRef(history);
  const actions = useMemo(() => {
    const put = (change: (last: History) => History) => setHistory((newest.current = change(newest.current)));
    return {
      latest: () => newest.current.now,
      edit: (change: Change) => put(({ before, now }) => ({ before, now: change(now), after: [] })),
      replace: (change: Change) =>
        put(({ before, now }) => ({ before: isBlank(now) ? before : [...before, now].slice(-mostKept), now: change(now), after: [] })),
      undo: () =>
        put((last) => (last.before.length === 0 ? last : { before: last.before.slice(0, -1), now: last.before.at(-1)!, after: [last.now, ...last.after] })),
      redo: () =>
        put((last) => (last.after.length === 0 ? last : { before: [...last.before, last.now], now: last.after[0]!, after: last.after.slice(1) })),
    };
  }, []);
  return { now: history.now, canUndo: history.before.length > 0, canRedo: history.after.length > 0, ...actions };
}
