// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/CMuxmlScoreInstrument.h"
#include "brindle/musicxml/MuxmlBlocks.h"

namespace brindle {

/// A part of a score: one player or one singer, as named in the score's list of parts.
struct CMuxmlPart {
    std::int32_t mPositionAsMidiTicks = kMuxmlUndef;
    std::int32_t mInstrumentCount = 0;
    std::string mID;
    std::string mPartName;
    std::string mPartNameDisplay;
    std::string mPartAbbreviation;
    std::string mPartAbbreviationDisplay;
    CMuxmlScoreInstruments mScoreInstruments;
    bool mHasStringInstrument = false;
    XmlNode mPartXML;

    /// The name to show, else the name, then the short forms likewise, then the first instrument's.
    [[nodiscard]] std::string FindBestPartName() const;

    static constexpr auto Fields() {
        return std::tuple(
            MuxmlField("mPositionAsMidiTicks", &CMuxmlPart::mPositionAsMidiTicks),
            MuxmlField("mInstrumentCount", &CMuxmlPart::mInstrumentCount),
            MuxmlField("mID", &CMuxmlPart::mID), MuxmlField("mPartName", &CMuxmlPart::mPartName),
            MuxmlField("mPartNameDisplay", &CMuxmlPart::mPartNameDisplay),
            MuxmlField("mPartAbbreviation", &CMuxmlPart::mPartAbbreviation),
            MuxmlField("mPartAbbreviationDisplay", &CMuxmlPart::mPartAbbreviationDisplay),
            MuxmlField("mScoreInstruments", &CMuxmlPart::mScoreInstruments),
            MuxmlField("mHasStringInstrument", &CMuxmlPart::mHasStringInstrument),
            MuxmlField("mPartXML", &CMuxmlPart::mPartXML));
    }
};

}  // namespace brindle
