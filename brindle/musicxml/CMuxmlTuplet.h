// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/MuxmlBlocks.h"

#include <string_view>

namespace brindle {

// How a tuplet is drawn: its bracket and the numbers and notes at it.

/// A number at a tuplet, such as the 3 of a triplet.
struct CMuxmlTupletNumber : CMuxmlFontAndColor {
    std::int32_t mTupletNumber = 0;  ///< 0 where the file tells none

    /// The number from the text, 0 for a text that is none; font and colour.
    void ReadFromFoundCharactersAndAttributes(std::string_view text,
                                              const CMuxmlAttributes& attributes);

    /// By name, see CMuxmlField.
    static constexpr auto Fields() {
        return std::tuple(CMuxmlBlock<CMuxmlFontAndColor>{"CMuxmlFontAndColor"},
                          MuxmlField("mTupletNumber", &CMuxmlTupletNumber::mTupletNumber));
    }
};

/// The note that is drawn at the number of a tuplet.
struct CMuxmlTupletType : CMuxmlFontAndColor {
    /// An unknown word is a quarter.
    TMuxmlEnum_NoteTypeValue mTupletType = TMuxmlEnum_NoteTypeValue_Quarter;

    /// The note value from the text; font and colour.
    void ReadFromFoundCharactersAndAttributes(std::string_view text,
                                              const CMuxmlAttributes& attributes);

    /// By name, see CMuxmlField.
    static constexpr auto Fields() {
        return std::tuple(CMuxmlBlock<CMuxmlFontAndColor>{"CMuxmlFontAndColor"},
                          MuxmlField("mTupletType", &CMuxmlTupletType::mTupletType));
    }
};

/// A dot behind that note.
struct CMuxmlTupletDot : CMuxmlFontAndColor {
    /// Font and colour; the text does not count.
    void ReadFromFoundCharactersAndAttributes(std::string_view text,
                                              const CMuxmlAttributes& attributes);

    /// By name, see CMuxmlField.
    static constexpr auto Fields() {
        return std::tuple(CMuxmlBlock<CMuxmlFontAndColor>{"CMuxmlFontAndColor"});
    }
};

/// One side of the ratio of a tuplet.
struct CMuxmlTupletPortion {
    CMuxmlTupletNumber mTupletNumber;  ///< so many notes, 3 or 2 for a triplet
    CMuxmlTupletType mTupletType;      ///< of this value
    CMuxmlTupletDot mTupletDot;        ///< with a dot

    /// By name, see CMuxmlField.
    static constexpr auto Fields() {
        return std::tuple(MuxmlField("mTupletNumber", &CMuxmlTupletPortion::mTupletNumber),
                          MuxmlField("mTupletType", &CMuxmlTupletPortion::mTupletType),
                          MuxmlField("mTupletDot", &CMuxmlTupletPortion::mTupletDot));
    }
};

/// The sign over a tuplet: its bracket, its numbers and its notes.
struct CMuxmlTuplet : CMuxmlXY {
    /// Whether the sign starts or stops at this note. Kept: read from an attribute `start-stop`,
    /// which MusicXML calls `type`, so that its files leave it undefined.
    TMuxmlEnum_StartStop mType = TMuxmlEnum_StartStop_Undef;
    /// Tells signs apart that overlap.
    std::int32_t mNumber = 0;
    TMuxmlEnum_YesNo mBracket = TMuxmlEnum_YesNo_No;  ///< yes: a bracket is drawn over its notes
    /// Whether 3, 3:2 or no number is shown.
    TMuxmlEnum_ShowTuplet mShowNumber = TMuxmlEnum_ShowTuplet_Actual;
    /// Likewise, which note values are shown beside the numbers.
    TMuxmlEnum_ShowTuplet mShowTuplet = TMuxmlEnum_ShowTuplet_Actual;
    TMuxmlEnum_LineShape mLineShape = TMuxmlEnum_LineShape_Undef;  ///< of the bracket
    /// Of the sign, seen from its notes.
    TMuxmlEnum_AboveBelow mPlacement = TMuxmlEnum_AboveBelow_Above;
    /// So many notes are played
    CMuxmlTupletPortion mTupletActual;
    /// in the time of so many.
    CMuxmlTupletPortion mTupletNormal;

    /// Reads `start-stop`, `number`, `bracket`, `show-number`, `show-type`, `line-shape`,
    /// `placement`, and those of the block.
    void ReadFromAttributes(const CMuxmlAttributes& attributes);
    /// The text does not count.
    void ReadFromFoundCharactersAndAttributes(std::string_view text,
                                              const CMuxmlAttributes& attributes);

    /// By name, see CMuxmlField.
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
