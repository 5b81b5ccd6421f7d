import type { Source } from "../engine/Types";
import beautifulDreamer from "../../../examples/scores/beautiful-dreamer.musicxml?url";
import afterYouveGone from "../../../examples/songs/after-youve-gone.txt?raw";
import amazingGrace from "../../../examples/songs/amazing-grace.txt?raw";
import auldLangSyne from "../../../examples/songs/auld-lang-syne.txt?raw";
import greensleeves from "../../../examples/songs/greensleeves.txt?raw";
import risingSun from "../../../examples/songs/rising-sun.txt?raw";

/** A song that the page brings with it. */
export interface Example {
  title: string;
  load(): Promise<Source>;
}

function typed(title: string, makers: string, chords: string): Example {
  const text = `${title}\nby ${makers}\n\n[A]\n${chords}`;
  return { title, load: async () => ({ kind: "text", text }) };
}

function score(title: string, name: string, address: string): Example {
  return {
    title,
    load: async () => {
      const response = await fetch(address);
      return { kind: "score", name, bytes: new Uint8Array(await response.arrayBuffer()) };
    },
  };
}

export const examples: Example[] = [
  typed("After You've Gone", "Turner Layton", afterYouveGone),
  typed("Amazing Grace", "Traditional", amazingGrace),
  typed("Auld Lang Syne", "Traditional", auldLangSyne),
  typed("Greensleeves", "Traditional", greensleeves),
  typed("House of the Rising Sun", "Traditional", risingSun),
  score("Beautiful Dreamer", "beautiful-dreamer.musicxml", beautifulDreamer),
];
