// SPDX-License-Identifier: MIT
#include "tests/guitarchords/GridForms.h"
#include "tests/support/Expected.h"

#include "brindle/guitarchords/GChChordTypes.h"
#include "brindle/guitarchords/GChHarmonyStrings.h"

#include <doctest/doctest.h>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

GChChord ChordOf(const json& in) {
    return ViewOf(BasicChordOf(in.at(0), in.at(1).get<int>(), in.at(2)));
}

}  // namespace

TEST_CASE("The catalogue of guitar chords lists each type under its name and number") {
    CheckExpected("guitar_chord_types",
                  {{"GChNumberOfChordTypes", [](const json&) { return GChNumberOfChordTypes(); }},
                   {"GChChordTypeNameForIndex",
                    [](const json& in) { return GChChordTypeNameForIndex(in.at(0)); }},
                   {"GChChordTypeIdForIndex",
                    [](const json& in) { return GChChordTypeIdForIndex(in.at(0)); }},
                   {"GChChordTypeNameForId",
                    [](const json& in) { return GChChordTypeNameForId(in.at(0)); }}});
}

TEST_CASE("A grid is named over its root by the notes that it sounds") {
    CheckExpected("guitar_harmony_strings",
                  {{"GChHarmonyStringFromChord",
                    [](const json& in) {
                        const GChChord chord = ChordOf(in);
                        return GChHarmonyStringFromChord(&chord, in.at(3), in.at(4), in.at(5))
                            .value_or("nothing");
                    }},
                   {"GChHarmonyCommaSeparatedStringFromChord",
                    [](const json& in) {
                        const GChChord chord = ChordOf(in);
                        return GChHarmonyCommaSeparatedStringFromChord(&chord, in.at(3), in.at(4),
                                                                       in.at(5))
                            .value_or("nothing");
                    }},
                   {"GChProposedRootNoteFromChord", [](const json& in) {
                        const GChChord chord = ChordOf(in);
                        return GChProposedRootNoteFromChord(&chord, in.at(3));
                    }}});
}

TEST_CASE("A grid has a name without a root, and none over a root above 11") {
    const GChChord open = ViewOf(BasicChordOf({52, 57, 62, 67, 71, 76}, 0, json::array()));
    CHECK(GChHarmonyStringFromChord(&open, -1, -1, 0) == "No Chord/E");
    CHECK_FALSE(GChHarmonyStringFromChord(&open, 12, -1, 0).has_value());
    CHECK_FALSE(GChHarmonyStringFromChord(nullptr, 0, -1, 0).has_value());
    CHECK(GChHarmonyStringFromChord(&open, -5, -1, 0) ==
          GChHarmonyStringFromChord(&open, 0, -1, 0));
    CHECK(GChProposedRootNoteFromChord(nullptr, 0) == -1);
    // A sharp is one character: "G♯ 6/9" is shorter than "F m 7/11".
    CHECK(GChProposedRootNoteFromChord(&open, 1) == 8);
    const GChChord muted = ViewOf(BasicChordOf({52, 57, 62, 67, 71, 76}, 0x3F, json::array()));
    CHECK(GChHarmonyStringFromChord(&muted, 7, -1, 0) == "G");
}
