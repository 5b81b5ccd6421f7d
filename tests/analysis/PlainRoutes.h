// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsProgressions.h"
#include "brindle/analysis/CHarmAnlsSignKeys.h"
#include "brindle/analysis/TAnalyse.h"

#include <string>

namespace brindle::test {

/// The analysis of a chord list, each step done as it is described and nothing remembered, moved
/// or sorted for the sake of speed: the reference for the fast routes of the library. Costs the
/// square of the length of the list and more.
class CPlainAnalysis {
public:
    CHarmAnlsChords mChords;
    CHarmAnlsSignKeys mSignKeys;
    /// A walk through chords out of order added more centers than there are chords and was given
    /// up: the result means nothing.
    bool mIsEndless = false;

    void AnalyseFromChords(const CHarmAnlsChords& chords, const CHarmAnlsSignKeys& signKeys,
                           TAnalyse analyse);
    void Analyse(TAnalyse analyse);

private:
    void TonicRoute(const CHarmAnlsProgressions& progressions);
    void TonicWalk(CHarmAnlsSignKey& signKey, const CHarmAnlsProgressions& progressions);
    void CadenceWalk(CHarmAnlsSignKey& signKey, const CHarmAnlsProgressions& progressions);
    void WeightStep(CHarmAnlsSignKey& signKey);
    void MergeSignKeys();
    void MergeCenters(CHarmAnlsCenters& centers);
    void FillAndSetFunctions(CHarmAnlsSignKey& signKey);

    std::size_t mChordCount = 0;
};

/// All readings of a chord list as centers with their probabilities.
[[nodiscard]] CHarmAnlsCenters PlainBestResults(const CHarmAnlsChords& chords);

}  // namespace brindle::test
