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
    float mDefaultX = 0;
    float mDefaultY = 0;
    float mRelativeX = 0;
    float mRelativeY = 0;

    void ReadFromAttributes(const CMuxmlAttributes& attributes);

    static constexpr auto Fields() {
        return std::tuple(MuxmlField("mDefaultX", &CMuxmlXY::mDefaultX),
                          MuxmlField("mDefaultY", &CMuxmlXY::mDefaultY),
                          MuxmlField("mRelativeX", &CMuxmlXY::mRelativeX),
                          MuxmlField("mRelativeY", &CMuxmlXY::mRelativeY));
    }
};

struct CMuxmlXYColor : CMuxmlXY {
    std::int32_t mColor = kMuxmlUndef;

    void ReadFromAttributes(const CMuxmlAttributes& attributes);

    static constexpr auto Fields() {
        return std::tuple(CMuxmlBlock<CMuxmlXY>{"CMuxmlXY"},
                          MuxmlField("mColor", &CMuxmlXYColor::mColor));
    }
};

struct CMuxmlFont {
    std::string mFontFamily;
    TMuxmlEnum_FontStyle mFontStyle = TMuxmlEnum_FontStyle_Normal;
    float mFontSize = 0;
    TMuxmlEnum_FontWeight mFontWeight = TMuxmlEnum_FontWeight_Normal;

    void ReadFromAttributes(const CMuxmlAttributes& attributes);

    static constexpr auto Fields() {
        return std::tuple(MuxmlField("mFontFamily", &CMuxmlFont::mFontFamily),
                          MuxmlField("mFontStyle", &CMuxmlFont::mFontStyle),
                          MuxmlField("mFontSize", &CMuxmlFont::mFontSize),
                          MuxmlField("mFontWeight", &CMuxmlFont::mFontWeight));
    }
};

struct CMuxmlFontAndColor : CMuxmlFont {
    std::int32_t mColor = kMuxmlUndef;

    void ReadFromAttributes(const CMuxmlAttributes& attributes);

    static constexpr auto Fields() {
        return std::tuple(CMuxmlBlock<CMuxmlFont>{"CMuxmlFont"},
                          MuxmlField("mColor", &CMuxmlFontAndColor::mColor));
    }
};

struct CMuxmlLine {
    TMuxmlEnum_LineShape mLineShape = TMuxmlEnum_LineShape_Undef;
    TMuxmlEnum_LineType mLineType = TMuxmlEnum_LineType_Solid;
    float mDashLength = 0;
    float mSpaceLength = 0;

    void ReadFromAttributes(const CMuxmlAttributes& attributes);

    static constexpr auto Fields() {
        return std::tuple(MuxmlField("mLineShape", &CMuxmlLine::mLineShape),
                          MuxmlField("mLineType", &CMuxmlLine::mLineType),
                          MuxmlField("mDashLength", &CMuxmlLine::mDashLength),
                          MuxmlField("mSpaceLength", &CMuxmlLine::mSpaceLength));
    }
};

}  // namespace brindle
