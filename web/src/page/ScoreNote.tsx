import type { Fault } from "../engine/Types";

/** What stands in place of the editor while the song is a score. */
export function ScoreNote({ name, faults, onText }: { name: string; faults: Fault[]; onText(): void }) {
  return (
    <div class="score-note">
      <p>
        From the score <strong>{name}</strong>
      </p>
      <button type="button" onClick={onText}>Write it as chords</button>
      <ul class="faults">
        {faults.map((fault, i) => (
          <li key={i} class={fault.isNote ? "note" : "wrong"}>{fault.text}</li>
        ))}
      </ul>
    </div>
  );
}
