import type { Export, Names } from "../engine/Types";

const styles: [Names, string][] = [
  ["typed", "as typed"],
  ["letters", "C D E"],
  ["german", "C D E … H"],
  ["solfege", "Do Re Mi"],
  ["nashville", "1 2 3"],
  ["roman", "I ii V"],
];

interface ChangesProps {
  names: Names;
  semitones: number;
  canChange: boolean;
  onNames(names: Names): void;
  onTranspose(by: number): void;
}

/** How chords are named, and in which key. */
export function Changes({ names, semitones, canChange, onNames, onTranspose }: ChangesProps) {
  const shown = semitones > 0 ? `+${semitones}` : `${semitones}`.replace("-", "\u2212");
  return (
    <>
      <div class="transpose" role="group" aria-label="Transpose">
        <span aria-hidden="true">Transpose</span>
        <button type="button" disabled={!canChange} aria-label="Down a semitone" onClick={() => onTranspose(-1)}>{"\u2212"}</button>
        <output aria-label="Semitones">{shown}</output>
        <button type="button" disabled={!canChange} aria-label="Up a semitone" onClick={() => onTranspose(1)}>+</button>
      </div>
      <label class="names">
        <span>Names</span>
        <select value={names} onChange={(event) => onNames(event.currentTarget.value as Names)}>
          {styles.map(([style, text]) => (
            <option key={style} value={style}>{text}</option>
          ))}
        </select>
      </label>
    </>
  );
}

const forms: [Export, string][] = [
  ["svg", "SVG"],
  ["midi", "MIDI"],
  ["json", "JSON"],
  ["chordpro", "ChordPro"],
];

/** What can be taken away. */
export function TakeAway({ canTake, onFile, onLink }: { canTake: boolean; onFile(form: Export): void; onLink(): void }) {
  return (
    <div class="take-away" role="group" aria-label="Take away">
      <span aria-hidden="true">Take away</span>
      {forms.map(([form, text]) => (
        <button key={form} type="button" disabled={!canTake} onClick={() => onFile(form)}>{text}</button>
      ))}
      <button type="button" disabled={!canTake} onClick={onLink}>Link</button>
    </div>
  );
}
