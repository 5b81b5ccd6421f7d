// SPDX-License-Identifier: MIT
#include "brindle/song/HarmonySymbols.h"

#include "brindle/chords/ReadChordText.h"
#include "brindle/musicxml/HarmonyKinds.h"
#include "brindle/musicxml/TMusicXMLDoc.h"

#include <doctest/doctest.h>
#include <fmt/format.h>

#include <string>

namespace brindle::test {
namespace {

TMusicXMLHarmony HarmonyOf(const std::string& kind) {
    TMusicXMLDoc sheet;
    REQUIRE(sheet.LoadAsPlayedFromBytes(
        fmt::format("<score-partwise><part-list><score-part id='P1'><part-name/></score-part>"
                    "</part-list><part id='P1'><measure><harmony><root><root-step>A</root-step>"
                    "<root-alter>-1</root-alter></root>{}</harmony><note><rest/><duration>4"
                    "</duration></note></measure></part></score-partwise>",
                    kind),
        nullptr));
    REQUIRE(sheet.Harmonies.size() == 1);
    return sheet.Harmonies[0];
}

TEST_CASE("Harmonies of scores are written as people type them, and read back") {
    struct CCase {
        const char* mKind;
        const char* mSymbol;
    };
    const CCase cases[] = {
        {"<kind>major</kind>", "Ab"},
        {"<kind>half-diminished</kind>", "Abm7b5"},
        {"<kind>major-minor</kind>", "Abm(maj7)"},
        {"<kind>augmented-seventh</kind>", "Ab7#5"},
        {"<kind text='9+'>augmented-ninth</kind>", "Ab9#5"},
        {"<kind>suspended-fourth</kind><degree><degree-value>7</degree-value><degree-alter>0"
         "</degree-alter><degree-type>add</degree-type></degree>",
         "Ab7sus4"},
        {"<kind>dominant-13th</kind>", "Ab13"},
        {"<kind>power</kind>", "Ab5"},
        {"<kind>French</kind>", "Ab7b5"},
        {"<kind>none</kind>", "N.C."},
    };
    for (const auto& [kind, symbol] : cases) {
        const std::string logged(kind);
        INFO(logged);
        const TMusicXMLHarmony harmony = HarmonyOf(kind);
        CHECK(HarmonySymbol(harmony) == symbol);
        const CChordLite chord = ChordOfHarmony(harmony);
        if (!chord.IsUndef()) CHECK(ReadChordText(symbol).mChord == chord);
    }
}

}  // namespace
}  // namespace brindle::test
