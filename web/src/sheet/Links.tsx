import { useLayoutEffect, useState } from "preact/hooks";
import type { RefObject, VNode } from "preact";
import type { Sheet } from "../engine/Types";
import type { Line } from "./lines";
import { arrowPaths, bracketPaths, type LinePlace, type LinkPath, type Place } from "./linkPaths";

/** Measures where the chords and lines of a sheet stand. */
function measure(root: HTMLElement, sheet: Sheet): [(Place | null)[], LinePlace[]] {
  const origin = root.getBoundingClientRect();
  const places: (Place | null)[] = new Array(sheet.Chords.length).fill(null);
  const lines = Array.from(root.querySelectorAll<HTMLElement>(".line"), (line, number) => {
    const bands = line.querySelectorAll<HTMLElement>(".chords");
    const first = bands[0]!.getBoundingClientRect();
    const last = bands[bands.length - 1]!.getBoundingClientRect();
    const place = {
      left: first.left - origin.left,
      right: last.right - origin.left,
      top: first.top - origin.top,
      bottom: Math.max(first.bottom, last.bottom) - origin.top,
    };
    let back = place.right;
    // From the end, so that each chord knows the next repeat sign of its line.
    for (const bar of [...line.children].reverse()) {
      if (bar.classList.contains("ends-repeat")) back = bar.getBoundingClientRect().right - origin.left - 6;
      for (const chord of bar.querySelectorAll<HTMLElement>("[data-chord]")) {
        const symbol = chord.querySelector(".symbol")!.getBoundingClientRect();
        const [left, right] = [symbol.left - origin.left, symbol.right - origin.left];
        places[Number(chord.dataset.chord)] = { ...place, line: number, left, right, back };
      }
    }
    return place;
  });
  fillPlaces(sheet, places);
  return [places, lines];
}

/** A chord that is not written has the place of the one before, which goes on. */
function fillPlaces(sheet: Sheet, places: (Place | null)[]): void {
  for (const bar of sheet.Bars) {
    for (let chord = bar.Begin + 1; chord < bar.End; ++chord) places[chord] ??= places[chord - 1]!;
  }
}

/** Makes room for the arrows of each line; tells whether that moved anything. */
function lift(root: HTMLElement, arrows: LinkPath[]): boolean {
  const levels: number[] = [];
  for (const { line, level } of arrows) levels[line] = Math.max(levels[line] ?? 0, level);
  let isMoved = false;
  root.querySelectorAll<HTMLElement>(".line").forEach((line, number) => {
    const wanted = `${levels[number] ?? 0}`;
    if (line.style.getPropertyValue("--levels") === wanted) return;
    line.style.setProperty("--levels", wanted);
    isMoved = true;
  });
  return isMoved;
}

interface LinksProps {
  sheet: Sheet;
  lines: Line[];
  root: RefObject<HTMLElement | null>;
  /** The lines as they are drawn. */
  children: VNode[];
}

/** What was drawn by the last measure. */
interface Drawn {
  paths: LinkPath[][];
  /** Of each line, from the top of the music. */
  tops: number[];
}

/** Paths by their lines. */
function byLine(paths: LinkPath[]): LinkPath[][] {
  const lines: LinkPath[][] = [];
  for (const path of paths) (lines[path.line] ??= []).push(path);
  return lines;
}

function topsOf(root: HTMLElement): number[] {
  const origin = root.getBoundingClientRect().top;
  return Array.from(root.querySelectorAll(".line"), (line) => line.getBoundingClientRect().top - origin);
}

/**
 * The lines of a sheet with its arrows and brackets over them, which are drawn once the lines are laid
 * out. Each line has its own, so that they stay with it where paper is broken into pages.
 */
export function Links({ sheet, lines, root, children }: LinksProps) {
  const [{ paths, tops }, setDrawn] = useState<Drawn>({ paths: [], tops: [] });
  useLayoutEffect(() => {
    const draw = () => {
      if (!root.current) return;
      let [places, linePlaces] = measure(root.current, sheet);
      // Room is made up and down, so that the levels stay as they are.
      if (lift(root.current, arrowPaths(sheet.Arrows, places, linePlaces))) {
        [places, linePlaces] = measure(root.current, sheet);
      }
      const all = [...arrowPaths(sheet.Arrows, places, linePlaces), ...bracketPaths(sheet.Brackets, places, linePlaces)];
      setDrawn({ paths: byLine(all), tops: topsOf(root.current) });
    };
    draw();
    // Fonts that come late move what was measured.
    const observer = new ResizeObserver(draw);
    for (const line of root.current?.querySelectorAll(".line") ?? []) observer.observe(line);
    document.fonts?.addEventListener("loadingdone", draw);
    return () => {
      observer.disconnect();
      document.fonts?.removeEventListener("loadingdone", draw);
    };
  }, [sheet, lines]);
  return (
    <>
      <svg class="links" aria-hidden="true">
        <defs>
          <marker id="head" viewBox="0 0 8 8" refX="6.5" refY="4" markerWidth="7" markerHeight="7" orient="auto-start-reverse" markerUnits="userSpaceOnUse">
            <path class="head" d="M0 1 8 4 0 7z" />
          </marker>
        </defs>
      </svg>
      {children.map((line, number) => (
        <div key={line.key} class="line-box">
          {line}
          {paths[number] && (
            <svg class="links" aria-hidden="true">
              <g transform={`translate(0 ${-(tops[number] ?? 0)})`}>
                {paths[number].map((path, i) => (
                  <path key={i} class={path.isDotted ? "link dotted" : "link"} d={path.d} marker-end={path.hasHead ? "url(#head)" : undefined} />
                ))}
              </g>
            </svg>
          )}
        </div>
      ))}
    </>
  );
}
