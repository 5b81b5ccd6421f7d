// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/MuxmlBlocks.h"
#include "brindle/platform/XmlDocument.h"

#include <vector>

namespace brindle {

/// A measure of a part.
struct CMuxmlMeasure {
    /// The number of a measure that has none.
    static constexpr const char* kNumber_Undef = "_Undef";

    /// Its begin, in ticks from the start of the part.
    std::int32_t mPositionAsMidiTicks = kMuxmlUndef;
    /// One bar of the time signature later, whatever it holds; 0 without beats or beat type.
    std::int32_t mEndPositionAsMidiTicks = kMuxmlUndef;
    XmlNode mMeasureXML;                  ///< the element `measure`
    std::string mNumber = kNumber_Undef;  ///< as printed, "12" or "X1"
    std::uint64_t mDivisions = 0;         ///< 0 where the measure does not tell them
    std::uint64_t mStaves = 0;            ///< 0 where the measure does not tell them
    /// How many instruments the part has here; 0 where the measure does not tell it.
    std::uint64_t mInstruments = 0;
    std::vector<XmlNode> mBarlineXMLs;  ///< the elements `barline`, with repeats and endings

    /// Reads `number`.
    void ReadFromAttributes(const CMuxmlAttributes& attributes);

    /// By name, see CMuxmlField.
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
