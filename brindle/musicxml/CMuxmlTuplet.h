// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/MuxmlBlocks.h"

#include <string_view>

namespace brindle {

// How a tuplet is drawn: its bracket and the numbers and notes at it.

/// A number at a tuplet, such as the 3 of a triplet.
struct CMuxmlTupletNumber : CMuxmlFontAndColor {
    std::int32_t mTupletNumber = 0;

    void ReadFromFoundCharactersAndAttributes(std::string_view text,
                                              const CMuxmlAttributes& attributes);

    static constexpr auto Fields() {
        return std::tuple(CMuxmlBlock<CMuxmlFontAndColor>{"CMuxmlFontAndColor"},
                          MuxmlField("mTupletNumber", &CMuxmlTupletNumber::mTupletNumber));
    }
};

/// The note that is drawn at the number of a tuplet.
struct CMuxmlTupletType : CMuxmlFontAndColor {
    TMuxmlEnum_NoteTypeValue mTupletType = TMuxmlEnum_NoteTypeValue_Quarter;

    void ReadFromFoundCharactersAndAttributes(std::string_view text,
                                              const CMuxmlAttributes& attributes);

    static constexpr auto Fields() {
        return std::tuple(CMuxmlBlock<CMuxmlFontAndColor>{"CMuxmlFontAndColor"},
                          MuxmlField("mTupletType", &CMuxmlTupletType::mTupletType));
    }
};

/// A dot behind that note.
struct CMuxmlTupletDot : CMuxmlFontAndColor {
    void ReadFromFoundCharactersAndAttributes(std::string_view text,
                                              const CMuxmlAttributes& attributes);

    static constexpr auto Fields() {
        return std::tuple(CMuxmlBlock<CMuxmlFontAndColor>{"CMuxmlFontAndColor"});
    }
};

/// One side of the ratio of a tuplet.
struct CMuxmlTupletPortion {
    CMuxmlTupletNumber mTupletNumber;
    CMuxmlTupletType mTupletType;
    CMuxmlTupletDot mTupletDot;

    static constexpr auto Fields() {
        return std::tuple(MuxmlField("mTupletNumber", &CMuxmlTupletPortion::mTupletNumber),
                          MuxmlField("mTupletType", &CMuxmlTupletPortion::mTupletType),
                          MuxmlField("mTupletDot", &CMuxmlTupletPortion::mTupletDot));
    }
};

/// The sign over a tuplet: its bracket, its numbers and its notes.
struct CMuxmlTuplet : CMuxmlXY {
    /// Whether the sign starts or stops at this note.
    TMuxmlEnum_StartStop mType = TMuxmlEnum_StartStop_Undef;
    /// Tells signs apart that overlap.
    std::int32_t mNumber = 0;
    TMuxmlEnum_YesNo mBracket = TMuxmlEnum_YesNo_No;
    TMuxmlEnum_ShowTuplet mShowNumber = TMuxmlEnum_ShowTuplet_Actual;
    TMuxmlEnum_ShowTuplet mShowTuplet = TMuxmlEnum_ShowTuplet_Actual;
    TMuxmlEnum_LineShape mLineShape = TMuxmlEnum_LineShape_Undef;
    TMuxmlEnum_AboveBelow mPlacement = TMuxmlEnum_AboveBelow_Above;
    /// So many notes are played
    CMuxmlTupletPortion mTupletActual;
    /// in the time of so many.
    CMuxmlTupletPortion mTupletNormal;

    void ReadFromAttributes(const CMuxmlAttributes& attributes);
    /// The text does not count.
    void ReadFromFoundCharactersAndAttributes(std::string_view text,
                                              const CMuxmlAttributes& attributes);

    static constexpr auto Fields() {
        return std::tuple(CMuxmlBlock<CMuxmlXY>{"CMuxmlXY"},
                          MuxmlField("mType", &CMuxmlTuplet::mType),
                          MuxmlField("mNumber", &CMuxmlTuplet::mNumber),
                          MuxmlField("mBracket", &CMuxmlTuplet::mBracket),
                          MuxmlField("mShowNumber", &CMuxmlTuplet::mShowNumber),
                          MuxmlField("mShowTuplet", &CMuxmlTuplet::mShowTuplet),
                          MuxmlField("mLineShape", &CMuxmlTuplet::mLineShape),
                          MuxmlField("mPlacement", &CMuxmlTuplet::mPlacement),
                          MuxmlField("mTupletActual", &CMuxmlTuplet::mTupletActual),
                          MuxmlField("mTupletNormal", &CMuxmlTuplet::mTupletNormal));
    }
};

}  // namespace brindle
