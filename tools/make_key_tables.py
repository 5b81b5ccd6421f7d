#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""Writes brindle/analysis/internal/KeyTables.cpp from data/key-tables.json."""

import json
import pathlib

ROOT = pathlib.Path(__file__).resolve().parent.parent

CLASSES = ["triad", "maj7", "dom", "min", "min7", "hdim", "dim", "open"]
GROUPS = ["major", "dominant", "minor"]
STEPS = [f"{group} +{up}" for group in GROUPS for up in range(12)]

# The tables in the order of the source: member of the JSON, constant, meaning, names of the rows.
TABLES = [
    ("time", "kKeyTimeTable", "How well a class on a degree fits the song, by how long it sounds.",
     CLASSES),
    ("bass", "kKeyBassTable", "The same for the bass.", ["bass"]),
    ("first", "kKeyFirstTable", "The class and degree that a song begins with.", CLASSES),
    ("last", "kKeyLastTable", "The class and degree that a song ends with.", CLASSES),
    ("step", "kKeyStepTable",
     "A step from a chord of a group, so many semitones up, to a root on a degree.", STEPS),
    ("local", "kKeyLocalTable", "How well a class on a degree fits a passage.", CLASSES),
]

HEAD = """\
// SPDX-License-Identifier: MIT
// Made by tools/make_key_tables.py from data/key-tables.json. The figures were counted and fitted
// by us on annotated chord corpora: When in Rome, Jazz Harmony Treebank, a jazz chord corpus,
// McGill Billboard and Nottingham.

#include "brindle/analysis/internal/KeyTables.h"

namespace brindle {

// Columns: semitones above the tonic, 0 to 11.
// clang-format off
"""

TAIL = """\
// clang-format on

}  // namespace brindle
"""


def row(name, values):
    cells = ", ".join(f"{value:4.1f}" for value in values)
    return f"    {{{{{cells}}}}},  // {name}\n"


def table(rows_of_modes, constant, meaning, names):
    text = f"\n// {meaning}\nconstinit const TKeyTable<{len(names)}> {constant}{{{{\n"
    for mode, rows in zip(["major", "minor"], rows_of_modes, strict=True):
        text += f"    {{{{  // {mode}\n"
        for name, values in zip(names, rows, strict=True):
            text += row(name, values)
        text += "    }},\n"
    return text + "}};\n"


def source(tables):
    text = HEAD
    for member, constant, meaning, names in TABLES:
        text += table(tables[member], constant, meaning, names)
    change = tables["change"]
    text += "\n// What a change of key costs.\n"
    text += (f"constinit const TKeyChangeCosts kKeyChangeCosts{{.mBase = {change['base']}, "
             f".mFifth = {change['fifth']}, .mParallel = {change['parallel']}}};\n")
    text += "\n// What a chord in the key of the song gains.\n"
    text += f"constinit const double kKeyHomeBonus = {tables['home']};\n"
    return text + TAIL


def main():
    tables = json.loads((ROOT / "data" / "key-tables.json").read_text(encoding="utf-8"))
    (ROOT / "brindle" / "analysis" / "internal" / "KeyTables.cpp").write_text(source(tables), encoding="utf-8")


if __name__ == "__main__":
    main()
