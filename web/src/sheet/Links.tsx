import { useLayoutEffect, useState } from "preact/hooks";
import type { RefObject } from "preact";
import type { Sheet } from "../engine/Types";
import type { Line } from "./lines";
import { arrowPaths, bracketPaths, type LinePlace, type LinkPath, type Place } from "./linkPaths";

/** Measures where the chords and lines of a sheet stand. */
function measure(root: HTMLElement, count: number): [(Place | null)[], LinePlace[]] {
  const origin = root.getBoundingClientRect();
  const places: (Place | null)[] = new Array(count).fill(null);
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
    for (const chord of line.querySelectorAll<HTMLElement>("[data-chord]")) {
      const symbol = chord.querySelector(".symbol")!.getBoundingClientRect();
      places[Number(chord.dataset.chord)] = {
        ...place,
        line: number,
        left: symbol.left - origin.left,
        right: symbol.right - origin.left,
      };
    }
    return place;
  });
  return [places, lines];
}

/** The arrows and brackets of a sheet, drawn over its lines once these are laid out. */
export function Links({ sheet, lines, root }: { sheet: Sheet; lines: Line[]; root: RefObject<HTMLElement | null> }) {
  const [arrows, setArrows] = useState<LinkPath[]>([]);
  const [brackets, setBrackets] = useState<LinkPath[]>([]);
  useLayoutEffect(() => {
    const draw = () => {
      if (!root.current) return;
      const [places, linePlaces] = measure(root.current, sheet.Chords.length);
      setArrows(arrowPaths(sheet.Arrows, places, linePlaces));
      setBrackets(bracketPaths(sheet.Brackets, places, linePlaces));
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
    <svg class="links" aria-hidden="true">
      <defs>
        <marker id="head" viewBox="0 0 8 8" refX="6.5" refY="4" markerWidth="7" markerHeight="7" orient="auto-start-reverse" markerUnits="userSpaceOnUse">
          <path class="head" d="M0 1 8 4 0 7z" />
        </marker>
      </defs>
      {[...arrows, ...brackets].map((path, i) => (
        <path key={i} class={path.isDotted ? "link dotted" : "link"} d={path.d} marker-end={path.hasHead ? "url(#head)" : undefined} />
      ))}
    </svg>
  );
}
