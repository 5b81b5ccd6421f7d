import type { Sentence } from "./Types";

/**
 * What the library says of a chord, around the place of its numeral: where the sentence has it
 * ("F is IV in C major"), else behind it ("G7 is the dominant of C major, which follows: V7").
 */
export function sentenceAround(explanation: string, numeral: string): Sentence {
  if (numeral === "" || explanation === "") return { before: printedNames(explanation), numeral: false, after: "" };
  const told = ` is ${numeral} in `;
  const at = explanation.indexOf(told);
  if (at < 0) return { before: `${printedNames(explanation.replace(/\.$/, ""))}: `, numeral: true, after: "" };
  const behind = explanation.slice(at + told.length);
  return { before: `${printedNames(explanation.slice(0, at))} is `, numeral: true, after: ` in ${printedNames(behind)}` };
}

/** Names of notes with the signs that are printed: "B\u266D7" for "Bb7", also "\u266DVII". */
export function printedNames(text: string): string {
  return text
    .replace(/(?<![A-Za-z])([A-G])(#+|b+)(?![a-z]{2}(?<!mi|ma|di|au|su|ad))/g, (_, letter: string, signs: string) => letter + printedSigns(signs))
    .replace(/(?<![A-Za-z])([#b]+)(?=[IViv])/g, printedSigns);
}

function printedSigns(signs: string): string {
  return signs.replaceAll("#", "\u266F").replaceAll("b", "\u266D");
}
