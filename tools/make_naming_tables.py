#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""Writes brindle/chords/internal/NamingTables.h from data/chord-naming/."""

import csv
import pathlib

ROOT = pathlib.Path(__file__).resolve().parent.parent
FAMILIES = ["dominant", "major", "minor", "diminished", "other"]

# The tables in the order of the source: name in the file, constant, meaning.
CONTEXTS = [
    ("next", "kNextRootCosts", "The root of the next chord lies so many semitones up."),
    ("previous", "kPreviousRootCosts", "The root lies so many semitones above the one before."),
    ("major", "kMajorKeyCosts", "The root lies so many semitones above a major tonic."),
    ("minor", "kMinorKeyCosts", "The root lies so many semitones above a minor tonic."),
]

HEAD = """\
// SPDX-License-Identifier: MIT
// Made by tools/make_naming_tables.py from data/chord-naming/. The figures are tenths of -log2 of a
// share; they were counted by us in about 240,000 chords of three annotated corpora.
#pragma once

#include <array>
#include <cstdint>
#include <string_view>

namespace brindle {

/// A row of the chord types: what is behind the root, the degrees from the root up (in brackets
/// those that are usually left out), how rare the type is, and how rare it is over a bass so many
/// semitones above its root.
struct CNamingTypeRow {
    std::string_view mSuffix;
    std::string_view mDegrees;
    std::int16_t mCost;
    std::array<std::int16_t, 12> mCostOverBass;
};

/// Costs by family (dominant, major, minor, diminished, other) and interval.
using TNamingContextTable = std::array<std::array<std::int16_t, 12>, 5>;

// clang-format off

"""

TAIL = """\
// clang-format on

}  // namespace brindle
"""


def rows(name):
    path = ROOT / "data" / "chord-naming" / name
    with path.open(encoding="utf-8", newline="") as file:
        return list(csv.DictReader(file, delimiter="\t", quoting=csv.QUOTE_NONE))


def costs(values):
    return "{" + ", ".join(f"{int(value):3}" for value in values) + "}"


def type_row(row):
    suffix = f'"{row["suffix"]}",'
    degrees = f'"{row["degrees"]}",'
    over = costs(row[f"over_{bass}"] for bass in range(12))
    return f"    {{{suffix:13} {degrees:26} {int(row['cost']):3}, {{{over}}}}},\n"


def context_table(context, name, constant, meaning):
    text = f"\n// {meaning}\ninline constexpr TNamingContextTable {constant}{{{{\n"
    for family in FAMILIES:
        [row] = [row for row in context if (row["table"], row["family"]) == (name, family)]
        text += f"    {{{costs(row[str(intvl)] for intvl in range(12))}}},  // {family}\n"
    return text + "}};\n"


def source():
    types = rows("types.tsv")
    text = HEAD + "// At equal costs the upper row wins.\n"
    text += f"inline constexpr std::array<CNamingTypeRow, {len(types)}> kNamingTypeRows{{{{\n"
    text += "".join(type_row(row) for row in types) + "}};\n"
    context = rows("context.tsv")
    text += "".join(context_table(context, *table) for table in CONTEXTS)
    return text + "\n" + TAIL


def main():
    path = ROOT / "brindle" / "chords" / "internal" / "NamingTables.h"
    path.write_text(source(), encoding="utf-8")


if __name__ == "__main__":
    main()
