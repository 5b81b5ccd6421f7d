#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""Makes brindle/song/internal/BuiltInSongs_Table.cpp from data/built-in-songs.txt, from the songs in
examples/ and from the lead sheets in tests/data/leadsheets.

make_built_in_songs.py BRINDLE: the program that reads the chords of the lead sheets.
"""
import pathlib
import re
import subprocess
import sys

ROOT = pathlib.Path(__file__).resolve().parent.parent
SHEETS = ROOT / "tests/data/leadsheets"

# Style, file, makers. Scores that are not songs, such as Für Elise, are left out.
LEAD_SHEETS = [
    ("early jazz", "ain_t_we_got_fun.musicxml", "Ain't We Got Fun?", "Richard Whiting (1891-1938), 1921"),
    ("folk", "beautiful_dreamer.musicxml", "Beautiful Dreamer", "Stephen Foster (1826-1864), 1864"),
    ("hymn", "coventry_carol.xml", "The Coventry Carol", "Traditional"),
    ("hymn", "down_by_the_riverside.mxl", "Down by the Riverside", "Traditional"),
    ("early jazz", "honeysuckle_rose.mxl", "Honeysuckle Rose", "Fats Waller (1904-1943), 1929"),
    ("hymn", "jesu_joy_of_man_s_desiring.mxl", "Jesu, Joy of Man's Desiring", "Johann Sebastian Bach (1685-1750)"),
    ("folk", "jingle_bells.mxl", "Jingle Bells", "James Pierpont (1822-1893), 1857"),
    ("hymn", "joshua_fit_the_battle_of_jericho.musicxml", "Joshua Fit the Battle of Jericho", "Traditional"),
    ("early jazz", "makin_whoopee.mxl", "Makin' Whoopee!", "Walter Donaldson (1893-1947), 1928"),
    ("ragtime", "maple_leaf_rag.musicxml", "Maple Leaf Rag", "Scott Joplin (1868-1917), 1899"),
    ("folk", "smilin_through.musicxml", "Smilin' Through", "Arthur Penn (1875-1941), 1919"),
    ("hymn", "sometimes_i_feel_like_a_motherless_child.xml", "Sometimes I Feel Like a Motherless Child", "Traditional"),
    ("ragtime", "the_entertainer.mxl", "The Entertainer", "Scott Joplin (1868-1917), 1902"),
    ("folk", "the_skye_boat_song.xml", "The Skye Boat Song", "Traditional"),
    ("hymn", "we_three_kings.mxl", "We Three Kings", "John Hopkins (1820-1891), 1857"),
    ("blues", "west_end_blues.musicxml", "West End Blues", "King Oliver (1881-1938), 1928"),
    ("folk", "what_child_is_this.musicxml", "What Child Is This", "Traditional"),
    ("folk", "what_shall_we_do_with_a_drunken_sailor.xml", "Drunken Sailor", "Traditional"),
]
EXAMPLES = [
    ("hymn", "amazing-grace.txt", "Amazing Grace", "Traditional", 4),
    ("folk", "auld-lang-syne.txt", "Auld Lang Syne", "Traditional", 4),
    ("folk", "greensleeves.txt", "Greensleeves", "Traditional", 4),
    ("folk", "rising-sun.txt", "House of the Rising Sun", "Traditional", 4),
]


def one_line(text):
    return re.sub(r"\s+", " ", text).strip()


def rows(program):
    for line in (ROOT / "data/built-in-songs.txt").read_text().splitlines():
        if line.startswith("#") or not line.strip():
            continue
        style, title, makers, key, beats, chords = [field.strip() for field in line.split(";")]
        yield style, title, makers, key, beats, "0", chords
    for style, name, title, makers, beats in EXAMPLES:
        text = (ROOT / "examples/songs" / name).read_text()
        yield style, title, makers, "", str(beats), "1", one_line(text)
    for style, name, title, makers in LEAD_SHEETS:
        run = subprocess.run([program, "harmonies", str(SHEETS / name), "--format", "chords"],
                             capture_output=True, text=True, check=True)
        hint = re.search(r"--beats-per-bar (\S+) --beats-per-chord (\S+)", run.stderr)
        beats, step = hint.groups() if hint else ("4", "1")
        yield style, title, makers, "", beats, step, one_line(run.stdout)


def literal(text):
    return '"' + text.replace("\\", "\\\\").replace('"', '\\"') + '"'


def main():
    lines = ["// SPDX-License-Identifier: MIT",
             "// Made by tools/make_built_in_songs.py from data/built-in-songs.txt, examples/songs and",
             "// tests/data/leadsheets, which tell where the songs come from.",
             '#include "brindle/song/internal/BuiltInSongs_Table.h"', "", "#include <array>", "",
             "namespace brindle {", "namespace {", "", "// clang-format off",
             "constexpr auto kBuiltInSongs = std::to_array<CBuiltInSongRow>({"]
    for style, title, makers, key, beats, step, chords in rows(sys.argv[1]):
        lines.append(f"    {{{literal(style)}, {literal(title)}, {literal(makers)}, {literal(key)}, "
                     f"{beats}, {step},")
        words = chords.split(" ")
        line = ""
        for word in words:
            if len(line) + len(word) > 84:
                lines.append("     " + literal(line))
                line = ""
            line += word + " "
        lines.append("     " + literal(line.rstrip()) + "},")
    lines += ["});", "// clang-format on", "", "}  // namespace", "",
              "std::span<const CBuiltInSongRow> BuiltInSongRows() {", "    return kBuiltInSongs;", "}",
              "", "}  // namespace brindle", ""]
    (ROOT / "brindle/song/internal/BuiltInSongs_Table.cpp").write_text("\n".join(lines))


if __name__ == "__main__":
    main()
