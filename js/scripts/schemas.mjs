// Makes src/generated/schemas.ts of docs/schema; with --check it compares and writes nothing.
import { readFile, writeFile, mkdir } from "node:fs/promises";
import { fileURLToPath } from "node:url";
import { compile } from "json-schema-to-typescript";

const schemas = fileURLToPath(new URL("../../docs/schema/", import.meta.url));
const target = new URL("../src/generated/schemas.ts", import.meta.url);
// What the package gives as JSON, and the name of its type.
const results = { analyse: "AnalyseJson", grid: "GridJson", "grids-for": "GridsForJson", "markov-next": "MarkovNextJson", "markov-generate": "MarkovGenerateJson", "markov-songs": "MarkovSongsJson", "markov-score": "MarkovScoreJson", "import-line": "ImportLineJson" };

async function typeOf([file, name]) {
  const schema = JSON.parse(await readFile(`${schemas}${file}.json`, "utf8"));
  schema.title = name;
  const text = await compile(schema, name, {
    cwd: schemas,
    bannerComment: "",
    additionalProperties: false,
    style: { printWidth: 100 },
  });
  return `export namespace ${name}Schema {\n${text}}\nexport type ${name} = ${name}Schema.${name};\n`;
}

const parts = await Promise.all(Object.entries(results).map(typeOf));
const text = `// Made by scripts/schemas.mjs of docs/schema; not to be edited.\n\n${parts.join("\n")}`;

if (process.argv.includes("--check")) {
  if (text !== (await readFile(target, "utf8"))) {
    console.error("src/generated/schemas.ts is not what docs/schema says: npm run types");
    process.exit(1);
  }
} else {
  await mkdir(new URL(".", target), { recursive: true });
  await writeFile(target, text);
}
