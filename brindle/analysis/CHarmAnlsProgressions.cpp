// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmAnlsProgressions.h"

#include "brindle/analysis/internal/NativeText.h"

#include <algorithm>
#include <ostream>

namespace brindle {

CHarmAnlsProgressions CHarmAnlsProgressions::FindAndSortMatchingProgressions(
    chord_iterator it, const CHarmAnlsChords& chords, TMatchDirection direction) const {
    switch (direction) {
        case TMatchDirection_Forward:
            return FindAndSortForwardMatchingProgressions(it, chords);
        case TMatchDirection_Backward:
            return FindAndSortBackwardMatchingProgressions(it, chords);
    }
    return {};
}

CHarmAnlsProgressions CHarmAnlsProgressions::FindAndSortForwardMatchingProgressions(
    chord_iterator it, const CHarmAnlsChords& chords) const {
    CHarmAnlsProgressions matches;
    for (const CHarmAnlsProgression& row : *this) {
        if (row.MatchesHarmChordsFrom(chords, it)) matches.push_back(row);
    }
    matches.SortBySizeAndPriority();
    return matches;
}

CHarmAnlsProgressions CHarmAnlsProgressions::FindAndSortBackwardMatchingProgressions(
    chord_iterator it, const CHarmAnlsChords& chords) const {
    CHarmAnlsProgressions matches;
    for (const CHarmAnlsProgression& row : *this) {
        if (row.MatchesHarmChordsBackwardsFrom(chords, it)) matches.push_back(row);
    }
    matches.SortBySizeAndPriority();
    return matches;
}

void CHarmAnlsProgressions::SortBySizeAndPriority() {
    std::stable_sort(
        begin(), end(), [](const CHarmAnlsProgression& a, const CHarmAnlsProgression& b) {
            return a.size() != b.size() ? a.size() > b.size() : a.mPriority > b.mPriority;
        });
}

bool CHarmAnlsProgressions::HasSeveralBestMatchingProgressions() const {
    return size() >= 2 && (*this)[0].MatchesAsGoodAs((*this)[1]);
}

CHarmAnlsProgressions CHarmAnlsProgressions::GetBestMatchingProgressions() const {
    CHarmAnlsProgressions best;
    for (const CHarmAnlsProgression& row : *this) {
        if (best.empty() || row.MatchesAsGoodAs(best.back())) best.push_back(row);
    }
    return best;
}

CHarmAnlsProgressions CHarmAnlsProgressions::SortAndGetBestMatchingProgressions() {
    SortBySizeAndPriority();
    return GetBestMatchingProgressions();
}

void CHarmAnlsProgressions::AppendJSONString(std::ostream& stream) const {
    NativeText::WriteList(stream, *this);
}

std::ostream& operator<<(std::ostream& stream, const CHarmAnlsProgressions& progressions) {
    progressions.AppendJSONString(stream);
    return stream;
}

}  // namespace brindle
