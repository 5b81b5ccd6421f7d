import { readdirSync, readFileSync } from "node:fs";
import { fileURLToPath } from "node:url";
import { load } from "../dist/index.js";

export const brindle = await load();
export const root = fileURLToPath(new URL("../../", import.meta.url));
export const program = process.env.BRINDLE_PROGRAM ?? `${root}build/release/bin/brindle`;

/** The files of folders of the project. */
export function filesOf(...folders) {
  return folders.flatMap((folder) =>
    readdirSync(root + folder)
      .filter((name) => /\.(txt|cho|musicxml|xml|mxl)$/.test(name) && name !== "SOURCE.txt")
      .map((name) => `${root}${folder}/${name}`),
  );
}

/** The rows of a table with tabs, as objects by the names of its first row. */
export function tableOf(file) {
  const [head, ...rows] = readFileSync(root + file, "utf8").trimEnd().split("\n").map((row) => row.split("\t"));
  return rows.map((row) => Object.fromEntries(head.map((name, at) => [name, row[at] ?? ""])));
}
