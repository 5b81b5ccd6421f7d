import type { Sheet } from "../engine/Types";

/** Samples of the marks that a sheet has. */
export function Legend({ sheet }: { sheet: Sheet }) {
  const samples: [boolean, string, string, string][] = [
    [sheet.Arrows.some((arrow) => !arrow.IsDotted), "link", "M2 14C8 2 22 2 28 12", "a dominant resolves"],
    [sheet.Arrows.some((arrow) => arrow.IsDotted), "link dotted", "M2 14C8 2 22 2 28 12", "a substitute resolves"],
    [sheet.Brackets.some((bracket) => !bracket.IsDotted), "link", "M2 6v6H28v-6", "ii and V"],
    [sheet.Brackets.some((bracket) => bracket.IsDotted), "link dotted", "M2 6v6H28v-6", "ii and a substitute for V"],
  ];
  return (
    <ul class="legend" aria-label="What the marks mean">
      {samples
        .filter(([isThere]) => isThere)
        .map(([, mark, d, text]) => (
          <li key={text}>
            <svg width="32" height="16" aria-hidden="true">
              <path class={mark} d={d} marker-end={d.includes("C") ? "url(#head)" : undefined} />
            </svg>
            {text}
          </li>
        ))}
    </ul>
  );
}
