// SPDX-License-Identifier: MIT
#include "brindle/theory/SetFromStringHelper.h"

#include <doctest/doctest.h>

#include <array>

using namespace brindle;
using namespace brindle::SetFromStringHelper;

namespace {

const std::vector<std::string> kMinor{"minor", "mi n", "m"};

}  // namespace

TEST_CASE("A keyword matches as a prefix or as all that remains, blanks apart") {
    struct CRow {
        TSpaces mSpaces;
        const char* mText;
        int mPos;
        bool mMatches;
        int mLength;
    };
    const CRow rows[] = {
        {TSpaces_AnyRemainder, "a minor third", 2, true, 5},
        {TSpaces_AnyRemainder, "a minor third", 1, false, 0},
        {TSpaces_AnyRemainder, "amx", 1, true, 1},
        {TSpaces_AnyRemainder, "am", 2, false, 0},
        {TSpaces_AnyRemainder, "am", 3, false, 0},
        {TSpaces_AnyRemainder, "m", -1, false, 0},
        {TSpaces_WholeRemainder, "am", 1, true, 1},
        {TSpaces_WholeRemainder, "am  ", 1, true, 1},
        {TSpaces_WholeRemainder, "amx", 1, false, 0},
        {TSpaces_WholeRemainder, "m", -1, false, 0},
        // The length disregards blanks, the letters do not.
        {TSpaces_WholeRemainder, "mi n", 0, true, 4},
        {TSpaces_WholeRemainder, "min", 0, false, 0},
        {TSpaces_WholeRemainder, "mi  n", 0, false, 0},
    };
    for (const CRow& row : rows) {
        CAPTURE(row.mText);
        CAPTURE(row.mPos);
        CHECK(CompareLowercaseStrs(row.mSpaces, kMinor, row.mText, row.mPos) ==
              std::pair(row.mMatches, row.mLength));
    }
}

TEST_CASE("The first record of a vocabulary that matches is found") {
    CKeywordsAndNames vocabulary{{{"major", "maj"}, "major", 1}, {{"ma", "m"}, "minor", 2}};
    const auto nameOf = [&vocabulary](TSpaces spaces, const char* text) {
        const auto record = vocabulary.FindFirstMatching(spaces, text);
        return record == vocabulary.end() ? std::string("none") : record->mName;
    };
    CHECK(nameOf(TSpaces_AnyRemainder, "MAJOR") == "major");
    CHECK(nameOf(TSpaces_AnyRemainder, "Madness") == "minor");
    CHECK(nameOf(TSpaces_WholeRemainder, "Madness") == "none");
    CHECK(nameOf(TSpaces_WholeRemainder, "M a") == "none");
    CHECK(nameOf(TSpaces_AnyRemainder, "") == "none");
}

TEST_CASE("A keyword list has a longer keyword before the shorter one it begins with") {
    using TList = std::vector<std::string>;
    CHECK(AreNotEmptyAndSortedBySizeAndLowerCase(TList{"sus4", "sus", "s4"}));
    CHECK_FALSE(AreNotEmptyAndSortedBySizeAndLowerCase(TList{"sus", "sus4"}));
    CHECK_FALSE(AreNotEmptyAndSortedBySizeAndLowerCase(TList{"sus", ""}));
    CHECK_FALSE(AreNotEmptyAndSortedBySizeAndLowerCase(TList{"Sus"}));
}

TEST_CASE("A word is found at the begin of a text in letters of any size") {
    constexpr std::array<const char*, 2> keywords{"minor", "min"};
    _AssertStringsAreNotEmptyAndSortedBySizeAndLowerCase(keywords);
    CHECK(CompareStrs(TSpaces_AnyRemainder, keywords, "MINOR scale"));
    CHECK_FALSE(CompareStrs(TSpaces_WholeRemainder, keywords, "minor scale"));
    CHECK(CompareStrs(TSpaces_WholeRemainder, keywords, "Min"));
    CHECK_FALSE(CompareStrs(TSpaces_AnyRemainder, keywords, "a minor"));
}
