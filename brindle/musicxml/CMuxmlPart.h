// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/CMuxmlScoreInstrument.h"
#include "brindle/musicxml/MuxmlBlocks.h"

namespace brindle {

/// A part of a score: one player or one singer, as named in the score's list of parts.
struct CMuxmlPart {
    /// In ticks; 0, as each part counts from its own start.
    std::int32_t mPositionAsMidiTicks = kMuxmlUndef;
    std::int32_t mInstrumentCount = 0;  ///< 0: nothing counts them, see mScoreInstruments
    std::string mID;                    ///< as in the list of parts, "P1"
    /// "Clarinet in Bb"; this and the next three are empty where the list tells none
    std::string mPartName;
    std::string mPartNameDisplay;   ///< the name as it is printed, with signs of its own for flats
    std::string mPartAbbreviation;  ///< from the second system on, "Cl."
    std::string mPartAbbreviationDisplay;  ///< the short form as it is printed
    /// Those whose identifiers contain that of the part: P1 gets those of P10, too.
    CMuxmlScoreInstruments mScoreInstruments;
    /// Whether the sound of one of them is in the group "strings".
    bool mHasStringInstrument = false;
    /// The first `part` with this identifier; empty without one.
    XmlNode mPartXML;

    /// The name to show, else the name, then the short forms likewise, then the first instrument's.
    [[nodiscard]] std::string FindBestPartName() const;

    /// By name, see CMuxmlField.
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
