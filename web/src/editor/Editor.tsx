import { useRef } from "preact/hooks";
import type { Fault } from "../engine/Types";
import { markFaults, placeOf } from "./faultMarks";

interface EditorProps {
  text: string;
  faults: Fault[];
  onText(text: string): void;
}

const mostFaultsTold = 5;

/** Where the song is typed, with what is wrong underlined and told. */
export function Editor({ text, faults, onText }: EditorProps) {
  const area = useRef<HTMLTextAreaElement>(null);
  const marks = useRef<HTMLPreElement>(null);
  const goTo = (fault: Fault) => {
    const place = placeOf(text, fault);
    area.current?.focus();
    if (place) area.current?.setSelectionRange(place[0], place[1]);
  };
  const follow = () => {
    if (!marks.current || !area.current) return;
    marks.current.scrollTop = area.current.scrollTop;
    marks.current.scrollLeft = area.current.scrollLeft;
  };
  const hasError = faults.some((fault) => !fault.isNote);
  return (
    <div class="editor">
      <label for="song">The song</label>
      <div class="paper">
        <pre class="marks" ref={marks} aria-hidden="true">
          {markFaults(text, faults).map(({ text: piece, fault }, i) =>
            fault === null ? piece : <mark key={i} class={faults[fault]!.isNote ? "note" : "wrong"}>{piece}</mark>,
          )}
          {"\n"}
        </pre>
        <textarea
          id="song"
          ref={area}
          value={text}
          rows={8}
          spellcheck={false}
          autocapitalize="off"
          autocomplete="off"
          aria-invalid={hasError}
          aria-describedby={faults.length > 0 ? "faults" : "forms"}
          placeholder={"Dm7 | G7 | Cmaj7 | Cmaj7"}
          onInput={(event) => onText(event.currentTarget.value)}
          onScroll={follow}
        />
      </div>
      <div id="faults" role="status">
        <ul class="faults">
          {faults.slice(0, mostFaultsTold).map((fault, i) => (
            <li key={i} class={fault.isNote ? "note" : "wrong"}>
              <button type="button" onClick={() => goTo(fault)}>
                {fault.line > 0 && <span class="line-number">Line {fault.line}: </span>}
                {fault.text}
              </button>
            </li>
          ))}
          {faults.length > mostFaultsTold && <li class="note">and {faults.length - mostFaultsTold} more</li>}
        </ul>
      </div>
      <p id="forms" class="hint">
        Chords between bar lines, lyrics with chords, ChordPro or an irealb:// link. Scores in MusicXML can be dropped anywhere.
      </p>
    </div>
  );
}
