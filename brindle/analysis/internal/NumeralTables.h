// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CSemitones.h"
#include "brindle/theory/TSignKeyType.h"

#include <array>
#include <cstddef>
#include <string_view>

namespace brindle {

/// A degree of a key: its number from 1, and the accidental before it.
struct TNumeralDegree {
    int mNumber;
    int mAccidental;  ///< 1 for #, -1 for b
};

// The degree by semitones above the tonic, 0 to 11.
// clang-format off
inline constexpr auto kDegreesInMajor = std::to_array<TNumeralDegree>({
    {1, 0}, {2, -1}, {2, 0}, {3, -1}, {3, 0}, {4, 0}, {4, 1}, {5, 0}, {6, -1}, {6, 0}, {7, -1}, {7, 0},
//  I       bII      II      bIII     III     IV      #IV     V       bVI      VI      bVII     VII
});
inline constexpr auto kDegreesInMinor = std::to_array<TNumeralDegree>({
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
struct TNumeralSign {
    std::string_view mText;
    CSemitones mMajor;
    CSemitones mMinor;
};

// The whole text behind the number; h stands for ø, o for °, ^ for maj.
// clang-format off
inline constexpr auto kNumeralSigns = std::to_array<TNumeralSign>({
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
    {"13",    {0, 2, 4, 7, 9, 10},       {0, 2, 3, 7, 9, 10}},
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

/// The figures of an inversion: the tone of the chord that is its bass, 1 for the third to 3 for
/// the seventh.
struct TInversionFigure {
    std::string_view mFigure;
    int mTone;
    bool mHasSeventh;
};

inline constexpr auto kInversionFigures = std::to_array<TInversionFigure>({
    {"6", 1, false},
    {"64", 2, false},
    {"65", 1, true},
    {"43", 2, true},
    {"42", 3, true},
});

}  // namespace brindle
