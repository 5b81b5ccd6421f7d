// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/CMuxmlBiMap.h"

#include <cstdint>

namespace brindle {

// The closed lists of words that scores use. The values are what records hold; a value that no word
// stands for is the default of the fields of its type.

/// Whether something holds. Mind the order: yes is 0.
enum TMuxmlEnum_YesNo : std::int32_t {
    TMuxmlEnum_YesNo_Yes = 0,
    TMuxmlEnum_YesNo_No = 1,
};

// clang-format off
/// The words of `yes-no` in MusicXML.
template <>
inline constexpr auto mBiMap<TMuxmlEnum_YesNo> = MuxmlBiMap<TMuxmlEnum_YesNo>({
    {TMuxmlEnum_YesNo_Yes, "yes"},
    {TMuxmlEnum_YesNo_No, "no"},
});
// clang-format on
static_assert(mBiMap<TMuxmlEnum_YesNo>.IsOneToOne());

/// Which end of a tie or a bracket a note is; 0 is a tie whose end cannot be read.
enum TMuxmlEnum_StartStop : std::int32_t {
    TMuxmlEnum_StartStop_Undef = 0,  ///< no word
    TMuxmlEnum_StartStop_Start = 1,
    TMuxmlEnum_StartStop_Stop = 2,
    TMuxmlEnum_StartStop_Continue = 3,
};

// clang-format off
/// The words of `start-stop-continue` in MusicXML.
template <>
inline constexpr auto mBiMap<TMuxmlEnum_StartStop> = MuxmlBiMap<TMuxmlEnum_StartStop>({
    {TMuxmlEnum_StartStop_Start, "start"},
    {TMuxmlEnum_StartStop_Stop, "stop"},
    {TMuxmlEnum_StartStop_Continue, "continue"},
});
// clang-format on
static_assert(mBiMap<TMuxmlEnum_StartStop>.IsOneToOne());

/// Where the stem of a note points.
enum TMuxmlEnum_Stem : std::int32_t {
    TMuxmlEnum_Stem_None = 0,
    TMuxmlEnum_Stem_Down = 1,
    TMuxmlEnum_Stem_Up = 2,
    TMuxmlEnum_Stem_Double = 3,
};

// clang-format off
/// The words of `stem-value` in MusicXML.
template <>
inline constexpr auto mBiMap<TMuxmlEnum_Stem> = MuxmlBiMap<TMuxmlEnum_Stem>({
    {TMuxmlEnum_Stem_None, "none"},
    {TMuxmlEnum_Stem_Down, "down"},
    {TMuxmlEnum_Stem_Up, "up"},
    {TMuxmlEnum_Stem_Double, "double"},
});
// clang-format on
static_assert(mBiMap<TMuxmlEnum_Stem>.IsOneToOne());

/// The letter of a note; -1 is a letter that was not read.
enum TMuxmlEnum_Step : std::int32_t {
    TMuxmlEnum_Step_Undef = -1,  ///< no word
    TMuxmlEnum_Step_C = 0,
    TMuxmlEnum_Step_D = 1,
    TMuxmlEnum_Step_E = 2,
    TMuxmlEnum_Step_F = 3,
    TMuxmlEnum_Step_G = 4,
    TMuxmlEnum_Step_A = 5,
    TMuxmlEnum_Step_B = 6,
};

// clang-format off
/// The words of `step` in MusicXML.
template <>
inline constexpr auto mBiMap<TMuxmlEnum_Step> = MuxmlBiMap<TMuxmlEnum_Step>({
    {TMuxmlEnum_Step_C, "C"},
    {TMuxmlEnum_Step_D, "D"},
    {TMuxmlEnum_Step_E, "E"},
    {TMuxmlEnum_Step_F, "F"},
    {TMuxmlEnum_Step_G, "G"},
    {TMuxmlEnum_Step_A, "A"},
    {TMuxmlEnum_Step_B, "B"},
});
// clang-format on
static_assert(mBiMap<TMuxmlEnum_Step>.IsOneToOne());

/// What a note is.
enum TMuxmlEnum_NoteType : std::int32_t {
    TMuxmlEnum_NoteType_Undefined = 0,
    TMuxmlEnum_NoteType_Pitched = 1,
    TMuxmlEnum_NoteType_Unpitched = 2,
    TMuxmlEnum_NoteType_Rest = 3,
};

// clang-format off
/// Words of our own: MusicXML has the elements `pitch`, `unpitched` and `rest`.
template <>
inline constexpr auto mBiMap<TMuxmlEnum_NoteType> = MuxmlBiMap<TMuxmlEnum_NoteType>({
    {TMuxmlEnum_NoteType_Undefined, "undefined"},
    {TMuxmlEnum_NoteType_Pitched, "pitched"},
    {TMuxmlEnum_NoteType_Unpitched, "unpitched"},
    {TMuxmlEnum_NoteType_Rest, "rest"},
});
// clang-format on
static_assert(mBiMap<TMuxmlEnum_NoteType>.IsOneToOne());

/// How long a note looks.
enum TMuxmlEnum_NoteTypeValue : std::int32_t {
    TMuxmlEnum_NoteTypeValue_1024th = 0,
    TMuxmlEnum_NoteTypeValue_512th = 1,
    TMuxmlEnum_NoteTypeValue_256th = 2,
    TMuxmlEnum_NoteTypeValue_128th = 3,
    TMuxmlEnum_NoteTypeValue_64th = 4,
    TMuxmlEnum_NoteTypeValue_32nd = 5,
    TMuxmlEnum_NoteTypeValue_16th = 6,
    TMuxmlEnum_NoteTypeValue_Eighth = 7,
    TMuxmlEnum_NoteTypeValue_Quarter = 8,
    TMuxmlEnum_NoteTypeValue_Half = 9,
    TMuxmlEnum_NoteTypeValue_Whole = 10,
    TMuxmlEnum_NoteTypeValue_Breve = 11,
    TMuxmlEnum_NoteTypeValue_Long = 12,
    TMuxmlEnum_NoteTypeValue_Maxima = 13,
    TMuxmlEnum_NoteTypeValue_Undef = 14,
};

// clang-format off
/// The words of `note-type-value` in MusicXML, and a word for what it does not have.
template <>
inline constexpr auto mBiMap<TMuxmlEnum_NoteTypeValue> = MuxmlBiMap<TMuxmlEnum_NoteTypeValue>({
    {TMuxmlEnum_NoteTypeValue_1024th, "1024th"},
    {TMuxmlEnum_NoteTypeValue_512th, "512th"},
    {TMuxmlEnum_NoteTypeValue_256th, "256th"},
    {TMuxmlEnum_NoteTypeValue_128th, "128th"},
    {TMuxmlEnum_NoteTypeValue_64th, "64th"},
    {TMuxmlEnum_NoteTypeValue_32nd, "32nd"},
    {TMuxmlEnum_NoteTypeValue_16th, "16th"},
    {TMuxmlEnum_NoteTypeValue_Eighth, "eighth"},
    {TMuxmlEnum_NoteTypeValue_Quarter, "quarter"},
    {TMuxmlEnum_NoteTypeValue_Half, "half"},
    {TMuxmlEnum_NoteTypeValue_Whole, "whole"},
    {TMuxmlEnum_NoteTypeValue_Breve, "breve"},
    {TMuxmlEnum_NoteTypeValue_Long, "long"},
    {TMuxmlEnum_NoteTypeValue_Maxima, "maxima"},
    {TMuxmlEnum_NoteTypeValue_Undef, "undef (does not occur in MusicXml)"},
});
// clang-format on
static_assert(mBiMap<TMuxmlEnum_NoteTypeValue>.IsOneToOne());

/// How large a symbol is drawn.
enum TMuxmlEnum_SymbolSize : std::int32_t {
    TMuxmlEnum_SymbolSize_Full = 0,
    TMuxmlEnum_SymbolSize_Cue = 1,
    TMuxmlEnum_SymbolSize_Large = 2,
};

// clang-format off
/// The words of `symbol-size` in MusicXML, without `grace-cue`.
template <>
inline constexpr auto mBiMap<TMuxmlEnum_SymbolSize> = MuxmlBiMap<TMuxmlEnum_SymbolSize>({
    {TMuxmlEnum_SymbolSize_Full, "full"},
    {TMuxmlEnum_SymbolSize_Cue, "cue"},
    {TMuxmlEnum_SymbolSize_Large, "large"},
});
// clang-format on
static_assert(mBiMap<TMuxmlEnum_SymbolSize>.IsOneToOne());

/// Upright or slanted letters.
enum TMuxmlEnum_FontStyle : std::int32_t {
    TMuxmlEnum_FontStyle_Normal = 0,
    TMuxmlEnum_FontStyle_Italic = 1,
};

// clang-format off
/// The words of `font-style` in MusicXML.
template <>
inline constexpr auto mBiMap<TMuxmlEnum_FontStyle> = MuxmlBiMap<TMuxmlEnum_FontStyle>({
    {TMuxmlEnum_FontStyle_Normal, "normal"},
    {TMuxmlEnum_FontStyle_Italic, "italic"},
});
// clang-format on
static_assert(mBiMap<TMuxmlEnum_FontStyle>.IsOneToOne());

/// Thin or thick letters.
enum TMuxmlEnum_FontWeight : std::int32_t {
    TMuxmlEnum_FontWeight_Normal = 0,
    TMuxmlEnum_FontWeight_Bold = 1,
};

// clang-format off
/// The words of `font-weight` in MusicXML.
template <>
inline constexpr auto mBiMap<TMuxmlEnum_FontWeight> = MuxmlBiMap<TMuxmlEnum_FontWeight>({
    {TMuxmlEnum_FontWeight_Normal, "normal"},
    {TMuxmlEnum_FontWeight_Bold, "bold"},
});
// clang-format on
static_assert(mBiMap<TMuxmlEnum_FontWeight>.IsOneToOne());

/// On which side of its note or staff a sign stands.
enum TMuxmlEnum_AboveBelow : std::int32_t {
    TMuxmlEnum_AboveBelow_Above = 0,
    TMuxmlEnum_AboveBelow_Below = 1,
};

// clang-format off
/// The words of `above-below` in MusicXML.
template <>
inline constexpr auto mBiMap<TMuxmlEnum_AboveBelow> = MuxmlBiMap<TMuxmlEnum_AboveBelow>({
    {TMuxmlEnum_AboveBelow_Above, "above"},
    {TMuxmlEnum_AboveBelow_Below, "below"},
});
// clang-format on
static_assert(mBiMap<TMuxmlEnum_AboveBelow>.IsOneToOne());

/// The accidental that is drawn before a note.
enum TMuxmlEnum_Accidental : std::int32_t {
    TMuxmlEnum_Accidental_Natural = 0,
    TMuxmlEnum_Accidental_Sharp = 1,
    TMuxmlEnum_Accidental_Flat = 2,
    TMuxmlEnum_Accidental_DoubleSharp = 3,
    TMuxmlEnum_Accidental_FlatFlat = 4,
    TMuxmlEnum_Accidental_Undef = 5,  ///< no accidental, no word
};

// clang-format off
/// The five common words of `accidental-value` in MusicXML.
template <>
inline constexpr auto mBiMap<TMuxmlEnum_Accidental> = MuxmlBiMap<TMuxmlEnum_Accidental>({
    {TMuxmlEnum_Accidental_Natural, "natural"},
    {TMuxmlEnum_Accidental_Sharp, "sharp"},
    {TMuxmlEnum_Accidental_Flat, "flat"},
    {TMuxmlEnum_Accidental_DoubleSharp, "double-sharp"},
    {TMuxmlEnum_Accidental_FlatFlat, "flat-flat"},
});
// clang-format on
static_assert(mBiMap<TMuxmlEnum_Accidental>.IsOneToOne());

/// The shape of a hold.
enum TMuxmlEnum_FermataShape : std::int32_t {
    TMuxmlEnum_FermataShape_Normal = 0,
    TMuxmlEnum_FermataShape_Angled = 1,
    TMuxmlEnum_FermataShape_Square = 2,
};

// clang-format off
/// The first three words of `fermata-shape` in MusicXML.
template <>
inline constexpr auto mBiMap<TMuxmlEnum_FermataShape> = MuxmlBiMap<TMuxmlEnum_FermataShape>({
    {TMuxmlEnum_FermataShape_Normal, "normal"},
    {TMuxmlEnum_FermataShape_Angled, "angled"},
    {TMuxmlEnum_FermataShape_Square, "square"},
});
// clang-format on
static_assert(mBiMap<TMuxmlEnum_FermataShape>.IsOneToOne());

/// Which way up a hold is drawn.
enum TMuxmlEnum_UprightInverted : std::int32_t {
    TMuxmlEnum_UprightInverted_Upright = 0,
    TMuxmlEnum_UprightInverted_Inverted = 1,
};

// clang-format off
/// The words of `upright-inverted` in MusicXML.
template <>
inline constexpr auto mBiMap<TMuxmlEnum_UprightInverted> = MuxmlBiMap<TMuxmlEnum_UprightInverted>({
    {TMuxmlEnum_UprightInverted_Upright, "upright"},
    {TMuxmlEnum_UprightInverted_Inverted, "inverted"},
});
// clang-format on
static_assert(mBiMap<TMuxmlEnum_UprightInverted>.IsOneToOne());

/// Whether a line is bent.
enum TMuxmlEnum_LineShape : std::int32_t {
    TMuxmlEnum_LineShape_Straight = 0,
    TMuxmlEnum_LineShape_Curved = 1,
    TMuxmlEnum_LineShape_Undef = 2,  ///< no word
};

// clang-format off
/// The words of `line-shape` in MusicXML.
template <>
inline constexpr auto mBiMap<TMuxmlEnum_LineShape> = MuxmlBiMap<TMuxmlEnum_LineShape>({
    {TMuxmlEnum_LineShape_Straight, "straight"},
    {TMuxmlEnum_LineShape_Curved, "curved"},
});
// clang-format on
static_assert(mBiMap<TMuxmlEnum_LineShape>.IsOneToOne());

/// How a line is drawn.
enum TMuxmlEnum_LineType : std::int32_t {
    TMuxmlEnum_LineType_Solid = 0,
    TMuxmlEnum_LineType_Dashed = 1,
    TMuxmlEnum_LineType_Dotted = 2,
    TMuxmlEnum_LineType_Wavy = 3,
};

// clang-format off
/// The words of `line-type` in MusicXML.
template <>
inline constexpr auto mBiMap<TMuxmlEnum_LineType> = MuxmlBiMap<TMuxmlEnum_LineType>({
    {TMuxmlEnum_LineType_Solid, "solid"},
    {TMuxmlEnum_LineType_Dashed, "dashed"},
    {TMuxmlEnum_LineType_Dotted, "dotted"},
    {TMuxmlEnum_LineType_Wavy, "wavy"},
});
// clang-format on
static_assert(mBiMap<TMuxmlEnum_LineType>.IsOneToOne());

/// The mode of a key signature.
enum TMuxmlEnum_SignKeyMode : std::int32_t {
    TMuxmlEnum_SignKeyMode_Major = 0,
    TMuxmlEnum_SignKeyMode_Minor = 1,
    TMuxmlEnum_SignKeyMode_Dorian = 2,
    TMuxmlEnum_SignKeyMode_Phrygian = 3,
    TMuxmlEnum_SignKeyMode_Lydian = 4,
    TMuxmlEnum_SignKeyMode_Mixolydian = 5,
    TMuxmlEnum_SignKeyMode_Aeolian = 6,
    TMuxmlEnum_SignKeyMode_Ionian = 7,
    TMuxmlEnum_SignKeyMode_Locrian = 8,
    TMuxmlEnum_SignKeyMode_None = 9,
};

// clang-format off
/// The words of `mode` in MusicXML.
template <>
inline constexpr auto mBiMap<TMuxmlEnum_SignKeyMode> = MuxmlBiMap<TMuxmlEnum_SignKeyMode>({
    {TMuxmlEnum_SignKeyMode_Major, "major"},
    {TMuxmlEnum_SignKeyMode_Minor, "minor"},
    {TMuxmlEnum_SignKeyMode_Dorian, "dorian"},
    {TMuxmlEnum_SignKeyMode_Phrygian, "phrygian"},
    {TMuxmlEnum_SignKeyMode_Lydian, "lydian"},
    {TMuxmlEnum_SignKeyMode_Mixolydian, "mixolydian"},
    {TMuxmlEnum_SignKeyMode_Aeolian, "aeolian"},
    {TMuxmlEnum_SignKeyMode_Ionian, "ionian"},
    {TMuxmlEnum_SignKeyMode_Locrian, "locrian"},
    {TMuxmlEnum_SignKeyMode_None, "none"},
});
// clang-format on
static_assert(mBiMap<TMuxmlEnum_SignKeyMode>.IsOneToOne());

/// The sign of a clef.
enum TMuxmlEnum_ClefSign : std::int32_t {
    TMuxmlEnum_ClefSign_G = 0,
    TMuxmlEnum_ClefSign_F = 1,
    TMuxmlEnum_ClefSign_C = 2,
    TMuxmlEnum_ClefSign_Percussion = 3,
    TMuxmlEnum_ClefSign_TAB = 4,
    TMuxmlEnum_ClefSign_Jianpu = 5,
    TMuxmlEnum_ClefSign_None = 6,
};

// clang-format off
/// The words of `clef-sign` in MusicXML.
template <>
inline constexpr auto mBiMap<TMuxmlEnum_ClefSign> = MuxmlBiMap<TMuxmlEnum_ClefSign>({
    {TMuxmlEnum_ClefSign_G, "G"},
    {TMuxmlEnum_ClefSign_F, "F"},
    {TMuxmlEnum_ClefSign_C, "C"},
    {TMuxmlEnum_ClefSign_Percussion, "percussion"},
    {TMuxmlEnum_ClefSign_TAB, "TAB"},
    {TMuxmlEnum_ClefSign_Jianpu, "jianpu"},
    {TMuxmlEnum_ClefSign_None, "none"},
});
// clang-format on
static_assert(mBiMap<TMuxmlEnum_ClefSign>.IsOneToOne());

/// Which numbers of a tuplet are shown.
enum TMuxmlEnum_ShowTuplet : std::int32_t {
    TMuxmlEnum_ShowTuplet_Actual = 0,
    TMuxmlEnum_ShowTuplet_Both = 1,
    TMuxmlEnum_ShowTuplet_None = 2,
};

// clang-format off
/// The words of `show-tuplet` in MusicXML.
template <>
inline constexpr auto mBiMap<TMuxmlEnum_ShowTuplet> = MuxmlBiMap<TMuxmlEnum_ShowTuplet>({
    {TMuxmlEnum_ShowTuplet_Actual, "actual"},
    {TMuxmlEnum_ShowTuplet_Both, "both"},
    {TMuxmlEnum_ShowTuplet_None, "none"},
});
// clang-format on
static_assert(mBiMap<TMuxmlEnum_ShowTuplet>.IsOneToOne());

/// What a text is framed with. No record holds it.
enum TMuxmlEnum_EnclosureShape : std::int32_t {
    TMuxmlEnum_EnclosureShape_Square = 1,
    TMuxmlEnum_EnclosureShape_Oval = 2,
    TMuxmlEnum_EnclosureShape_Circle = 3,
    TMuxmlEnum_EnclosureShape_Bracket = 4,
    TMuxmlEnum_EnclosureShape_Triangle = 5,
    TMuxmlEnum_EnclosureShape_Diamond = 6,
    TMuxmlEnum_EnclosureShape_None = 7,
};

// clang-format off
/// Most words of `enclosure-shape` in MusicXML.
template <>
inline constexpr auto mBiMap<TMuxmlEnum_EnclosureShape> = MuxmlBiMap<TMuxmlEnum_EnclosureShape>({
    {TMuxmlEnum_EnclosureShape_Square, "square"},
    {TMuxmlEnum_EnclosureShape_Oval, "oval"},
    {TMuxmlEnum_EnclosureShape_Circle, "circle"},
    {TMuxmlEnum_EnclosureShape_Bracket, "bracket"},
    {TMuxmlEnum_EnclosureShape_Triangle, "triangle"},
    {TMuxmlEnum_EnclosureShape_Diamond, "diamond"},
    {TMuxmlEnum_EnclosureShape_None, "none"},
});
// clang-format on
static_assert(mBiMap<TMuxmlEnum_EnclosureShape>.IsOneToOne());

/// How a text is aligned. No record holds it.
enum TMuxmlEnum_LeftCenterRight : std::int32_t {
    TMuxmlEnum_LeftCenterRight_Left = 0,
    TMuxmlEnum_LeftCenterRight_Center = 1,
    TMuxmlEnum_LeftCenterRight_Right = 2,
};

// clang-format off
/// The words of `left-center-right` in MusicXML.
template <>
inline constexpr auto mBiMap<TMuxmlEnum_LeftCenterRight> = MuxmlBiMap<TMuxmlEnum_LeftCenterRight>({
    {TMuxmlEnum_LeftCenterRight_Left, "left"},
    {TMuxmlEnum_LeftCenterRight_Center, "center"},
    {TMuxmlEnum_LeftCenterRight_Right, "right"},
});
// clang-format on
static_assert(mBiMap<TMuxmlEnum_LeftCenterRight>.IsOneToOne());

}  // namespace brindle
