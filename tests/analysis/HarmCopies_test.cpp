// SPDX-License-Identifier: MIT
#include "tests/analysis/PlainCopies.h"
#include "tests/analysis/RandomChordTexts.h"
#include "tests/support/Expected.h"

#include "brindle/analysis/CHarmonicAnalyse.h"
#include "brindle/analysis/TChordStringParse.h"

#include <doctest/doctest.h>
#include <cmath>
#include <limits>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

CHarmCopies CopiesOf(const CHarmAnlsChords& chords) {
    CHarmonicAnalyse analyse;
    analyse.mChords = chords;
    CHarmCopies copies;
    analyse.FindHarmCopies(copies);
    return copies;
}

CHarmCopies CopiesOf(std::string_view text, double beatsPerChord) {
    TChordStringParse parse;
    parse.mBeatsPerChord = beatsPerChord;
    return CopiesOf(CHarmAnlsChords(text, parse));
}

json FormOf(const CHarmCopies& copies) {
    json form = json::array();
    for (const CHarmCopy& copy : copies) {
        form.push_back({copy.mTargetPos, copy.mSourceOffsetBars, copy.mLengthBars, copy.mChords});
    }
    return form;
}

/// Up to `most` chords: blocks of a few chords, repeated, cut and joined, in which some chords
/// differ in their bass or spelling only.
CHarmAnlsChords RandomSong(CChance& chance, std::size_t most) {
    constexpr std::array lengths = {1.0, 2.0, 0.5, 4.0};
    const std::size_t kinds = 1 + chance.Below(4);
    const bool hasOddChords = chance.OneIn(3);
    const bool hasLengths = chance.OneIn(3);
    const double beat = chance.OneIn(3) ? 0.1 : chance.Of<double>(lengths);
    const auto anyChord = [&] {
        CChordLite chord({static_cast<int>(chance.Below(kinds)), TEnh_n}, CKeyEnh_Undef,
                         CSemitones{0, 4, 7});
        if (hasOddChords && chance.OneIn(3)) chord.mBassKeyEnh = {4, TEnh_n};
        if (hasOddChords && chance.OneIn(6)) chord.mRootKeyEnh.mEnh = TEnh_s;
        return std::pair(chord, hasLengths ? chance.Of<double>(lengths) : beat);
    };
    std::vector<std::pair<CChordLite, double>> song;
    const std::size_t count = 1 + chance.Below(most);
    while (song.size() < count) {
        // A passage of before once or many times, or new chords.
        if (song.empty() || chance.OneIn(3)) {
            for (std::size_t n = 1 + chance.Below(6); n > 0; --n) song.push_back(anyChord());
            continue;
        }
        const std::size_t first = chance.Below(song.size());
        const std::size_t length = 1 + chance.Below(song.size() - first);
        const std::size_t times = chance.OneIn(2) ? 1 : 1 + chance.Below(8);
        for (std::size_t n = 0; n < length * times && song.size() < count; ++n) {
            song.push_back(song[first + n % length]);
        }
    }
    CHarmAnlsChords chords;
    double position = 0.0;
    for (const auto& [chord, length] : song) {
        chords.emplace_back(chord, position);
        position += length;
    }
    if (!chance.OneIn(4)) chords.emplace_back(CChordLite_Undef, position);
    return chords;
}

}  // namespace

TEST_CASE("Repeated passages of a chord text are found with their places") {
    CheckExpected("harm_copies", {{"CHarmonicAnalyse::FindHarmCopies", [](const json& in) {
                                       return FormOf(CopiesOf(in.at(0).get<std::string>(),
                                                              in.at(1).get<double>()));
                                   }}});
}

TEST_CASE("A passage is repeated when chords, bass, spelling and lengths agree") {
    struct CCase {
        const char* mText;
        double mBeatsPerChord;
        json mCopies;
    };
    const CCase cases[] = {
        {"C F C", 4.0, json::array()},
        {"C F C F", 2.0, {{4.0, -1, 1, 0}}},
        {"C F C . F", 2.0, json::array()},
        {"C F D G", 2.0, json::array()},
        {"C/E F C/G F", 2.0, json::array()},
        {"C# F# Db Gb", 2.0, json::array()},
        {"C F C F C F", 2.0, {{4.0, -1, 1, 0}, {8.0, -2, 1, 0}}},
        // Both in one sequence, whose source is the first of all.
        {"C/E F C/E F C/G F C/G F", 2.0, {{4.0, -1, 1, 0}, {8.0, -2, 1, 0}, {12.0, -3, 1, 0}}},
        // Two beats are no bar.
        {"C F C F", 1.0, {{2.0, 0, 0, 0}}},
        // Each half beat is cut off the position, but not off the length.
        {"C F G Am C F G Am", 0.5, {{0.0, 0, 0, 0}}},
        // The repetition inside the source is reported with it, that inside the copy is not.
        {"C F C F G C F C F G", 4.0, {{8.0, -2, 2, 0}, {20.0, -5, 2, 0}, {28.0, -7, 2, 0}}},
    };
    for (const auto& [text, beats, copies] : cases) {
        const auto& logged = text;
        CAPTURE(logged);
        CHECK(FormOf(CopiesOf(text, beats)) == copies);
    }
}

TEST_CASE("Random songs have the copies that the plain search finds") {
    std::size_t copyCount = 0;
    for (std::uint32_t seed = 1; seed <= 500; ++seed) {
        CChance chance(seed);
        const CHarmAnlsChords chords = RandomSong(chance, seed % 50 == 0 ? 120 : 40);
        CHarmonicAnalyse analyse;
        analyse.mChords = chords;
        CHarmAnlsChordsWithLength list;
        analyse.ListAllHarmChordsWithLength(list);
        CAPTURE(seed);
        REQUIRE(list.size() == chords.size());
        REQUIRE(std::equal(list.begin(), list.end(), PlainChordsWithLength(chords).begin()));
        THarmRepeatingSequences sequences;
        analyse.GenerateVectorWithRepeatingSequenceIndices(sequences, list);
        REQUIRE(sequences == PlainSequences(list));
        const CHarmCopies copies = CopiesOf(chords);
        REQUIRE(FormOf(copies) == FormOf(PlainCopies(chords)));
        copyCount += copies.size();
    }
    CHECK(copyCount > 500);
}

TEST_CASE("A start is added unless it is there or inside of an earlier passage") {
    const CHarmonicAnalyse analyse;
    std::vector<std::uint64_t> indices = {10};
    for (const std::uint64_t start : {10U, 13U, 7U, 14U, 9U}) {
        analyse.InsertRangeStartIfNoCollision(indices, start, 4);
    }
    CHECK(indices == std::vector<std::uint64_t>{10, 7, 14});
    analyse.InsertRangeStartIfNoCollision(indices, 20, std::numeric_limits<std::uint64_t>::max());
    CHECK(indices.size() == 3);
}

TEST_CASE("Recurring chords are searched up to the last but one") {
    const CHarmonicAnalyse analyse;
    CHarmAnlsChordsWithLength chords(5, CHarmAnlsChordWithLength(CChordLite_Undef, 1.0));
    chords[2].mBassDistToHarmCenter = 7;
    std::vector<std::uint64_t> indices = {99};
    analyse.FindRecurringChordIndices(indices, chords, 0);
    CHECK(indices == std::vector<std::uint64_t>{1, 3});
    analyse.FindRecurringChordIndices(indices, chords, 4);
    CHECK(indices.empty());
    analyse.FindRecurringChordIndices(indices, chords, 5);
    CHECK(indices.empty());
}

TEST_CASE("Positions that make no sense give limited bars and no fault") {
    const double infinity = std::numeric_limits<double>::infinity();
    for (const double step : {1e300, -3.0, infinity, std::nan(""), 1e10, kPosUndef}) {
        CHarmAnlsChords chords;
        for (int n = 0; n < 12; ++n) chords.emplace_back(CChordLite_Undef, step * (n % 6));
        CAPTURE(step);
        const CHarmCopies copies = CopiesOf(chords);
        CHECK(copies.size() < 6);
    }
    CHarmAnlsChordsWithLength chords(6, CHarmAnlsChordWithLength(CChordLite_Undef, std::nan("")));
    THarmRepeatingSequences sequences;
    CHarmonicAnalyse().GenerateVectorWithRepeatingSequenceIndices(sequences, chords);
    CHECK(sequences.empty());
}

TEST_CASE("Sequences of any starts and lengths leave a passage within its chords") {
    const CHarmonicAnalyse analyse;
    const CHarmAnlsChordsWithLength chords(8, CHarmAnlsChordWithLength(CChordLite_Undef, 4.0));
    constexpr std::uint64_t huge = std::numeric_limits<std::uint64_t>::max();
    const THarmRepeatingSequences sequences = {
        {{0, 0}, 0}, {{huge, 3}, huge}, {{huge, huge - 1, 9, 97, 96}, 2}, {{104, 100, 102}, 2}};
    CHarmCopies copies;
    analyse.RecursiveFillWithSequences(chords, sequences, 100, 1000, copies);
    CHECK(FormOf(copies) == json({{1008.0, -2, 2, 0}, {1016.0, -4, 2, 0}}));
    copies.clear();
    analyse.RecursiveFillWithSequences({}, sequences, 0, 0, copies);
    CHECK(copies.empty());
}
