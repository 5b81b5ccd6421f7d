// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/MuxmlBlocks.h"
#include "brindle/platform/XmlDocument.h"

namespace brindle {

/// A clef on a staff.
struct CMuxmlClef : CMuxmlXYColor, CMuxmlFont {
    /// Ticks from the start of the part, from where it holds.
    std::int32_t mPositionAsMidiTicks = kMuxmlUndef;
    /// The staff of the part, 1 is the uppermost; 0 where the file tells none.
    std::uint64_t mStaffNumber = 0;
    /// No: it holds without being printed.
    TMuxmlEnum_YesNo mPrintObject = TMuxmlEnum_YesNo_Yes;
    /// Yes: it stands beside the one in force, as for cues, and its line does not count.
    TMuxmlEnum_YesNo mAdditional = TMuxmlEnum_YesNo_No;
    /// Full, or cue for a change within a staff.
    TMuxmlEnum_SymbolSize mSize = TMuxmlEnum_SymbolSize_Full;
    /// Yes: printed behind the bar line at which it holds; usual is before it.
    TMuxmlEnum_YesNo mAfterBarline = TMuxmlEnum_YesNo_No;
    /// Which note its line is: G4, F3 or C4. None, too, for an unknown word.
    TMuxmlEnum_ClefSign mSign = TMuxmlEnum_ClefSign_None;
    std::int32_t mStaffLine = 0;  ///< from 1, the lowest
    /// Octaves from what stands there to what it means: -1 for a G clef with an 8 below.
    std::int32_t mClefOctaveChange = 0;
    /// The first `staff-details` of the measure, of whichever staff; empty if it has none.
    XmlNode mStaffDetailsXML;

    /// Reads `number`, `print-object`, `additional`, `size`, `after-barline`, and those of the
    /// blocks.
    void ReadFromAttributes(const CMuxmlAttributes& attributes);

    /// By name, see CMuxmlField.
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
