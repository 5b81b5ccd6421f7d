// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/internal/NumeralTables.h"
#include "brindle/theory/CSemitones.h"

#include <array>
#include <string_view>

namespace brindle {

/// An augmented sixth chord. The French one is counted from its second degree, the others from the
/// flat sixth, which is the bass of all of them.
struct CAugmentedSixth {
    std::string_view mWord;
    CNumeralDegree mRoot;
    CSemitones mSemitones;
    int mStepRoot;  ///< from which tones in brackets are counted, in semitones above the root
};

// clang-format off
inline constexpr auto kAugmentedSixths = std::to_array<CAugmentedSixth>({
    {"It",  {6, -1}, {0, 4, 10},   10},  // Ab C F#
    {"Ger", {6, -1}, {0, 4, 7, 10}, 10},  // Ab C Eb F#
    {"Gr",  {6, -1}, {0, 4, 7, 10}, 10},
    {"Gn",  {6, -1}, {0, 4, 7, 10}, 10},
    {"Sw",  {6, -1}, {0, 4, 7, 10}, 10},  // Ab C D# F#
    {"Fr",  {2, 0},  {0, 4, 6, 10}, 0},   // D F# Ab C
});
// clang-format on

/// The chord whose name a numeral begins with, as in Ger65 and It6/V; none for other numerals.
[[nodiscard]] constexpr const CAugmentedSixth* AugmentedSixthOf(std::string_view numeral) {
    for (const CAugmentedSixth& chord : kAugmentedSixths) {
        if (numeral.starts_with(chord.mWord)) return &chord;
    }
    return nullptr;
}

/// A figure of such a chord: the tone that it puts into the bass, in semitones above the root.
struct CAugmentedSixthFigure {
    std::string_view mText;
    int mBassInMost;
    int mBassInFrench;
};

// A chord without a figure, and one with a bare 6, has the flat sixth in the bass. The others count
// from the raised fourth in most chords, from the second degree in the French one.
// clang-format off
inline constexpr auto kAugmentedSixthFigures = std::to_array<CAugmentedSixthFigure>({
    {"",      0,  6},
    {"6",     0,  6},
    {"63",    0,  6},
    {"65",    0,  4},
    {"6/5",   0,  4},
    {"653",   0,  4},
    {"643",   0,  6},
    {"43",    4,  6},
    {"4/3",   4,  6},
    {"64",    4,  6},
    {"6/4",   4,  6},
    {"42",    7, 10},
    {"4/2",   7, 10},
    {"2",     7, 10},
    {"7",    10,  0},
    {"5",    10,  0},
    {"53",   10,  0},
});
// clang-format on

}  // namespace brindle
