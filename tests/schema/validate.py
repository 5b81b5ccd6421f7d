#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""Validates what the program prints with --json against docs/schema.

usage: validate.py PROGRAM SOURCE_FOLDER

Every command with --json in the golden transcripts is run, and some more so that each schema meets
real output. Exit status 77 if no validator is installed.
"""

import copy
import json
import pathlib
import re
import shlex
import subprocess
import sys
import tempfile
import warnings

try:
    import jsonschema
except ImportError:
    print("skipped: python3-jsonschema is not installed")
    sys.exit(77)

MORE_COMMANDS = [
    'analyse "Dm7 G7 | Cmaj7 . | N.C. . | Fm Bb7" --json --readings',
    "analyse examples/scores/beautiful-dreamer.musicxml --json",
    "analyse examples/scores/beautiful-dreamer.musicxml --json --timing native",
    "analyse examples/songs/auld-lang-syne.txt 'C G' --json",
    "keys examples/songs/auld-lang-syne.txt 'C G' --json",
    "copies examples/songs/auld-lang-syne.txt 'C G' --json",
    'analyse "C E7 Am | Dm7 G7 | C N.C. Fm C" --json --explain',
    "harmonies examples/scores/beautiful-dreamer.musicxml --json",
    "harmonies --from-notes examples/scores/prelude-in-c.musicxml --json",
    'key "F# minor" --json',
    "grid x02210 --json",
    "grid Am --json",
    "grids list --json",
    "grids show --json",
    "grids export",
    "grids for 'Bb F N.C. Gm' --json",
    "name E2 G3 C4 Bb4 --json",
    "name E2 G3 C4 Bb4 --json --all-roots --method net",
    "name 60 --json",
    "net trace --json",
    "net weights --json",
    'keys "Dm7 G7 C" --json',
    'numerals "V7b9 iih7 V13 I" --key "A minor" --json',
    'numerals "I X77 V" --key C --lenient --json',
    'numerals --from romantext "C: I V7 a: i" --json',
    'numerals --from romantext "m1 vi a: i b2 nonsense b3 NC" --key C --lenient --json',
    "types --json",
    "vector Db7/B --json",
    "import examples/scores/frere-jacques.musicxml --json",
    "import examples/no-such-score.musicxml --json",
    "markov learn --plain --json -o {folder}/model.json examples/songs leadsheets",
    "markov generate {folder}/model.json --beats 16 --seed 1 --json",
    'markov fill {folder}/model.json "(4,C);(4,U);(4,G7)" --seed 1 --json',
    "markov show {folder}/model.json --json",
    "markov learn --json -o {folder}/songs.json examples/songs leadsheets",
    "markov generate --seed 1 --json",
    'markov next "Dm7 G7" --json',
    "markov songs --json",
    "markov score built-in --json",
    "corpus examples/songs examples/scores leadsheets",
    "corpus examples/songs no-such-file examples/scores/SOURCE.txt",
]
TWO_WORDS = {"grids", "net", "markov"}
# What prints JSON without being asked, and what prints a line of it for each event.
NAMES = {"grids-show": "grid", "import": "import-line"}


def schema_name(words):
    plain = [word for word in words if not word.startswith("-")]
    name = "-".join(plain[: 2 if plain[0] in TWO_WORDS else 1])
    return NAMES.get(name, name)


def golden_commands(source):
    for file in sorted((source / "tests/cli/golden").glob("*.txt")):
        for line in file.read_text(errors="replace").splitlines():
            command = line.removeprefix("$ brindle ").split("|")[0].strip()
            if line.startswith("$ brindle ") and "--json" in command and "<" not in command:
                if command.count('"') % 2 == 0 and command.count("'") % 2 == 0:
                    yield command


class Schemas:
    def __init__(self, folder):
        self.validators = {}
        self.used = set()
        for file in folder.glob("*.json"):
            schema = json.loads(file.read_text())
            jsonschema.Draft202012Validator.check_schema(schema)
            with warnings.catch_warnings():
                warnings.simplefilter("ignore")
                resolver = jsonschema.RefResolver(file.resolve().as_uri(), schema)
            self.validators[file.stem] = jsonschema.Draft202012Validator(schema, resolver=resolver)

    def errors(self, name, value):
        self.used.add(name)
        errors = self.validators[name].iter_errors(value)
        return [f"{'/'.join(map(str, e.absolute_path))}: {e.message[:200]}" for e in errors]


def spoiled(value):
    """Copies of a value with one fault each: a member that is missing, one too many, a wrong type."""
    if isinstance(value, dict):
        for key, member in value.items():
            yield {k: v for k, v in value.items() if k != key}
            yield {**value, key: {"wrong": "type"}}
            if isinstance(member, (dict, list)):
                for fault in spoiled(member):
                    yield {**value, key: fault}
        yield {**value, "NoSuchMember": 1}
    elif isinstance(value, list) and value:
        for fault in spoiled(value[0]):
            yield [fault] + value[1:]


def planted_faults_pass(schemas):
    """How many faults in a small result are not noticed."""
    value = {
        "Key": "C Major",
        "Chords": [
            {
                "Symbol": "C",
                "Numeral": "I",
                "Nashville": "1",
                "RootKeyEnh": {"Name": "C", "KeyNr": 0, "Enh": "neutral"},
                "BassKeyEnh": None,
                "Semitones": 145,
                "Intervals": [0, 4, 7],
            }
        ],
        "Faults": [{"Line": 1, "Column": 3, "Word": "X", "Text": "this is no degree"}],
    }
    assert not schemas.errors("numerals", copy.deepcopy(value))
    faults = list(spoiled(value))
    assert len(faults) > 20
    return [fault for fault in faults if not schemas.errors("numerals", fault)]


def values_of(text, name):
    """Events and several songs have a line each."""
    if name not in {"import-line", "corpus"} and not text.startswith('{"Song":'):
        return [json.loads(text)]
    return [json.loads(line) for line in text.splitlines()]


def main():
    program, source = map(pathlib.Path.resolve, map(pathlib.Path, sys.argv[1:3]))
    schemas = Schemas(source / "docs/schema")
    faults = [f"not noticed: {json.dumps(fault)}" for fault in planted_faults_pass(schemas)]
    schemas.used.clear()
    count = 0
    with tempfile.TemporaryDirectory() as folder:
        here = pathlib.Path(folder)
        (here / "examples").symlink_to(source / "examples")
        (here / "leadsheets").symlink_to(source / "tests/data/leadsheets")
        for command in [*MORE_COMMANDS, *golden_commands(source)]:
            words = shlex.split(re.sub(r"\{folder\}", folder, command))
            run = subprocess.run(
                [program, *words], cwd=folder, stdin=subprocess.DEVNULL, capture_output=True
            )
            if not run.stdout:  # wrong use is tested elsewhere
                continue
            name = schema_name(words)
            for value in values_of(run.stdout.decode(), name):
                count += 1
                faults += [f"{command}: {error}" for error in schemas.errors(name, value)[:5]]
    unused = set(schemas.validators) - schemas.used - {"common"}
    faults += [f"no output met docs/schema/{name}.json" for name in sorted(unused)]
    print("\n".join(faults[:60]))
    print(f"{count} values, {len(schemas.used)} schemas, {len(faults)} faults")
    return 1 if faults else 0


if __name__ == "__main__":
    sys.exit(main())
