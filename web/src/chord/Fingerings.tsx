import { useState } from "preact/hooks";
import type { Grid, Hand } from "../engine/Types";
import { recall, remember } from "../page/store";
import { GridView } from "./GridView";
import { useLoaded } from "./useLoaded";

/** Tunings by the names that the library knows, with those that people read. */
const tunings: [tuning: string, name: string][] = [
  ["", "Guitar"],
  ["drop-d", "Drop D"],
  ["dadgad", "DADGAD"],
  ["open-d", "Open D"],
  ["open-g", "Open G"],
  ["half-step-down", "Half step down"],
  ["7-string", "7-string guitar"],
  ["bass", "Bass"],
  ["ukulele", "Ukulele"],
  ["baritone-ukulele", "Baritone ukulele"],
  ["mandolin", "Mandolin"],
  ["banjo", "Banjo"],
  ["tenor-banjo", "Tenor banjo"],
  ["cavaquinho", "Cavaquinho"],
];
const other = "other";
const highestCapo = 11;
/** Fingerings that are shown at once. */
const firstShown = 4;

/** What the visitor plays on, as it was the last time. */
function useHand(): [Hand, (hand: Hand) => void] {
  const [hand, setHand] = useState<Hand>(() => ({ tuning: recall("tuning") ?? "", capo: 0 }));
  const change = (changed: Hand) => {
    setHand(changed);
    remember("tuning", changed.tuning);
  };
  return [hand, change];
}

interface HandProps {
  hand: Hand;
  onHand(hand: Hand): void;
}

/** Which instrument, tuned how, with a capo or without. */
function HandControls({ hand, onHand }: HandProps) {
  const isListed = tunings.some(([tuning]) => tuning === hand.tuning);
  const [isOther, setIsOther] = useState(!isListed);
  const choose = (value: string) => {
    setIsOther(value === other);
    if (value !== other) onHand({ ...hand, tuning: value });
  };
  return (
    <div class="hand">
      <label>
        <span class="unseen">Instrument</span>
        <select value={isOther ? other : hand.tuning} onChange={(event) => choose(event.currentTarget.value)}>
          {tunings.map(([tuning, name]) => <option key={tuning} value={tuning}>{name}</option>)}
          <option value={other}>Other tuning</option>
        </select>
      </label>
      <label>
        <span>Capo</span>
        <select value={hand.capo} onChange={(event) => onHand({ ...hand, capo: Number(event.currentTarget.value) })}>
          {Array.from({ length: highestCapo + 1 }, (_, fret) => <option key={fret} value={fret}>{fret || "none"}</option>)}
        </select>
      </label>
      {isOther && (
        <label class="tuning">
          <span>Strings, the lowest first</span>
          <input type="text" maxLength={60} spellcheck={false} autocapitalize="characters" placeholder="CGDGCD" value={isListed ? "" : hand.tuning} onChange={(event) => onHand({ ...hand, tuning: event.currentTarget.value.trim() })} />
        </label>
      )}
    </div>
  );
}

interface FingeringsProps {
  /** Changes with the chord. */
  of: unknown;
  load(hand: Hand): Promise<Grid[]>;
}

/** The fingerings of a chord, the best first, on the visitor's instrument. */
export function Fingerings({ of, load }: FingeringsProps) {
  const [hand, setHand] = useHand();
  const [isWhole, setIsWhole] = useState(false);
  const { value: grids, error } = useLoaded(() => load(hand), [of, hand]);
  const shown = isWhole ? grids : grids?.slice(0, firstShown);
  return (
    <section aria-label="Fingerings">
      <h3>On the strings</h3>
      <HandControls hand={hand} onHand={setHand} />
      {error && <p class="message" role="alert">{error}</p>}
      {shown?.length === 0 && <p class="no-fingering">No hand can play it so.</p>}
      <div class="grids">{shown?.map((grid, i) => <GridView key={i} grid={grid} />)}</div>
      {grids && grids.length > firstShown && (
        <p class="quiet-buttons">
          <button type="button" aria-expanded={isWhole} onClick={() => setIsWhole(!isWhole)}>{isWhole ? "Fewer" : `${grids.length - firstShown} more`}</button>
        </p>
      )}
    </section>
  );
}
