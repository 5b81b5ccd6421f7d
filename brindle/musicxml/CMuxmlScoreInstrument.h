// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/MuxmlFields.h"
#include "brindle/platform/XmlDocument.h"

#include <string>
#include <string_view>
#include <vector>

namespace brindle {

/// An instrument that plays in a part.
struct CMuxmlScoreInstrument {
    std::string mID;
    std::string mInstrumentName;
    std::string mInstrumentAbbreviation;
    std::string mInstrumentSound;  ///< such as "strings.violin"
    XmlNode mXML;

    /// The sound up to its first point in lower case, "strings"; empty if there is no point.
    [[nodiscard]] std::string InstSoundGroup() const;
    [[nodiscard]] bool InstSoundGroupIsStrings() const;
    [[nodiscard]] bool InstSoundGroupIsPitchedPrc() const;
    /// True for pitched percussion, too.
    [[nodiscard]] bool InstSoundGroupIsPrc() const;
    /// The first of sound, name and abbreviation that is not empty.
    [[nodiscard]] std::string InstSoundAndIfNotExistsYieldToBest() const;

    static constexpr auto Fields() {
        return std::tuple(
            MuxmlField("mID", &CMuxmlScoreInstrument::mID),
            MuxmlField("mInstrumentName", &CMuxmlScoreInstrument::mInstrumentName),
            MuxmlField("mInstrumentAbbreviation", &CMuxmlScoreInstrument::mInstrumentAbbreviation),
            MuxmlField("mInstrumentSound", &CMuxmlScoreInstrument::mInstrumentSound),
            MuxmlField("mXML", &CMuxmlScoreInstrument::mXML));
    }
};

/// The instruments of a part in the order of the file.
struct CMuxmlScoreInstruments : std::vector<CMuxmlScoreInstrument> {
    using std::vector<CMuxmlScoreInstrument>::vector;

    /// The end position when there is none.
    [[nodiscard]] const_iterator FindForID(std::string_view id) const;
    [[nodiscard]] const_iterator FindByInstNameOrAbbrevation(std::string_view name) const;
};

}  // namespace brindle
