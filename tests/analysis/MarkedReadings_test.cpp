// SPDX-License-Identifier: MIT
// Progressions with the analysis that a teacher would write, and how far the reading agrees.

#include "ReadingForms.h"

#include <doctest/doctest.h>
#include <fmt/format.h>

#include <algorithm>
#include <fstream>
#include <sstream>
#include <vector>

namespace brindle::test {
namespace {

/// A chord as the teacher reads it: "V7/ii|V7/II~dominant>5", behind "C:" or "c:" where the key
/// changes. What is left out does not matter.
struct CMark {
    std::string mKey;
    std::vector<std::string> mNumerals;
    std::string mRelation;
    std::string mResolvesTo;
    bool mIsDeceptive = false;
};

// Cuts what stands behind the last `sign` off.
std::string CutBehind(std::string& word, char sign) {
    const std::size_t at = word.rfind(sign);
    if (at == std::string::npos) return {};
    std::string behind = word.substr(at + 1);
    word.resize(at);
    return behind;
}

std::vector<CMark> MarksOf(const std::string& text) {
    std::vector<CMark> marks;
    std::istringstream words(text);
    std::string key;
    for (std::string word; words >> word;) {
        if (word.back() == ':') {
            key = word.substr(0, word.size() - 1);
            continue;
        }
        CMark mark;
        mark.mKey = key;
        mark.mResolvesTo = CutBehind(word, '>');
        mark.mIsDeceptive = word.back() == '!';
        if (mark.mIsDeceptive) word.pop_back();
        mark.mRelation = CutBehind(word, '~');
        std::istringstream numerals(word);
        for (std::string numeral; std::getline(numerals, numeral, '|');) {
            mark.mNumerals.push_back(numeral);
        }
        marks.push_back(mark);
    }
    return marks;
}

/// What the reading says of one chord, its resolution counted in chords that differ.
struct CRead {
    const CChordReading& mChord;
    std::string mResolvesTo;
};

std::vector<CRead> DifferentChords(const CHarmAnlsChords& chords, const CSongReading& reading) {
    std::vector<std::size_t> numbers(chords.size());
    std::vector<std::size_t> places;
    for (std::size_t i = 0; i + 1 < chords.size(); ++i) {
        const bool isSame = i > 0 && static_cast<const CChordLite&>(chords[i]) == chords[i - 1];
        numbers[i] = places.size();
        if (!isSame) places.push_back(i);
    }
    std::vector<CRead> read;
    for (const std::size_t place : places) {
        const CChordReading& chord = reading.mChords[place];
        std::string to;
        if (chord.mResolvesTo >= 0) {
            to = std::to_string(numbers[static_cast<std::size_t>(chord.mResolvesTo)]);
        }
        read.push_back({chord, to});
    }
    return read;
}

/// Counts marks that agree, and tells the others.
struct CScore {
    int mAgreed = 0;
    int mMarks = 0;
    std::string mMisses;

    void Add(bool isAgreed, std::size_t ix, std::string_view found) {
        ++mMarks;
        mAgreed += isAgreed ? 1 : 0;
        if (!isAgreed) mMisses += fmt::format("{}{}:{}", mMisses.empty() ? "" : " ", ix, found);
    }
};

void Compare(const CMark& mark, const CRead& read, std::size_t ix, CScore& score) {
    const CChordReading& chord = read.mChord;
    score.Add(ShortKey(chord.mKey) == mark.mKey, ix, ShortKey(chord.mKey));
    const auto& numerals = mark.mNumerals;
    score.Add(std::find(numerals.begin(), numerals.end(), chord.mNumeral) != numerals.end(), ix,
              chord.mNumeral);
    const std::string_view relation = NameOf(chord.mRelation);
    if (!mark.mRelation.empty()) score.Add(relation.starts_with(mark.mRelation), ix, relation);
    if (!mark.mResolvesTo.empty()) {
        score.Add(read.mResolvesTo == mark.mResolvesTo, ix, ">" + read.mResolvesTo);
    }
    if (mark.mIsDeceptive) score.Add(chord.mDeceptive, ix, "not deceptive");
}

struct CShare {
    std::string_view mName;
    int mAgreed;
    int mMarks;
    /// What is read instead, behind the number of the chord.
    std::string_view mMisses;
};

// clang-format off
constexpr auto kShares = std::to_array<CShare>({
    {"basic blues",            29, 29, ""},
    {"jazz blues",             53, 53, ""},
    {"minor blues",            28, 28, ""},
    {"Bird blues",             65, 65, ""},
    {"rhythm changes A",       52, 52, ""},
    {"Autumn Leaves",          20, 22, "3:g 3:VI^7"},
    {"All The Things, 1-8",    18, 18, ""},
    {"Ipanema A",              17, 17, ""},
    {"Stella, 1-9",            29, 29, ""},
    {"Misty",                  32, 32, ""},
    {"Creep",                  24, 24, ""},
    {"line cliche",            19, 19, ""},
    {"German sixth",           13, 13, ""},
    {"German sixth, six-four", 15, 15, ""},
    {"chorale",                28, 28, ""},
    {"dorian vamp",            19, 19, ""},
    {"Giant Steps",            67, 67, ""},
    {"Coltrane changes",       17, 17, ""},
    {"substitutes",            16, 16, ""},
    {"substitute turnaround",  15, 15, ""},
    {"passing diminished",     14, 14, ""},
    {"descending diminished",  16, 16, ""},
    {"turnaround",             25, 25, ""},
    {"dominant chain",         16, 16, ""},
    {"deceptive",              18, 18, ""},
    {"Satin Doll",             36, 36, ""},
});
// clang-format on

TEST_CASE("Well-known progressions are read as a teacher marks them") {
    std::ifstream file(BRINDLE_TEST_DATA "/reading/songs.tsv");
    std::string line;
    std::getline(file, line);
    std::size_t row = 0;
    int agreed = 0;
    int marks = 0;
    for (; std::getline(file, line); ++row) {
        std::istringstream columns(line);
        std::string name;
        std::string text;
        std::string marked;
        std::getline(columns, name, '\t');
        std::getline(columns, text, '\t');
        std::getline(columns, marked);
        INFO(name);
        const CHarmAnlsChords chords = BarsOf(text);
        const CSongReading reading = ReadHarmony(chords);
        const std::vector<CMark> wanted = MarksOf(marked);
        const std::vector<CRead> read = DifferentChords(chords, reading);
        REQUIRE(read.size() == wanted.size());
        CScore score;
        for (std::size_t i = 0; i < read.size(); ++i) Compare(wanted[i], read[i], i, score);
        REQUIRE(row < kShares.size());
        CHECK(name == kShares[row].mName);
        CHECK(score.mAgreed == kShares[row].mAgreed);
        CHECK(score.mMarks == kShares[row].mMarks);
        CHECK(score.mMisses == kShares[row].mMisses);
        agreed += score.mAgreed;
        marks += score.mMarks;
    }
    CHECK(row == kShares.size());
    // docs/reading.md quotes this.
    CHECK(fmt::format("{} of {}", agreed, marks) == "701 of 703");
}

}  // namespace
}  // namespace brindle::test
