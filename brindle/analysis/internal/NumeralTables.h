// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/internal/ChordKinds.h"
#include "brindle/theory/CSemitones.h"
#include "brindle/theory/TSignKeyType.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>

namespace brindle {

/// A degree of a key: its number from 1, and the accidental before it.
struct CNumeralDegree {
    int mNumber;
    int mAccidental;  ///< 1 for #, -1 for b
};

// The degree by semitones above the tonic, 0 to 11.
// clang-format off
inline constexpr auto kDegreesInMajor = std::to_array<CNumeralDegree>({
    {1, 0}, {2, -1}, {2, 0}, {3, -1}, {3, 0}, {4, 0}, {4, 1}, {5, 0}, {6, -1}, {6, 0}, {7, -1}, {7, 0},
//  I       bII      II      bIII     III     IV      #IV     V       bVI      VI      bVII     VII
});
inline constexpr auto kDegreesInMinor = std::to_array<CNumeralDegree>({
    {1, 0}, {2, -1}, {2, 0}, {3, 0}, {3, 1}, {4, 0}, {4, 1}, {5, 0}, {6, 0}, {6, 1}, {7, 0}, {7, 1},
//  I       bII      II      III     #III    IV      #IV     V       VI      #VI     VII     #VII
});
// clang-format on

[[nodiscard]] constexpr const auto& DegreesOf(TSignKeyType type) {
    return type == TSignKeyType_Minor ? kDegreesInMinor : kDegreesInMajor;
}

inline constexpr auto kRomanNumbers =
    std::to_array<std::string_view>({"I", "II", "III", "IV", "V", "VI", "VII"});

/// A sign behind a degree and what it makes of a major and of a minor chord on it.
struct CNumeralSign {
    std::string_view mText;
    CSemitones mMajor;
    CSemitones mMinor;
};

// The whole text behind the number, or the beginning before alterations; h stands for ø, o for °,
// ^ for maj. The first sign of a chord is the one that is written.
// clang-format off
inline constexpr auto kNumeralSigns = std::to_array<CNumeralSign>({
    // text   on a large numeral           on a small numeral
    {"",      TonesOfChordKind(""),        TonesOfChordKind("m")},
    {"6",     TonesOfChordKind("6"),       TonesOfChordKind("m6")},
    {"add6",  TonesOfChordKind("6"),       TonesOfChordKind("m6")},
    {"69",    TonesOfChordKind("69"),      TonesOfChordKind("m69")},
    {"add9",  TonesOfChordKind("add9"),    TonesOfChordKind("madd9")},
    {"^7",    TonesOfChordKind("maj7"),    TonesOfChordKind("mmaj7")},
    {"^",     TonesOfChordKind("maj7"),    TonesOfChordKind("mmaj7")},
    {"^9",    TonesOfChordKind("maj9"),    TonesOfChordKind("mmaj9")},
    {"7",     TonesOfChordKind("7"),       TonesOfChordKind("m7")},
    {"9",     TonesOfChordKind("9"),       TonesOfChordKind("m9")},
    {"11",    TonesOfChordKind("11"),      TonesOfChordKind("m11")},
    {"13",    TonesOfChordKind("13"),      TonesOfChordKind("m13")},
    {"7b9",   TonesOfChordKind("7b9"),     TonesOfChordKind("m7b9")},
    {"7#9",   TonesOfChordKind("7#9"),     {}},
    {"7b5",   TonesOfChordKind("7b5"),     TonesOfChordKind("m7b5")},
    {"h7",    TonesOfChordKind("m7b5"),    TonesOfChordKind("m7b5")},
    {"h",     TonesOfChordKind("m7b5"),    TonesOfChordKind("m7b5")},
    {"o",     TonesOfChordKind("dim"),     TonesOfChordKind("dim")},
    {"o7",    TonesOfChordKind("dim7"),    TonesOfChordKind("dim7")},
    {"+",     TonesOfChordKind("aug"),     {}},
    {"+7",    TonesOfChordKind("7#5"),     {}},
    {"sus",   TonesOfChordKind("sus4"),    {}},
    {"sus4",  TonesOfChordKind("sus4"),    {}},
    {"sus2",  TonesOfChordKind("sus2"),    {}},
    {"7sus",  TonesOfChordKind("7sus4"),   {}},
    {"7sus4", TonesOfChordKind("7sus4"),   {}},
    {"9sus",  TonesOfChordKind("9sus4"),   {}},
    {"5",     TonesOfChordKind("5"),       {}},
});
// clang-format on

/// What a figure says of the chord on a degree.
enum TFigureKind : std::uint8_t {
    TFigure_Triad,
    TFigure_Seventh,
    TFigure_Ninth,
    TFigure_Eleventh,
    TFigure_Thirteenth,
    TFigure_Fourth,         ///< a fourth instead of the third
    TFigure_SeventhFourth,  ///< the same under a seventh
    TFigure_Second,         ///< a second instead of the third
    TFigure_Sixth,          ///< a sixth instead of the fifth
    TFigure_SixthFourth,    ///< a sixth and a fourth above the root
    TFigure_AddedNinth,     ///< a ninth without a seventh
};

/// A figure as in a figured bass, its slashes left out.
struct CNumeralFigure {
    std::string_view mText;
    TFigureKind mKind;
    int mBassStep;  ///< the tone in the bass: 1, 3, 5 or 7
    int mWithout;   ///< a tone that the figure leaves out, or 0
};

// The first of each kind and bass is the one that is written.
// clang-format off
inline constexpr auto kNumeralFigures = std::to_array<CNumeralFigure>({
    {"",     TFigure_Triad,         1, 0},
    {"3",    TFigure_Triad,         1, 0},
    {"53",   TFigure_Triad,         1, 0},
    {"8",    TFigure_Triad,         1, 0},
    {"83",   TFigure_Triad,         1, 0},
    {"853",  TFigure_Triad,         1, 0},
    {"6",    TFigure_Triad,         3, 0},
    {"63",   TFigure_Triad,         3, 0},
    {"64",   TFigure_Triad,         5, 0},
    {"7",    TFigure_Seventh,       1, 0},
    {"753",  TFigure_Seventh,       1, 0},
    {"87",   TFigure_Seventh,       1, 0},
    {"73",   TFigure_Seventh,       1, 5},
    {"75",   TFigure_Seventh,       1, 3},
    {"65",   TFigure_Seventh,       3, 0},
    {"653",  TFigure_Seventh,       3, 0},
    {"43",   TFigure_Seventh,       5, 0},
    {"643",  TFigure_Seventh,       5, 0},
    {"42",   TFigure_Seventh,       7, 0},
    {"2",    TFigure_Seventh,       7, 0},
    {"642",  TFigure_Seventh,       7, 0},
    {"9",    TFigure_Ninth,         1, 0},
    {"97",   TFigure_Ninth,         1, 0},
    {"973",  TFigure_Ninth,         1, 5},
    {"975",  TFigure_Ninth,         1, 3},
    {"9753", TFigure_Ninth,         1, 0},
    {"11",   TFigure_Eleventh,      1, 0},
    {"13",   TFigure_Thirteenth,    1, 0},
    {"4",    TFigure_Fourth,        1, 0},
    {"54",   TFigure_Fourth,        1, 0},
    {"74",   TFigure_SeventhFourth, 1, 0},
    {"754",  TFigure_SeventhFourth, 1, 0},
    {"52",   TFigure_Second,        1, 0},
    // A suspension with its resolution: the suspension is the chord.
    {"4-3",   TFigure_Fourth,       1, 0},
    {"54-3",  TFigure_Fourth,       1, 0},
    {"74-3",  TFigure_SeventhFourth, 1, 0},
    {"754-3", TFigure_SeventhFourth, 1, 0},
    {"6-5",   TFigure_Sixth,        1, 0},
    {"64-53", TFigure_SixthFourth,  1, 0},
    {"9-8",   TFigure_AddedNinth,   1, 0},
    {"8-7",   TFigure_Triad,        1, 0},
});

// Figures that people write with slashes, 6/5. Others behind a slash are the degree of a bass.
inline constexpr auto kSlashedFigures = std::to_array<std::string_view>({
    "65", "64", "63", "43", "42", "53", "54", "653", "643", "642", "753", "754",
});
// clang-format on

}  // namespace brindle
