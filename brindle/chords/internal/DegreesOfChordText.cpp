// SPDX-License-Identifier: MIT
#include "brindle/chords/internal/DegreesOfChordText.h"

#include <algorithm>
#include <array>
#include <string_view>

namespace brindle::ChordText {
namespace {

struct CNumberRow {
    std::string_view mText;
    int mNumber;
    /// What may stand behind the digits.
    std::string_view mEnding = {};
};

// Longer ones first.
constexpr auto kNumberRows = std::to_array<CNumberRow>({
    {"13", 13, "th"}, {"11", 11, "th"}, {"10", 10, "th"}, {"2", 2, "nd"},   {"3", 3, "rd"},
    {"4", 4, "th"},   {"5", 5, "th"},   {"6", 6, "th"},   {"7", 7, "th"},   {"9", 9, "th"},
    {"second", 2},    {"third", 3},     {"fourth", 4},    {"fifth", 5},     {"sixth", 6},
    {"seventh", 7},   {"ninth", 9},     {"tenth", 10},    {"eleventh", 11}, {"thirteenth", 13},
});

struct CSignRow {
    std::string_view mText;
    int mSign;
};

constexpr auto kSignRows = std::to_array<CSignRow>({
    {"#", +1},
    {"+", +1},
    {"-", -1},
    {"dim", -1},
    {"aug", +1},
    {"flat", -1},
    {"sharp", +1},
});

struct CMajorRow {
    std::string_view mText;
    TMajorMark mMark;
};

// Longer ones first. `M` and `ma` are told apart from minor and from other words by hand.
constexpr auto kMajorRows = std::to_array<CMajorRow>({
    {"major", TMajorMark::Major},
    {"maj", TMajorMark::Major},
    {"ma", TMajorMark::Major},
    {"-dur", TMajorMark::Major},
    {"dur", TMajorMark::Major},
    {"^", TMajorMark::Seventh},
    {"j", TMajorMark::Seventh},
});

// `madd`, `maug` and `malt` are a minor chord with `add`, `aug` and `alt`.
constexpr auto kNotBehindMa = std::to_array<std::string_view>({"dd", "ug", "lt"});

bool FitsMajor(const CMajorRow& row, CTextScan scan) {
    if (!scan.TakeWord(row.mText)) return false;
    if (row.mText != "ma") return true;
    return std::none_of(kNotBehindMa.begin(), kNotBehindMa.end(),
                        [&](std::string_view word) { return scan.SeesWord(word); });
}

}  // namespace

int TakeNumber(CTextScan& scan) {
    for (const CNumberRow& row : kNumberRows) {
        if (!scan.TakeWord(row.mText)) continue;
        if (!row.mEnding.empty()) scan.TakeWord(row.mEnding);
        return row.mNumber;
    }
    return 0;
}

int TakeSign(CTextScan& scan) {
    if (scan.Take('b')) return -1;
    for (const CSignRow& row : kSignRows) {
        if (!scan.TakeWord(row.mText)) continue;
        // Words stand apart: `flat 9`.
        if (IsLetter(row.mText.front())) scan.SkipBlanks();
        return row.mSign;
    }
    return 0;
}

std::optional<TMajorMark> TakeMajorMark(CTextScan& scan) {
    for (const CMajorRow& row : kMajorRows) {
        if (!FitsMajor(row, scan)) continue;
        scan.mPos += row.mText.size();
        scan.Take('.');
        return row.mMark;
    }
    if (scan.Sees("M") && !scan.SeesWord("mi")) {
        ++scan.mPos;
        scan.Take('.');
        return TMajorMark::Major;
    }
    return std::nullopt;
}

}  // namespace brindle::ChordText
