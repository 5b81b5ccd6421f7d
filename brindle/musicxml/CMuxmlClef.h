// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/MuxmlBlocks.h"
#include "brindle/platform/XmlDocument.h"

namespace brindle {

/// A clef on a staff.
struct CMuxmlClef : CMuxmlXYColor, CMuxmlFont {
    std::int32_t mPositionAsMidiTicks = kMuxmlUndef;
    std::uint64_t mStaffNumber = 0;
    TMuxmlEnum_YesNo mPrintObject = TMuxmlEnum_YesNo_Yes;
    TMuxmlEnum_YesNo mAdditional = TMuxmlEnum_YesNo_No;
    TMuxmlEnum_SymbolSize mSize = TMuxmlEnum_SymbolSize_Full;
    TMuxmlEnum_YesNo mAfterBarline = TMuxmlEnum_YesNo_No;
    TMuxmlEnum_ClefSign mSign = TMuxmlEnum_ClefSign_None;
    std::int32_t mStaffLine = 0;  ///< from 1, the lowest
    std::int32_t mClefOctaveChange = 0;
    XmlNode mStaffDetailsXML;

    void ReadFromAttributes(const CMuxmlAttributes& attributes);

    static constexpr auto Fields() {
        return std::tuple(CMuxmlBlock<CMuxmlXYColor>{"CMuxmlXYColor"},
                          CMuxmlBlock<CMuxmlFont>{"CMuxmlFont"},
                          MuxmlField("mPositionAsMidiTicks", &CMuxmlClef::mPositionAsMidiTicks),
                          MuxmlField("mStaffNumber", &CMuxmlClef::mStaffNumber),
                          MuxmlField("mPrintObject", &CMuxmlClef::mPrintObject),
                          MuxmlField("mAdditional", &CMuxmlClef::mAdditional),
                          MuxmlField("mSize", &CMuxmlClef::mSize),
                          MuxmlField("mAfterBarline", &CMuxmlClef::mAfterBarline),
                          MuxmlField("mSign", &CMuxmlClef::mSign),
                          MuxmlField("mStaffLine", &CMuxmlClef::mStaffLine),
                          MuxmlField("mClefOctaveChange", &CMuxmlClef::mClefOctaveChange),
                          MuxmlField("mStaffDetailsXML", &CMuxmlClef::mStaffDetailsXML));
    }
};

}  // namespace brindle
