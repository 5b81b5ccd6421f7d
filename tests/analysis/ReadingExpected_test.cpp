// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/analysis/ReadHarmony.h"
#include "brindle/theory/KeyIntervals.h"

#include <doctest/doctest.h>
#include <nlohmann/json.hpp>

#include <cmath>
#include <fstream>
#include <string>

namespace brindle::test {
namespace {

// Makes the lengths of 0.25 and 0.3 bars whole beats, so that ties of keys stay ties.
constexpr double kBeatsPerBar = 20.0;

// [root, mask, bass or -1, length in bars] a chord.
CHarmAnlsChords ChordsOf(const nlohmann::json& rows) {
    CHarmAnlsChords chords;
    double position = 0.0;
    for (const nlohmann::json& row : rows) {
        CChordLite chord{{row[0].get<int>(), TEnh_Undef},
                         CKeyEnh_Undef,
                         CSemitones(row[1].get<std::uint64_t>())};
        if (row[2] != -1) chord.mBassKeyEnh = {row[2].get<int>(), TEnh_Undef};
        chords.emplace_back(chord, position);
        position += std::round(kBeatsPerBar * row[3].get<double>());
    }
    chords.emplace_back(CChordLite_Undef, position);
    return chords;
}

int NumberOf(const CSignKeyLite& key) {
    return FoldIntoOctave(key.mRootKeyEnh.mKeyNr) +
           (key.mSignKeyType == TSignKeyType_Minor ? 12 : 0);
}

// [key, numeral, function, relation, served degree, resolves to, under, deceptive] a chord.
nlohmann::json RowsOf(const CSongReading& reading) {
    nlohmann::json rows = nlohmann::json::array();
    for (const CChordReading& chord : reading.mChords) {
        if (chord.mKey.IsUndef()) continue;
        rows.push_back({NumberOf(chord.mKey), chord.mNumeral, LetterOf(chord.mFunction),
                        NameOf(chord.mRelation), chord.mServes.Name(), chord.mResolvesTo,
                        chord.mUnder, chord.mDeceptive});
    }
    return rows;
}

TEST_CASE("Chords at random are read as another program of the same method reads them") {
    std::ifstream file(BRINDLE_TEST_DATA "/reading/expected.jsonl");
    const CReadingOptions options{.mKeys = {.mBeatsPerBar = kBeatsPerBar}};
    std::size_t songs = 0;
    for (std::string line; std::getline(file, line); ++songs) {
        const nlohmann::json song = nlohmann::json::parse(line);
        CAPTURE(song["chords"].dump());
        CHECK(RowsOf(ReadHarmony(ChordsOf(song["chords"]), options)) == song["reading"]);
    }
    CHECK(songs == 3000);
}

}  // namespace
}  // namespace brindle::test
