// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmCenterWeightAnalysis.h"
#include "brindle/analysis/CHarmonicAnalyse.h"

#include <cstddef>

namespace brindle {

namespace {

/// Gives the center the keys that its chords weigh most for. The last of them reaches to the end of
/// the piece: it takes the chords of all later centers, which stay in the list without chords.
CHarmAnlsCenters::iterator TakeHeaviestKeys(CHarmAnlsCenters& centers,
                                            CHarmAnlsCenters::iterator center) {
    CHarmAnlsCenters found;
    CHarmCenterWeightAnalysis().DetectHarmCentersFromChords(center->mChords, found);
    for (std::size_t i = 0; i < found.size(); ++i) {
        center->mHarmCenter = found[i].mHarmCenter;
        if (center->mPosition == kPosUndef) center->mPosition = found[i].mPosition;
        double end = kPosEnd;
        if (i + 1 < found.size()) {
            end = found[i + 1].mPosition;
            center = centers.CreateNewHarmCenterWithChordsAfterPos(center, end);
        }
        center = centers.ChangeRangeOfHarmCenter(center, found[i].mPosition, end);
    }
    return center;
}

}  // namespace

void CHarmonicAnalyse::_FindAndInsertHarmCentersUsingCenterWeightAnalysis(
    const CHarmCenterWeightAnalysisParams& /*params*/, TOnlyUndefCenters onlyUndef) {
    for (CHarmAnlsSignKey& signKey : mSignKeys) {
        CHarmAnlsCenters& centers = signKey.mHarmCenters;
        for (auto center = centers.begin(); center != centers.end(); ++center) {
            if (onlyUndef == TOnlyUndefCenters_Yes && !center->IsUndef()) continue;
            if (center->mChords.empty()) continue;
            center = TakeHeaviestKeys(centers, center);
            signKey.IfUndefFillWithHarmAnlsCenter(*center);
        }
    }
}

}  // namespace brindle
