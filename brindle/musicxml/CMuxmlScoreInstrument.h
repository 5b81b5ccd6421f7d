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
    std::string mID;              ///< as in the list of parts, "P1-I1"
    std::string mInstrumentName;  ///< for people, "Violin"
    /// Its short name. Kept: read from `instrument-abbrevation`, which MusicXML spells with one
    /// more i, so that its files leave it empty.
    std::string mInstrumentAbbreviation;
    std::string mInstrumentSound;  ///< such as "strings.violin"
    XmlNode mXML;                  ///< the element `score-instrument`

    /// The sound up to its first point in lower case, "strings"; empty if there is no point.
    [[nodiscard]] std::string InstSoundGroup() const;
    /// Bowed strings; plucked ones such as guitars have a group of their own, "pluck".
    [[nodiscard]] bool InstSoundGroupIsStrings() const;
    /// Timpani, vibraphones and their like, "pitched-percussion".
    [[nodiscard]] bool InstSoundGroupIsPitchedPrc() const;
    /// True for pitched percussion, too.
    [[nodiscard]] bool InstSoundGroupIsPrc() const;
    /// The first of sound, name and abbreviation that is not empty.
    [[nodiscard]] std::string InstSoundAndIfNotExistsYieldToBest() const;

    /// By name, see CMuxmlField.
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
    /// By exact name or short name; the end position when there is none.
    [[nodiscard]] const_iterator FindByInstNameOrAbbrevation(std::string_view name) const;
};

}  // namespace brindle
