// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsCenters.h"

#include <cstdint>
#include <iosfwd>

namespace brindle {

/// Settings of the weight analysis, and whether its last result was ambiguous.
struct CHarmCenterWeightAnalysisParams {
    /// Not 0: the keys are weighed but none is chosen.
    std::int32_t mNoSelection = 0;
    /// 0: the major keys. 1: major and minor keys. Anything else: no key.
    std::int32_t mKeysToWeigh = 1;
    /// Result: the heaviest key has a rival of the same weight with another number of signs.
    bool mAmbiguous = false;
};

/// Finds the key of a list of chords by weight: each key collects the lengths of the chords that
/// fit it, a little more where the chord stands on its tonic, and the heaviest key wins.
class CHarmCenterWeightAnalysis : public CHarmCenterWeightAnalysisParams {
public:
    CHarmCenterWeightAnalysis() = default;
    /// An analysis with these settings.
    explicit CHarmCenterWeightAnalysis(const CHarmCenterWeightAnalysisParams& params)
        : CHarmCenterWeightAnalysisParams(params) {}

    /// Replaces `centers` with the found center (without chords), or with nothing for an empty
    /// list. Lengths are counted in beats from chord to chord, the last chord's as 1. At equal
    /// weight major goes before minor, and the lower key number before the higher.
    void DetectHarmCentersFromChords(const CHarmAnlsChords& chords, CHarmAnlsCenters& centers);
};

/// Kept: writes one fixed line, without the settings.
std::ostream& operator<<(std::ostream& stream, const CHarmCenterWeightAnalysis& analysis);

}  // namespace brindle
