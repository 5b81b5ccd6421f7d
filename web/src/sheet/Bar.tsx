import type { Sheet, SheetBar } from "../engine/Types";
import { writtenChords } from "./lines";
import { Runs, Signs } from "./Runs";

/** What the bars of a sheet share. */
export interface SheetState {
  sheet: Sheet;
  selected: number | null;
  /** The bar and the chord that sound. */
  soundingBar: number | null;
  soundingChord: number | null;
  /** The chord that the tabulator key goes to. */
  entry: number;
  onSelect(chord: number): void;
}

/** Colours of a key as custom properties; the style sheet takes those of the day or the night. */
function keyColors(sheet: Sheet, key: number | null): Record<string, string> {
  const colors = key === null ? undefined : sheet.Keys[key];
  if (!colors) return {};
  return {
    "--day-paper": colors.Paper,
    "--day-ink": colors.Ink,
    "--night-paper": colors.NightPaper,
    "--night-ink": colors.NightInk,
  };
}

/** What a screen reader says of a chord. */
function spoken(sheet: Sheet, bar: SheetBar, index: number): string {
  const chord = sheet.Chords[index]!;
  const key = chord.Key === null ? "" : ` in ${sheet.Keys[chord.Key]?.Name ?? ""}`;
  const numeral = chord.Numeral ? `, ${chord.Numeral}${key}` : "";
  return `Bar ${bar.Number}: ${chord.Symbol}${numeral}`;
}

function Chord({ state, bar, index, end, length, isHeld }: ChordProps) {
  const { sheet, soundingChord } = state;
  const chord = sheet.Chords[index]!;
  const isSounding = soundingChord !== null && soundingChord >= index && soundingChord < end;
  return (
    <button
      type="button"
      class={`chord${isHeld ? " held" : ""}${isSounding ? " sounds" : ""}`}
      data-chord={isHeld ? undefined : index}
      style={{ flexGrow: Math.max(0.01, length), ...keyColors(sheet, chord.Key) }}
      tabIndex={!isHeld && state.entry === index ? 0 : -1}
      aria-pressed={state.selected === index}
      aria-label={spoken(sheet, bar, index)}
      onClick={() => state.onSelect(index)}
    >
      <span class="symbol">
        <Runs runs={chord.Runs} />
      </span>{" "}
      <span class="numeral">
        <Runs runs={chord.NumeralRuns} />
      </span>
    </button>
  );
}

interface ChordProps {
  state: SheetState;
  bar: SheetBar;
  index: number;
  /** Behind the last of the equal chords that it is written for. */
  end: number;
  /** In beats, up to the next chord of the bar or its end. */
  length: number;
  isHeld: boolean;
}

/** Above the chords of a bar: its part, ending and signs, and the key that begins. */
function Above({ state, bar }: { state: SheetState; bar: SheetBar }) {
  const { sheet } = state;
  const newKeys: number[] = [];
  for (let i = bar.Begin; i < bar.End; ++i) {
    const key = sheet.Chords[i]!.Key;
    const before = i > 0 ? sheet.Chords[i - 1]!.Key : null;
    if (key !== null && (i === 0 || key !== before)) newKeys.push(key);
  }
  return (
    <div class="above">
      {bar.Ending && <span class="ending-number">{bar.Ending}</span>}
      {bar.BeginsSection && bar.Section && <span class="part">{bar.Section}</span>}
      {bar.Sign && <span class="sign" role="img" aria-label={bar.Sign}>{bar.Sign === "segno" ? "\u{1D10B}" : "\u{1D10C}"}</span>}
      {newKeys.map((key) => (
        <span key={key} class="key" style={keyColors(sheet, key)}>
          <Signs text={sheet.Keys[key]?.Name ?? ""} />
        </span>
      ))}
      {bar.Remark && <span class="remark">{bar.Remark}</span>}
      {bar.Words && <span class="words">{bar.Words}</span>}
      {bar.EndsRepeat && bar.Times > 2 && <span class="words">{bar.Times}×</span>}
    </div>
  );
}

function barClass(state: SheetState, index: number, isLast: boolean): string {
  const bar = state.sheet.Bars[index]!;
  const classes = ["bar"];
  if (bar.BeginsRepeat) classes.push("begins-repeat");
  if (bar.EndsRepeat) classes.push("ends-repeat");
  if (bar.IsInEnding) classes.push("ending");
  if (bar.Ending) classes.push("begins-ending");
  if (bar.ClosesEnding) classes.push("closes-ending");
  if (bar.IsUpbeat) classes.push("upbeat");
  if (isLast) classes.push("last");
  if (state.soundingBar === index) classes.push("lit");
  return classes.join(" ");
}

/** Where no chord begins: the one before goes on, for so many beats. */
function Rest({ bar, sheet, length }: { bar: SheetBar; sheet: Sheet; length: number }) {
  const before = bar.Begin > 0 ? sheet.Chords[bar.Begin - 1]! : null;
  return (
    <span class="rest" style={{ flexGrow: Math.max(0.01, length), ...keyColors(sheet, before?.Key ?? null) }}>
      <span class="unseen">{before ? `${before.Symbol} goes on` : "no chord"}</span>
      {bar.BarCount > 1 && <span class="rest-count">{bar.BarCount}</span>}
    </span>
  );
}

/** The beats of a bar before anything is written in it. */
function lateness(sheet: Sheet, bar: SheetBar): number {
  if (bar.Held !== null) return 0;
  return bar.Begin < bar.End ? sheet.Chords[bar.Begin]!.Position - bar.Position : bar.Length;
}

/** A bar of the sheet. */
export function Bar({ state, index, isFirstOfLine }: { state: SheetState; index: number; isFirstOfLine: boolean }) {
  const { sheet } = state;
  const bar = sheet.Bars[index]!;
  const chords = writtenChords(sheet, bar);
  const positionOf = (chord: number) => (chord < bar.End ? sheet.Chords[chord]!.Position : bar.Position + bar.Length);
  const isLast = index === sheet.Bars.length - 1;
  const late = lateness(sheet, bar);
  const firstKey = sheet.Chords[bar.Held ?? (late > 0.01 ? bar.Begin - 1 : bar.Begin)]?.Key ?? null;
  return (
    <li class={barClass(state, index, isLast)} aria-current={state.soundingBar === index ? "true" : undefined}>
      <Above state={state} bar={bar} />
      {isFirstOfLine && <span class="bar-number" aria-hidden="true">{bar.Number}</span>}
      <div class="chords">
        {bar.Time && <Time time={bar.Time} colors={keyColors(sheet, firstKey)} />}
        {late > 0.01 && <Rest bar={bar} sheet={sheet} length={late} />}
        {bar.Held !== null && <Chord state={state} bar={bar} index={bar.Held} end={bar.Held + 1} length={positionOf(bar.Begin) - bar.Position} isHeld={true} />}
        {chords.map((chord, i) => {
          const end = chords[i + 1] ?? bar.End;
          return <Chord key={chord} state={state} bar={bar} index={chord} end={end} length={positionOf(end) - positionOf(chord)} isHeld={false} />;
        })}
      </div>
    </li>
  );
}

function Time({ time, colors }: { time: string; colors: Record<string, string> }) {
  const [above, below] = time.split("/");
  return (
    <span class="time" style={colors} role="img" aria-label={`${time} time`}>
      <span aria-hidden="true">{above}</span>
      <span aria-hidden="true">{below}</span>
    </span>
  );
}
