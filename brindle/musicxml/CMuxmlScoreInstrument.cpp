// SPDX-License-Identifier: MIT
#include "brindle/musicxml/CMuxmlScoreInstrument.h"

#include "brindle/musicxml/XPathHelpers.h"

#include <algorithm>

namespace brindle {

std::string CMuxmlScoreInstrument::InstSoundGroup() const {
    const std::size_t point = mInstrumentSound.find('.');
    if (point == mInstrumentSound.npos) return {};
    return LowercaseString(mInstrumentSound.substr(0, point));
}

bool CMuxmlScoreInstrument::InstSoundGroupIsStrings() const {
    return InstSoundGroup().find("strings") != std::string::npos;
}

bool CMuxmlScoreInstrument::InstSoundGroupIsPitchedPrc() const {
    return InstSoundGroup().find("pitched-percussion") != std::string::npos;
}

bool CMuxmlScoreInstrument::InstSoundGroupIsPrc() const {
    return InstSoundGroup().find("percussion") != std::string::npos;
}

std::string CMuxmlScoreInstrument::InstSoundAndIfNotExistsYieldToBest() const {
    if (!mInstrumentSound.empty()) return mInstrumentSound;
    return mInstrumentName.empty() ? mInstrumentAbbreviation : mInstrumentName;
}

CMuxmlScoreInstruments::const_iterator CMuxmlScoreInstruments::FindForID(
    std::string_view id) const {
    return std::find_if(begin(), end(),
                        [&](const CMuxmlScoreInstrument& entry) { return entry.mID == id; });
}

CMuxmlScoreInstruments::const_iterator CMuxmlScoreInstruments::FindByInstNameOrAbbrevation(
    std::string_view name) const {
    return std::find_if(begin(), end(), [&](const CMuxmlScoreInstrument& entry) {
        return entry.mInstrumentName == name || entry.mInstrumentAbbreviation == name;
    });
}

}  // namespace brindle
