interface TransportProps {
  isPlaying: boolean;
  isLoading: boolean;
  canPlay: boolean;
  tempo: number;
  countsIn: boolean;
  /** "bar 3 of 32" while it plays. */
  clock: string;
  onPlay(): void;
  onStop(): void;
  onTempo(tempo: number): void;
  onCountIn(countsIn: boolean): void;
}

/** Play, stop, tempo and count-in. */
export function Transport(props: TransportProps) {
  const { isPlaying, isLoading } = props;
  return (
    <div class="transport" role="group" aria-label="Playing">
      <button type="button" class="play" disabled={!props.canPlay || isLoading} onClick={isPlaying ? props.onStop : props.onPlay}>
        <svg viewBox="0 0 16 16" width="14" height="14" aria-hidden="true">
          <path d={isPlaying ? "M3 3h10v10H3z" : "M4 2.5 13 8l-9 5.5z"} />
        </svg>
        {isPlaying ? "Stop" : isLoading ? "Loading" : "Play"}
      </button>
      <label class="tempo">
        <span>Tempo</span>
        <input type="number" min={30} max={300} step={1} value={props.tempo} onChange={(event) => props.onTempo(event.currentTarget.valueAsNumber)} />
      </label>
      <label class="count-in">
        <input type="checkbox" checked={props.countsIn} onChange={(event) => props.onCountIn(event.currentTarget.checked)} />
        <span>Count-in</span>
      </label>
      <output class="clock" aria-live="off">{props.clock}</output>
    </div>
  );
}
