import { useEffect, useLayoutEffect, useMemo, useRef, useState } from "preact/hooks";
import type { Sheet } from "../engine/Types";
import { Bar, type SheetState } from "./Bar";
import { Legend } from "./Legend";
import { breakLines, type Line } from "./lines";
import { Links } from "./Links";
import { Signs } from "./Runs";

/** Of a sheet on paper in pixels; style/sheet.css has it, too. A4 and Letter have room for it. */
const paperWidth = 656;

/** More bars are drawn only when they are asked for. */
const firstBars = 400;

interface SheetProps extends Omit<SheetState, "entry"> {
  onLeave(): void;
}

/** The width of an element in pixels, as it changes. */
function useWidth(): [(element: HTMLElement | null) => void, number] {
  const [element, setElement] = useState<HTMLElement | null>(null);
  const [width, setWidth] = useState(800);
  useLayoutEffect(() => {
    if (!element) return;
    // At once, so that nothing is drawn wider than the screen before.
    const { paddingLeft, paddingRight } = getComputedStyle(element);
    setWidth(element.clientWidth - parseFloat(paddingLeft) - parseFloat(paddingRight));
    const observer = new ResizeObserver(([entry]) => setWidth(entry!.contentRect.width));
    observer.observe(element);
    return () => observer.disconnect();
  }, [element]);
  return [setElement, width];
}

/** Whether the page is being printed. Paper has another width than the screen, and shows all bars. */
function usePrinting(): boolean {
  const [isPrinting, setIsPrinting] = useState(false);
  useEffect(() => {
    const begin = () => setIsPrinting(true);
    const end = () => setIsPrinting(false);
    window.addEventListener("beforeprint", begin);
    window.addEventListener("afterprint", end);
    return () => {
      window.removeEventListener("beforeprint", begin);
      window.removeEventListener("afterprint", end);
    };
  }, []);
  return isPrinting;
}

function Head({ sheet }: { sheet: Sheet }) {
  const tempo = sheet.Tempo ? `♩ = ${Math.round(sheet.Tempo)}` : "";
  const style = [sheet.Style, tempo].filter(Boolean).join(", ");
  const doubt = sheet.Confidence < 0.75 ? "probably " : "";
  return (
    <header class="sheet-head">
      <h2 class={sheet.Title ? "title" : "title untitled"}>{sheet.Title || "Untitled"}</h2>
      <p class="makers">
        <span class="style">{style}</span>
        <span>{sheet.Makers}</span>
      </p>
      <p class="key-of-song">{sheet.Key && <Signs text={`${doubt}in ${sheet.Key}`} />}</p>
      {sheet.Notes.map((note) => (
        <p key={note} class="key-note">{note}</p>
      ))}
    </header>
  );
}

/** Goes from chord to chord with the arrow keys. */
function moveFocus(event: KeyboardEvent): void {
  const steps: Record<string, number> = { ArrowLeft: -1, ArrowRight: 1, Home: -Infinity, End: Infinity };
  const step = steps[event.key];
  const root = event.currentTarget as HTMLElement;
  if (step === undefined || event.ctrlKey || event.metaKey || event.altKey) return;
  const chords = [...root.querySelectorAll<HTMLElement>("[data-chord]")];
  const now = chords.indexOf(document.activeElement as HTMLElement);
  if (now < 0) return;
  chords[Math.min(chords.length - 1, Math.max(0, now + step))]?.focus();
  event.preventDefault();
}

/** The song as a lead sheet with the marks of a teacher. */
export function SheetView(props: SheetProps) {
  const { sheet } = props;
  const [setFrame, screenWidth] = useWidth();
  const isPrinting = usePrinting();
  const width = isPrinting ? paperWidth : screenWidth;
  const [isWhole, setIsWhole] = useState(false);
  const music = useRef<HTMLDivElement>(null);
  const isNarrow = width < 560;
  const bars = isWhole || isPrinting ? sheet.Bars : sheet.Bars.slice(0, firstBars);
  const lines = useMemo(
    () => breakLines(sheet, bars, { width, symbol: isNarrow ? 23 : 27, numeral: 15 }),
    [sheet, bars.length, width],
  );
  useEffect(() => setIsWhole(false), [sheet.Title]);
  useEffect(() => {
    // The bar that sounds stays in sight.
    if (props.soundingBar !== null) music.current?.querySelector(".lit")?.scrollIntoView({ block: "nearest" });
  }, [props.soundingBar]);
  const state: SheetState = { ...props, entry: props.selected ?? bars[0]?.Begin ?? 0 };
  return (
    <article class={isPrinting ? "sheet on-paper" : "sheet"} aria-label="Lead sheet" ref={setFrame}>
      <Head sheet={sheet} />
      <div class="music" ref={music} onKeyDown={(event) => (event.key === "Escape" ? props.onLeave() : moveFocus(event))}>
        <Links sheet={sheet} lines={lines} root={music}>
          {lines.map((line) => (
            <ol key={line.bars[0]!.index} class={line.isTooFull ? "line too-full" : "line"} style={{ gridTemplateColumns: columnsOf(line) }} start={line.bars[0]!.index + 1}>
              {line.bars.map(({ index }, i) => (
                <Bar key={index} state={state} index={index} isFirstOfLine={i === 0} />
              ))}
            </ol>
          ))}
        </Links>
      </div>
      {bars.length < sheet.Bars.length && (
        <button type="button" class="more" onClick={() => setIsWhole(true)}>
          Show the other {sheet.Bars.length - bars.length} bars
        </button>
      )}
      <Legend sheet={sheet} />
    </article>
  );
}

function columnsOf({ columns, bars, isTooFull }: Line): string {
  if (isTooFull) return "minmax(0, 1fr)";
  const hasUpbeat = bars[0]!.bar.IsUpbeat;
  const rest = `repeat(${hasUpbeat ? columns - 1 : columns}, minmax(max-content, 1fr))`;
  return hasUpbeat && columns > 1 ? `minmax(max-content, 0.4fr) ${rest}` : rest;
}
