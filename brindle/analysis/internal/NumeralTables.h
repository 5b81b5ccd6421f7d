// SPDX-License-Identifier: MIT
#pragma once

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
    // text   on a large numeral         on a small numeral
    {"",      {0, 4, 7},                 {0, 3, 7}},
    {"6",     {0, 4, 7, 9},              {0, 3, 7, 9}},
    {"add6",  {0, 4, 7, 9},              {0, 3, 7, 9}},
    {"69",    {0, 2, 4, 7, 9},           {0, 2, 3, 7, 9}},
    {"add9",  {0, 2, 4, 7},              {0, 2, 3, 7}},
    {"^7",    {0, 4, 7, 11},             {0, 3, 7, 11}},
    {"^",     {0, 4, 7, 11},             {0, 3, 7, 11}},
    {"^9",    {0, 2, 4, 7, 11},          {0, 2, 3, 7, 11}},
    {"7",     {0, 4, 7, 10},             {0, 3, 7, 10}},
    {"9",     {0, 2, 4, 7, 10},          {0, 2, 3, 7, 10}},
    {"11",    {0, 2, 4, 5, 7, 10},       {0, 2, 3, 5, 7, 10}},
    {"13",    {0, 2, 4, 5, 7, 9, 10},    {0, 2, 3, 5, 7, 9, 10}},
    {"7b9",   {0, 1, 4, 7, 10},          {0, 1, 3, 7, 10}},
    {"7#9",   {0, 3, 4, 7, 10},          {}},
    {"7b5",   {0, 4, 6, 10},             {0, 3, 6, 10}},
    {"h7",    {0, 3, 6, 10},             {0, 3, 6, 10}},
    {"h",     {0, 3, 6, 10},             {0, 3, 6, 10}},
    {"o",     {0, 3, 6},                 {0, 3, 6}},
    {"o7",    {0, 3, 6, 9},              {0, 3, 6, 9}},
    {"+",     {0, 4, 8},                 {}},
    {"+7",    {0, 4, 8, 10},             {}},
    {"sus",   {0, 5, 7},                 {}},
    {"sus4",  {0, 5, 7},                 {}},
    {"sus2",  {0, 2, 7},                 {}},
    {"7sus",  {0, 5, 7, 10},             {}},
    {"7sus4", {0, 5, 7, 10},             {}},
    {"9sus",  {0, 2, 5, 7, 10},          {}},
    {"5",     {0, 7},                    {}},
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
