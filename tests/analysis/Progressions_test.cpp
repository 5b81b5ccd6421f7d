// SPDX-License-Identifier: MIT
#include "tests/support/Expected.h"
#include "tests/support/Forms.h"

#include "brindle/analysis/CHarmAnlsProgressions.h"
#include "brindle/analysis/TChordStringParse.h"
#include "brindle/theory/CIntvlSet.h"

#include <doctest/doctest.h>

#include <algorithm>
#include <array>
#include <map>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

const CHarmAnlsProgressions& TableOf(const json& name) {
    return name == "TonicProgressions" ? CHarmAnlsProgressions::TonicProgressions()
                                       : CHarmAnlsProgressions::CadenceProgressions();
}

/// Row numbers count from 1.
std::ptrdiff_t NumberOf(const CHarmAnlsProgression& row, const CHarmAnlsProgressions& table) {
    return std::find(table.begin(), table.end(), row) - table.begin() + 1;
}

json Forward(const json& in) {
    const CHarmAnlsChords chords(in.at(0).get<std::string>(), TChordStringParse{});
    const auto it = chords.begin() + in.at(1).get<int>();
    const CHarmAnlsProgressions& table = TableOf(in.at(2));
    json rows = json::array();
    for (const auto& row : table.FindAndSortForwardMatchingProgressions(it, chords)) {
        const auto center =
            row.HarmCenterFromProgressionAndChord(it, chords, TMatchDirection_Forward);
        rows.push_back(
            {NumberOf(row, table), test::FormOf(center.mRootKeyEnh), center.mSemitones.Mask()});
    }
    return rows;
}

json Backward(const json& in) {
    const CHarmAnlsChords chords(in.at(0).get<std::string>(), TChordStringParse{});
    const auto it = chords.begin() + in.at(1).get<int>();
    const CHarmAnlsProgressions& table = TableOf(in.at(2));
    json rows = json::array();
    for (const auto& row :
         table.FindAndSortMatchingProgressions(it, chords, TMatchDirection_Backward)) {
        rows.push_back(NumberOf(row, table));
    }
    return rows;
}

json PatternMatches(const json& in) {
    static const std::map<std::string, CSemitonesMatch> patterns = {
        {"Major", ChordPattern::Major},           {"Minor", ChordPattern::Minor},
        {"Diminished", ChordPattern::Diminished}, {"HalfDiminished", ChordPattern::HalfDiminished},
        {"Dominant7", ChordPattern::Dominant7},
    };
    const CSemitonesMatch& pattern = patterns.at(in.at(0).get<std::string>());
    if (in.at(1).is_number()) return pattern.Matches(SemitonesOf(in.at(1)));
    int count = 0;
    for (std::uint64_t mask = 0; mask < 4096; ++mask) count += pattern.Matches(CSemitones(mask));
    return count;
}

}  // namespace

TEST_CASE("A progression matches where its chords stand in its key") {
    CheckExpected("progressions",
                  {{"CHarmAnlsProgressions::FindAndSortForwardMatchingProgressions", Forward},
                   {"CHarmAnlsProgressions::FindAndSortBackwardMatchingProgressions", Backward},
                   {"CHarmAnlsProgressions::AppendJSONString",
                    [](const json& in) { return JSONStringOf(TableOf(in.at(0))); }},
                   {"CSemitonesMatch::Matches", PatternMatches}});
}

TEST_CASE("C F is the first step out of C as much as the way to F") {
    const CHarmAnlsChords chords("C F", TChordStringParse{});
    const auto matches =
        CHarmAnlsProgressions::TonicProgressions().FindAndSortForwardMatchingProgressions(
            chords.begin(), chords);
    REQUIRE(matches.HasSeveralBestMatchingProgressions());
    REQUIRE(matches.GetBestMatchingProgressions().size() == 2);
    const auto tonic = [&](const CHarmAnlsProgression& row) {
        return row.HarmCenterCalculatedFromFoundProgressionLastChord(chords.begin(), chords)
            .mRootKeyEnh.mKeyNr;
    };
    CHECK(tonic(matches[0]) == 5);
    CHECK(tonic(matches[1]) == 0);
}

TEST_CASE("Rows that are equal in length and priority keep the order of the table") {
    CHarmAnlsProgressions sorted = CHarmAnlsProgressions::TonicProgressions();
    sorted.SortBySizeAndPriority();
    std::vector<std::ptrdiff_t> numbers;
    for (const auto& row : sorted) {
        numbers.push_back(NumberOf(row, CHarmAnlsProgressions::TonicProgressions()));
    }
    CHECK(numbers ==
          std::vector<std::ptrdiff_t>{8, 12, 10, 6, 13, 14, 7, 9, 11, 1, 2, 3, 4, 5, 15});
}

TEST_CASE("A list of only undefined chords has room for no progression") {
    CHarmAnlsChords chords(3);
    CHarmAnlsProgression anything({{0, 0, CSemitonesMatch()}}, 1, TSignKeyType_Major);
    CHECK_FALSE(anything.MatchesHarmChordsFrom(chords, chords.begin()));
    CHECK_FALSE(anything.MatchesHarmChordsFrom(chords, chords.end()));
    CHECK_FALSE(anything.MatchesHarmChordsBackwardsFrom(chords, chords.end()));
    CHECK(
        anything.HarmCenterCalculatedFromFoundProgressionLastChord(chords.end(), chords).IsUndef());
}

TEST_CASE("A backward match begins before its chord, but not before the list") {
    const CHarmAnlsChords chords("G C", TChordStringParse{});
    const CHarmAnlsProgression& row = CHarmAnlsProgressions::TonicProgressions()[7];  // four chords
    const auto begin = [&](std::ptrdiff_t n, TMatchDirection direction) {
        return row.HarmCenterChordsBegin(chords.begin() + n, chords, direction) - chords.begin();
    };
    CHECK(begin(1, TMatchDirection_Backward) == 0);
    CHECK(begin(1, TMatchDirection_Forward) == 1);
    CHECK(begin(1, static_cast<TMatchDirection>(7)) == 3);
}

TEST_CASE("A pattern made of its twelve entries fits the chords of the pattern it copies") {
    for (const CSemitonesMatch& pattern :
         {ChordPattern::Major, ChordPattern::HalfDiminished, ChordPattern::Dominant7}) {
        std::array<TSemiMatch, 12> entries{};
        for (unsigned n = 0; n < 12; ++n) entries[n] = pattern.Semitone(n);
        const CSemitonesMatch built(entries);
        const CSemitonesMatch builtWithArgument(entries, 1);
        CHECK(built == pattern);
        CHECK(builtWithArgument == pattern);
        int different = 0;
        for (std::uint64_t mask = 0; mask < 4096; ++mask) {
            const bool isMatch = pattern.Matches(CSemitones(mask));
            different += built.Matches(CSemitones(mask)) != isMatch;
            different += builtWithArgument.Matches(CSemitones(mask)) != isMatch;
        }
        CHECK(different == 0);
    }
}

TEST_CASE("Semitone patterns are set entry by entry") {
    CSemitonesMatch pattern({0, 4, 19, 12}, {7, 13});
    CHECK(JSONStringOf(pattern) == "[1,0,0,0,1,0,0,x,0,0,0,0]");
    CHECK(pattern.Semitone(12) == TSemiMatch_Present);
    CHECK(pattern.Semitone(13) == TSemiMatch_Any);
    CHECK(pattern.Matches(CSemitones(145)));
    CHECK_FALSE(pattern.Matches(CSemitones(145 | 1 << 10)));

    pattern.SetSemitone(12, TSemiMatch_Absent);
    pattern.SetSemitone(13, TSemiMatch_Present);
    pattern.SetSemitone(1, static_cast<TSemiMatch>(9));
    CHECK(JSONStringOf(pattern) == "[0,unknown TSemiMatch: 9,0,0,1,0,0,x,0,0,0,0]");

    pattern.SetFromIntvlSet(CIntvlSet(0, 3, 14));
    CHECK(JSONStringOf(pattern) == "[1,x,1,1,x,x,x,x,x,x,x,x]");

    pattern.clear();
    CHECK_FALSE(pattern.Matches(CSemitones(145)));
    CHECK(pattern.Semitone(0) == TSemiMatch_Any);
    pattern.Reset();
    CHECK(pattern == CSemitonesMatch());
}

TEST_CASE("The best rows of a table are those that are as good as the first, sorted or not") {
    CHarmAnlsProgressions unsorted = CHarmAnlsProgressions::TonicProgressions();
    CHarmAnlsProgressions sorted = unsorted;
    sorted.SortBySizeAndPriority();
    const auto best = unsorted.SortAndGetBestMatchingProgressions();
    CHECK(best.size() == sorted.GetBestMatchingProgressions().size());
    CHECK(best.front().size() == sorted.front().size());
    CHECK(unsorted.front().size() == sorted.front().size());
}
