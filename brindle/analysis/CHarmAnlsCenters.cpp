// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmAnlsCenters.h"

#include "brindle/analysis/internal/MergeAdjacent.h"
#include "brindle/analysis/internal/NativeText.h"

namespace brindle {

namespace {

void AppendChords(CHarmAnlsCenter& first, const CHarmAnlsCenter& second) {
    first.mChords.insert(first.mChords.end(), second.mChords.begin(), second.mChords.end());
}

/// How long the center holds, in beats. The last one ends where its chords end.
double LengthOf(const CHarmAnlsCenters& centers, std::size_t index) {
    const CHarmAnlsCenter& center = centers[index];
    if (index + 1 < centers.size()) return centers[index + 1].mPosition - center.mPosition;
    return center.mChords.empty() ? 1.0 : center.mChords.LastChordEndPos() - center.mPosition;
}

}  // namespace

// Think of a table of all centers with the time that each one holds: the 24 major and minor keys
// at 0 and the centers of the list, ordered as CHarmCenterLite. Kept: its entries are compared by
// center and not by time, so the entry that sorts last always wins, and its time only tells whether
// there is a result. B major is the last of the 24 keys.
CHarmCenterLite CHarmAnlsCenters::FindMostOccurentHarmCenter() const {
    CHarmCenterLite last({11, TEnh_n}, kSemitonesMajor);
    double length = 0.0;
    for (std::size_t i = 0; i < size(); ++i) {
        const CHarmAnlsCenter& center = (*this)[i];
        if (center.IsUndef() || center.mPosition == kPosUndef || center.mHarmCenter < last) {
            continue;
        }
        if (last < center.mHarmCenter) {
            last = center.mHarmCenter;
            length = 0.0;
        }
        length += LengthOf(*this, i);
    }
    return length != 0.0 ? last : CHarmCenterLite_Undef;
}

void CHarmAnlsCenters::MergeAdjacentSameHarmCenters() {
    MergeAdjacent(
        *this,
        [](const CHarmAnlsCenter& a, const CHarmAnlsCenter& b) {
            return a.mHarmCenter == b.mHarmCenter;
        },
        AppendChords);
}

CHarmAnlsCenters::iterator CHarmAnlsCenters::_MergeHarmCentersAndEraseSecond(iterator first,
                                                                             iterator second) {
    AppendChords(*first, *second);
    return erase(second);
}

void CHarmAnlsCenters::AppendJSONString(std::ostream& stream) const {
    NativeText::WriteList(stream, *this);
}

}  // namespace brindle
