// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmAnlsCenters.h"

#include <algorithm>
#include <iterator>
#include <utility>

namespace brindle {

namespace {

bool BelongsInto(const CHarmAnlsChordWithPos& chord, double smaller, double larger) {
    if (chord.mPosition == larger) return chord.IsUndef();
    return smaller <= chord.mPosition && chord.mPosition < larger;
}

/// Moves the chords of the range out of `from`, behind those of `to`.
void MoveChordsOfRange(CHarmAnlsChords& from, CHarmAnlsChords& to, double smaller, double larger) {
    const auto stop = std::find_if(
        from.begin(), from.end(), [larger](const auto& chord) { return chord.mPosition > larger; });
    auto kept = from.begin();
    for (auto chord = from.begin(); chord != stop; ++chord) {
        if (BelongsInto(*chord, smaller, larger)) {
            to.push_back(*chord);
        } else {
            *kept++ = *chord;
        }
    }
    from.erase(kept, stop);
}

CHarmAnlsCenter UndefCenterFor(const CHarmAnlsChords& chords) {
    CHarmAnlsCenter center;
    center.mPosition = chords.front().mPosition;
    return center;
}

void Insert(CHarmAnlsCenter& center, CHarmAnlsChords&& chords) {
    if (center.mChords.empty()) {
        center.mChords = std::move(chords);
        center.mChords.SortByPosition();
    } else {
        center.mChords.InsertAtCorrectPosition(chords.begin(), chords.end());
    }
}

/// Both return the iterator to the center that `it` pointed to.
CHarmAnlsCenters::iterator GiveToPreceding(CHarmAnlsCenters& centers, CHarmAnlsCenters::iterator it,
                                           CHarmAnlsChords&& chords) {
    if (chords.empty()) return it;
    if (it == centers.begin()) it = std::next(centers.insert(it, UndefCenterFor(chords)));
    Insert(*std::prev(it), std::move(chords));
    return it;
}

CHarmAnlsCenters::iterator GiveToFollowing(CHarmAnlsCenters& centers, CHarmAnlsCenters::iterator it,
                                           CHarmAnlsChords&& chords) {
    if (chords.empty()) return it;
    if (std::next(it) == centers.end()) {
        it = std::prev(centers.insert(centers.end(), UndefCenterFor(chords)));
    }
    Insert(*std::next(it), std::move(chords));
    return it;
}

}  // namespace

CHarmAnlsChords CHarmAnlsCenters::CollectAndEraseChordsFromSmallerUntilBeforeLarger(double smaller,
                                                                                    double larger) {
    CHarmAnlsChords collected;
    if (!(smaller < larger)) return collected;
    for (CHarmAnlsCenter& center : *this) {
        MoveChordsOfRange(center.mChords, collected, smaller, larger);
    }
    return collected;
}

CHarmAnlsCenters::iterator CHarmAnlsCenters::ChangeRangeOfHarmCenter(iterator it, double start,
                                                                     double end) {
    if (it == this->end()) return it;
    const double low = std::min(start, end);
    const double high = std::max(start, end);
    const auto next = std::next(it);
    const double oldStart = it->mPosition;
    const double oldEnd = next == this->end() ? kPosEnd : next->mPosition;
    if (low == oldStart && high == oldEnd) return it;

    it->mPosition = low;
    auto before = CollectAndEraseChordsFromSmallerUntilBeforeLarger(oldStart, low);
    auto inside = CollectAndEraseChordsFromSmallerUntilBeforeLarger(low, high);
    auto behind = CollectAndEraseChordsFromSmallerUntilBeforeLarger(high, oldEnd);
    it = GiveToPreceding(*this, it, std::move(before));
    Insert(*it, std::move(inside));
    return GiveToFollowing(*this, it, std::move(behind));
}

CHarmAnlsCenters::iterator CHarmAnlsCenters::CreateNewHarmCenterWithChordsAfterPos(iterator it,
                                                                                   double pos) {
    if (it == end()) return it;
    return GiveToFollowing(*this, it,
                           CollectAndEraseChordsFromSmallerUntilBeforeLarger(pos, kPosEnd));
}

}  // namespace brindle
