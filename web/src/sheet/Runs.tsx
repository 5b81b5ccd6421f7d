import type { Run } from "../engine/Types";

const classes: Record<string, string> = { "\u266D": "flat", "\u00B0": "degree" };

/** A text whose accidentals come from the music font, where they hang around a line of a staff. */
export function Signs({ text }: { text: string }) {
  return (
    <>
      {text.split(/([\u266D\u266F\u266E\u00B0])/).map((part, i) => (i % 2 === 1 ? <span key={i} class={classes[part] ?? "sharp"}>{part}</span> : part))}
    </>
  );
}

/** A chord symbol or numeral as publishers set it: small raised figures, real accidentals. */
export function Runs({ runs }: { runs: Run[] }) {
  return (
    <>
      {runs.map(([text, size, raise], i) =>
        size === 1 && raise === 0 ? (
          <Signs key={i} text={text} />
        ) : (
          <span key={i} class="run" style={{ fontSize: `${size}em`, verticalAlign: `${raise / size}em` }}>
            <Signs text={text} />
          </span>
        ),
      )}
    </>
  );
}
