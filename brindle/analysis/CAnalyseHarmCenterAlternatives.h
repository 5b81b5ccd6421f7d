// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsCenterAlternatives.h"
#include "brindle/analysis/CHarmAnlsCenters.h"
#include "brindle/analysis/CHarmAnlsProgressions.h"

namespace brindle {

/// All readings of a chord list that the tonic progressions allow: C F can be the first step out
/// of C, or lead to F. Each reading is a center over a range of chords with a probability.
class CAnalyseHarmCenterAlternatives {
public:
    /// Copies the chords and analyses them.
    explicit CAnalyseHarmCenterAlternatives(const CHarmAnlsChords& chords);
    /// The readings point into the object's own chords.
    CAnalyseHarmCenterAlternatives(const CAnalyseHarmCenterAlternatives&) = delete;
    CAnalyseHarmCenterAlternatives& operator=(const CAnalyseHarmCenterAlternatives&) = delete;

    /// The chords that were given; the readings point into them.
    CHarmAnlsChords mChords;
    /// The tonic progressions that are looked for.
    CHarmAnlsProgressions mProgressions;
    /// The result.
    CHarmAnlsCenterAlternatives mAlternatives;

    /// Finds the readings anew.
    void AnalyseResult();
    /// The centers of all readings, with their chords, in the order in which they were found.
    [[nodiscard]] CHarmAnlsCenters BestResults() const;
    /// Appends the centers of a reading, each with the reading's probability.
    void _StoreAlternativeInResult(const CHarmAnlsCenterAlternative& alternative,
                                   CHarmAnlsCenters& centers) const;

private:
    void _AnalyseSingleChord();
    void _AnalyseSeveralChords();
};

}  // namespace brindle
