// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/CMuxmlAttributes.h"
#include "brindle/musicxml/MuxmlEnums.h"
#include "brindle/musicxml/MuxmlFields.h"

#include <cstdint>
#include <string>

namespace brindle {

/// The undefined value of positions, lengths and colours of an import.
inline constexpr std::int32_t kMuxmlUndef = -2147483647;

// Blocks of fields that many records begin with: where a sign is drawn and how it looks. Reading
// leaves the field of an absent attribute, and of an unknown word, as it is; numbers are read from
// the start of the text, so that a colour written in hexadecimal is 0.

/// Where a sign is drawn, in tenths of the distance of staff lines.
struct CMuxmlXY {
    /// From the left of the measure.
    float mDefaultX = 0;
    /// From the top line of the staff, up.
    float mDefaultY = 0;
    /// From the default place to the right.
    float mRelativeX = 0;
    /// From the default place up.
    float mRelativeY = 0;

    /// Reads `default-x`, `default-y`, `relative-x`, `relative-y`.
    void ReadFromAttributes(const CMuxmlAttributes& attributes);

    /// By name, see CMuxmlField.
    static constexpr auto Fields() {
        return std::tuple(MuxmlField("mDefaultX", &CMuxmlXY::mDefaultX),
                          MuxmlField("mDefaultY", &CMuxmlXY::mDefaultY),
                          MuxmlField("mRelativeX", &CMuxmlXY::mRelativeX),
                          MuxmlField("mRelativeY", &CMuxmlXY::mRelativeY));
    }
};

/// A place and a colour.
struct CMuxmlXYColor : CMuxmlXY {
    /// Undefined for the usual one. Kept: what begins with # is read as 0.
    std::int32_t mColor = kMuxmlUndef;

    /// Reads `color`, and those of the place.
    void ReadFromAttributes(const CMuxmlAttributes& attributes);

    /// By name, see CMuxmlField.
    static constexpr auto Fields() {
        return std::tuple(CMuxmlBlock<CMuxmlXY>{"CMuxmlXY"},
                          MuxmlField("mColor", &CMuxmlXYColor::mColor));
    }
};

/// The font of a text; a size of 0 is the usual one.
struct CMuxmlFont {
    /// Names of fonts, in the order of preference, between commas.
    std::string mFontFamily;
    TMuxmlEnum_FontStyle mFontStyle = TMuxmlEnum_FontStyle_Normal;  ///< normal or italic
    /// In points.
    float mFontSize = 0;
    TMuxmlEnum_FontWeight mFontWeight = TMuxmlEnum_FontWeight_Normal;  ///< normal or bold

    /// Reads `font-family`, `font-style`, `font-size` (a word such as "large" is 0), `font-weight`.
    void ReadFromAttributes(const CMuxmlAttributes& attributes);

    /// By name, see CMuxmlField.
    static constexpr auto Fields() {
        return std::tuple(MuxmlField("mFontFamily", &CMuxmlFont::mFontFamily),
                          MuxmlField("mFontStyle", &CMuxmlFont::mFontStyle),
                          MuxmlField("mFontSize", &CMuxmlFont::mFontSize),
                          MuxmlField("mFontWeight", &CMuxmlFont::mFontWeight));
    }
};

/// A font and a colour.
struct CMuxmlFontAndColor : CMuxmlFont {
    /// Undefined for the usual one. Kept: what begins with # is read as 0.
    std::int32_t mColor = kMuxmlUndef;

    /// Reads `color`, and those of the font.
    void ReadFromAttributes(const CMuxmlAttributes& attributes);

    /// By name, see CMuxmlField.
    static constexpr auto Fields() {
        return std::tuple(CMuxmlBlock<CMuxmlFont>{"CMuxmlFont"},
                          MuxmlField("mColor", &CMuxmlFontAndColor::mColor));
    }
};

/// The line of a sign: its shape, and how it is dashed, in tenths of the distance of staff lines.
struct CMuxmlLine {
    TMuxmlEnum_LineShape mLineShape = TMuxmlEnum_LineShape_Undef;  ///< straight or curved
    TMuxmlEnum_LineType mLineType = TMuxmlEnum_LineType_Solid;  ///< solid, dashed, dotted or wavy
    float mDashLength = 0;   ///< of a dashed line; 0 for the usual one
    float mSpaceLength = 0;  ///< between two dashes; 0 for the usual one

    /// Reads `line-shape`, `line-type`, `dash-length`, `space-length`.
    void ReadFromAttributes(const CMuxmlAttributes& attributes);

    /// By name, see CMuxmlField.
    static constexpr auto Fields() {
        return std::tuple(MuxmlField("mLineShape", &CMuxmlLine::mLineShape),
                          MuxmlField("mLineType", &CMuxmlLine::mLineType),
                          MuxmlField("mDashLength", &CMuxmlLine::mDashLength),
                          MuxmlField("mSpaceLength", &CMuxmlLine::mSpaceLength));
    }
};

}  // namespace brindle
