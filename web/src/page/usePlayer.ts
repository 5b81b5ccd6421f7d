import { useEffect, useLayoutEffect, useMemo, useRef, useState } from "preact/hooks";
import type { Sheet } from "../engine/Types";
import type { SongState } from "./useSong";
import { Player } from "../player/Player";

export interface PlayerState {
  isPlaying: boolean;
  isLoading: boolean;
  tempo: number;
  countsIn: boolean;
  clock: string;
  /** What sounds, as indices of the sheet. */
  bar: number | null;
  chord: number | null;
  play(from?: number): Promise<void>;
  stop(): void;
  hear(notes: number[]): Promise<void>;
  setTempo(tempo: number): void;
  setCountsIn(countsIn: boolean): void;
}

/** The last entry that begins at that position or before it; -1 for none. Entries ascend. */
function lastUpTo(entries: { Position: number }[], position: number): number {
  let low = 0;
  let high = entries.length;
  while (low < high) {
    const middle = (low + high) >> 1;
    if (entries[middle]!.Position <= position + 1e-6) low = middle + 1;
    else high = middle;
  }
  return low - 1;
}

function endOf(sheet: Sheet): number {
  const last = sheet.PlayedBars[sheet.PlayedBars.length - 1];
  return last ? last.Position + last.Length : 0;
}

/** The player of the page and what of the sheet sounds. */
export function usePlayer(song: SongState, onError: (message: string) => void): PlayerState {
  const sheet = song.reading?.sheet ?? null;
  const [isLoading, setIsLoading] = useState(false);
  const [tempo, setTempo] = useState(120);
  const [countsIn, setCountsIn] = useState(true);
  const [playedBar, setPlayedBar] = useState<number | null>(null);
  const [playedChord, setPlayedChord] = useState<number | null>(null);
  const shown = useRef(sheet);
  shown.current = sheet;
  const player = useMemo(
    () =>
      new Player((beat) => {
        const played = shown.current;
        const isCounting = beat !== null && beat < 0;
        setPlayedBar(beat === null || !played ? null : isCounting ? -1 : lastUpTo(played.PlayedBars, beat));
        setPlayedChord(beat === null || !played || isCounting ? null : lastUpTo(played.Chords, beat));
      }),
    [],
  );
  const changeTempo = (wanted: number) => {
    if (!Number.isFinite(wanted)) return;
    const limited = Math.min(300, Math.max(30, wanted));
    setTempo(limited);
    player.setTempo(limited);
  };
  useEffect(() => player.stop(), [song.source]);
  // Before it is drawn, so that no other tempo is seen or taken into a link.
  useLayoutEffect(() => {
    const told = song.linkedTempo ?? sheet?.Tempo;
    if (told) changeTempo(Math.round(told));
  }, [sheet?.Title, sheet?.Tempo, song.linkedTempo]);

  const play = async (from = 0) => {
    if (!sheet) return;
    setIsLoading(true);
    try {
      const notes = song.engine.call("notes", song.source);
      const countIn = countsIn ? Math.max(1, Math.round(sheet.BeatsPerBar)) : 0;
      await player.play(notes, { tempo, countIn, from, end: endOf(sheet) });
    } catch (error) {
      onError((error as Error).message);
    } finally {
      setIsLoading(false);
    }
  };
  const drawn = playedBar === null || playedBar < 0 ? null : (sheet?.PlayedBars[playedBar]?.Bar ?? null);
  const chord = playedChord === null || playedChord < 0 ? null : (sheet?.DrawnAs[playedChord] ?? null);
  return {
    isPlaying: playedBar !== null,
    isLoading,
    tempo,
    countsIn,
    clock: clockOf(playedBar, sheet),
    bar: drawn,
    chord,
    play,
    stop: () => player.stop(),
    hear: (notes) => player.hear(notes).catch((error: Error) => onError(error.message)),
    setTempo: changeTempo,
    setCountsIn,
  };
}

function clockOf(playedBar: number | null, sheet: Sheet | null): string {
  if (playedBar === null || !sheet) return "";
  if (playedBar < 0) return "counting in";
  return `bar ${playedBar + 1} of ${sheet.PlayedBars.length}`;
}
