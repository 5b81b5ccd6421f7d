// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/Tunings.h"

#include "brindle/platform/Ascii.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <string>
#include <vector>

namespace brindle {
namespace {

// clang-format off
constexpr auto kNamedTunings = std::to_array<CNamedTuning>({
    // name               title                 alias            open strings
    {"standard",          "Standard",           "guitar",        kGChStandardGuitar},
    {"drop-d",            "Drop D",             "",              {50, 57, 62, 67, 71, 76}},
    {"double-drop-d",     "Double drop D",      "",              {50, 57, 62, 67, 71, 74}},
    {"dadgad",            "DADGAD",             "d-modal",       {50, 57, 62, 67, 69, 74}},
    {"open-d",            "Open D",             "",              {50, 57, 62, 66, 69, 74}},
    {"open-e",            "Open E",             "",              {52, 59, 64, 68, 71, 76}},
    {"open-g",            "Open G",             "",              {50, 55, 62, 67, 71, 74}},
    {"open-a",            "Open A",             "",              {52, 57, 64, 69, 73, 76}},
    {"open-c",            "Open C",             "",              {48, 55, 60, 67, 72, 76}},
    {"half-step-down",    "Half step down",     "eb-standard",   {51, 56, 61, 66, 70, 75}},
    {"whole-step-down",   "Whole step down",    "d-standard",    {50, 55, 60, 65, 69, 74}},
    {"7-string",          "7-string guitar",    "seven-string",  {47, 52, 57, 62, 67, 71, 76}},
    {"8-string",          "8-string guitar",    "eight-string",  {42, 47, 52, 57, 62, 67, 71, 76}},
    {"bass",              "Bass",               "bass-guitar",   {40, 45, 50, 55}},
    {"5-string-bass",     "5-string bass",      "",              {35, 40, 45, 50, 55}},
    {"ukulele",           "Ukulele",            "gcea",          {67, 60, 64, 69}},
    {"ukulele-low-g",     "Ukulele, low G",     "low-g",         {55, 60, 64, 69}},
    {"ukulele-high-g",    "Ukulele, high G",    "high-g",        {67, 60, 64, 69}},
    {"baritone-ukulele",  "Baritone ukulele",   "baritone",      {50, 55, 59, 64}},
    {"mandolin",          "Mandolin",           "",              {55, 62, 69, 76}},
    {"tenor-banjo",       "Tenor banjo",        "",              {48, 55, 62, 69}},
    {"banjo",             "Banjo, open G",      "gdgbd",         {67, 50, 55, 59, 62}},
    {"cavaquinho",        "Cavaquinho",         "dgbd",          {62, 67, 71, 74}},
});
// clang-format on
static_assert(std::all_of(kNamedTunings.begin(), kNamedTunings.end(),
                          [](const CNamedTuning& row) { return row.mTuning[2] > 0; }));

/// Letters and digits alone, in lower case.
std::string FoldedTuningName(std::string_view name) {
    std::string folded;
    for (const char c : name) {
        if (Ascii::IsLetter(c) || Ascii::IsDigit(c)) folded += Ascii::ToLower(c);
    }
    return folded;
}

}  // namespace

std::span<const CNamedTuning> NamedTunings() {
    return kNamedTunings;
}

std::optional<GChShortTuning> TuningOfName(std::string_view name) {
    const std::string wanted = FoldedTuningName(name);
    if (wanted.empty()) return std::nullopt;
    for (const CNamedTuning& row : kNamedTunings) {
        for (const std::string_view text : {row.mName, row.mTitle, row.mAlias}) {
            if (FoldedTuningName(text) == wanted) return row.mTuning;
        }
    }
    return std::nullopt;
}

bool IsReentrant(const GChShortTuning& tuning) {
    const std::vector<int> pitches = GChPitchArrayFromShortTuning(tuning);
    return !std::is_sorted(pitches.begin(), pitches.end());
}

bool BearsBass(const GChShortTuning& tuning) {
    constexpr int kFewStrings = 4;
    constexpr int kC2 = 48;
    constexpr int kFourth = 5;
    if (IsReentrant(tuning)) return false;
    const int strings = GChNumberOfStringsInShortTuning(tuning);
    if (strings > kFewStrings || tuning[0] < kC2) return true;
    const auto* const end = tuning.begin() + strings;
    return std::adjacent_find(tuning.begin(), end,
                              [](int low, int high) { return high - low != kFourth; }) == end;
}

bool HasShortString(const GChShortTuning& tuning) {
    constexpr int kStringsOfBanjo = 5;
    const auto* const first = tuning.begin();
    return GChNumberOfStringsInShortTuning(tuning) == kStringsOfBanjo &&
           std::all_of(first + 1, first + kStringsOfBanjo,
                       [&](std::uint8_t pitch) { return pitch < *first; });
}

std::string_view TitleOfTuning(const GChShortTuning& tuning) {
    const auto* const row =
        std::find_if(kNamedTunings.begin(), kNamedTunings.end(),
                     [&](const CNamedTuning& named) { return named.mTuning == tuning; });
    return row == kNamedTunings.end() ? std::string_view() : row->mTitle;
}

}  // namespace brindle
