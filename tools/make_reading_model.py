#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""Writes KeyTables.cpp and ChainTables.cpp, in brindle/analysis/internal, from data/reading-model.json.

With --check it writes nothing and fails if a source is not as it would be written.
"""

import json
import pathlib
import sys

ROOT = pathlib.Path(__file__).resolve().parent.parent

CLASSES = ["triad", "maj7", "dom", "min", "min7", "hdim", "dim", "open"]
KINDS = CLASSES + ["dom, resolving", "dom, substitute", "min7 before its dom", "hdim before its dom",
                   "dim, leading", "triad, resolved", "maj7, resolved", "min, resolved"]
GROUPS = ["major", "dominant", "minor"]
STEPS = [f"{group} +{up}" for group in GROUPS for up in range(12)]
WAYS = ["next chord", "above that"] + [f"above that, {n}" for n in range(2, 6)]

# The tables in the order of their source: member of the JSON, constant, meaning, names of the rows.
KEY_TABLES = [
    ("global_time", "kKeyTimeTable",
     "How well a class on a degree fits the song, by how long it sounds.", CLASSES),
    ("global_bass", "kKeyBassTable", "The same for the bass.", ["bass"]),
    ("global_first", "kKeyFirstTable", "The class and degree that a song begins with.", CLASSES),
    ("global_last", "kKeyLastTable", "The class and degree that a song ends with.", CLASSES),
    ("global_step", "kKeyStepTable",
     "A step from a chord of a group, so many semitones up, to a root on a degree.", STEPS),
    ("local", "kKeyLocalTable", "How well a kind on a degree fits a passage.", KINDS),
]
CHAIN_TABLES = [
    ("motion", "kChainMotion", "A kind that stands under a chord so many semitones above it.",
     KINDS),
    ("goal", "kChainGoal", "A kind under a root so many semitones above the tonic of the song.",
     KINDS),
    ("to", "kChainTo", "Any chord so many semitones below a chord of this class.", CLASSES),
    ("depth", "kChainDepth",
     "A kind, a column each, under the next chord, the one that that stands under, and so on.",
     WAYS),
    ("rest", "kChainRest",
     "A class that prepares nothing: semitones above the tonic of a major, then of a minor song.",
     CLASSES),
]

HEAD = """\
// SPDX-License-Identifier: MIT
// Made by tools/make_reading_model.py from data/reading-model.json. The figures were counted and
// fitted by us on annotated chord corpora: When in Rome, Jazz Harmony Treebank, a jazz chord
// corpus, McGill Billboard and Nottingham.

#include "brindle/analysis/internal/{header}.h"

namespace brindle {{

// {columns}
// clang-format off
"""

TAIL = """\
// clang-format on

}  // namespace brindle
"""


def row(name, cells):
    return f"    {{{{{', '.join(cells)}}}}},  // {name}\n"


def points(value):
    return f"{value:4.1f}"


def tenths(value):
    return f"{round(value * 10):3d}"


def key_table(rows_of_modes, constant, meaning, names):
    text = f"\n// {meaning}\nconstinit const TKeyTable<{len(names)}> {constant}{{{{\n"
    for mode, rows in zip(["major", "minor"], rows_of_modes, strict=True):
        text += f"    {{{{  // {mode}\n"
        for name, values in zip(names, rows, strict=True):
            text += row(name, map(points, values))
        text += "    }},\n"
    return text + "}};\n"


def chain_table(rows, constant, meaning, names):
    kind = f"TChainTable<{len(names)}, {len(rows[0])}>"
    text = f"\n// {meaning}\nconstinit const {kind} {constant}{{{{\n"
    for name, values in zip(names, rows, strict=True):
        text += row(name, map(tenths, values))
    return text + "}};\n"


def sources(model):
    keys = HEAD.format(header="KeyTables", columns="Columns: semitones above the tonic, 0 to 11.")
    for member, *rest in KEY_TABLES:
        keys += key_table(model[member], *rest)
    chain = HEAD.format(header="ChainTables", columns="In tenths of a point.")
    for member, *rest in CHAIN_TABLES:
        chain += chain_table(model[member], *rest)
    return {"KeyTables.cpp": keys + TAIL, "ChainTables.cpp": chain + TAIL}


def main():
    model = json.loads((ROOT / "data" / "reading-model.json").read_text(encoding="utf-8"))
    for name, text in sources(model).items():
        path = ROOT / "brindle" / "analysis" / "internal" / name
        if "--check" not in sys.argv:
            path.write_text(text, encoding="utf-8")
        elif path.read_text(encoding="utf-8") != text:
            sys.exit(f"{name} is not as {pathlib.Path(__file__).name} writes it")


if __name__ == "__main__":
    main()
