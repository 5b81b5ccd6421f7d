// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/NameFingering.h"
#include "brindle/neural/RootCostsByNet.h"

#include <algorithm>

namespace brindle {

bool IsReentrant(const GChShortTuning& tuning) {
    const std::vector<int> pitches = GChPitchArrayFromShortTuning(tuning);
    return !std::is_sorted(pitches.begin(), pitches.end());
}

std::vector<CNamedChord> NameFingering(std::span<const int> pitches, const GChShortTuning& tuning) {
    std::vector<CNote> notes;
    for (const int pitch : pitches) {
        if (pitch >= 0) notes.emplace_back(pitch, TEnh_Undef);
    }
    CNamingOptions options;
    options.mRootCosts = RootCostsByNet(notes);
    if (IsReentrant(tuning)) options.mBass = TBassUse::None;
    return NameNotes(notes, options);
}

}  // namespace brindle
