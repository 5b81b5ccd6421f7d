// SPDX-License-Identifier: MIT
#include "RandomChordTexts.h"

#include "brindle/analysis/ParseStringIntoHarmAnlsChords.h"
#include "brindle/song/ReadSong.h"

#include <doctest/doctest.h>

#include <string>

using namespace brindle;

TEST_CASE("Where both readers understand a text they agree") {
    test::CChance chance(7);
    int compared = 0;
    for (int i = 0; i < 2000; ++i) {
        const std::string text = test::RandomChordText(chance);
        // `C /E` is one chord for the one and two for the other; `X7` is no chord,
        // or how often a repeat is played.
        if (text.find(" /") != text.npos || text.find("X7") != text.npos) continue;
        const TChordStringParse parse = test::RandomBeats(chance);
        CSongOptions prefs;
        prefs.mFormat = TSongFormat_ChordText;
        prefs.mBeatsPerBar = parse.mBeatsPerBar;
        prefs.mBeatsPerChord = parse.mBeatsPerChord;
        const CSong song = ReadSong(text, prefs);
        if (!song.mFaults.empty() || text.find('H') != text.npos) continue;
        const CHarmAnlsChords parsed = ParseStringIntoHarmAnlsChords::ParseIntoChords(text, parse);
        CAPTURE(text);
        REQUIRE(song.mChords.size() == parsed.size());
        // Songs with bars last to the end of the last one.
        const bool hasBars = text.find('|') != text.npos;
        for (std::size_t k = 0; k + hasBars < parsed.size(); ++k) {
            CHECK(song.mChords[k].mPosition == parsed[k].mPosition);
        }
        ++compared;
    }
    CHECK(compared > 500);
}
