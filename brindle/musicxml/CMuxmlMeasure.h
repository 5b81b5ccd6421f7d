// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/MuxmlBlocks.h"
#include "brindle/platform/XmlDocument.h"

#include <vector>

namespace brindle {

/// A measure of a part.
struct CMuxmlMeasure {
    static constexpr const char* kNumber_Undef = "_Undef";

    std::int32_t mPositionAsMidiTicks = kMuxmlUndef;
    std::int32_t mEndPositionAsMidiTicks = kMuxmlUndef;
    XmlNode mMeasureXML;
    std::string mNumber = kNumber_Undef;  ///< as printed, "12" or "X1"
    std::uint64_t mDivisions = 0;         ///< 0 where the measure does not tell them
    std::uint64_t mStaves = 0;            ///< 0 where the measure does not tell them
    std::uint64_t mInstruments = 0;
    std::vector<XmlNode> mBarlineXMLs;

    void ReadFromAttributes(const CMuxmlAttributes& attributes);

    static constexpr auto Fields() {
        return std::tuple(
            MuxmlField("mPositionAsMidiTicks", &CMuxmlMeasure::mPositionAsMidiTicks),
            MuxmlField("mEndPositionAsMidiTicks", &CMuxmlMeasure::mEndPositionAsMidiTicks),
            MuxmlField("mMeasureXML", &CMuxmlMeasure::mMeasureXML),
            MuxmlField("mNumber", &CMuxmlMeasure::mNumber),
            MuxmlField("mDivisions", &CMuxmlMeasure::mDivisions),
            MuxmlField("mStaves", &CMuxmlMeasure::mStaves),
            MuxmlField("mInstruments", &CMuxmlMeasure::mInstruments),
            MuxmlField("mBarlineXMLs", &CMuxmlMeasure::mBarlineXMLs));
    }
};

}  // namespace brindle
