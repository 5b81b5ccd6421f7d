// SPDX-License-Identifier: MIT
// The root by points: each key gets points for every interval that the chord has above it, most for
// its root, fifth and thirds. A few chords in which other tones collect more are settled first.

#include "brindle/chords/CChordHeavy.h"
#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/NoteIntervals.h"

#include <array>
#include <boost/container/small_vector.hpp>
#include <span>

namespace brindle {

namespace {

using TPoints = std::array<int, 12>;

// Points of a tone by its distance above the candidate root, for chords of so many intervals.
// clang-format off
//                                        0  1  2   3   4  5  6   7  8  9  10  11
constexpr TPoints kPointsOfUpTo2      = { 3, 0, 0,  2,  2, 0, 0,  1, 0, 0,  2,  2};
constexpr TPoints kPointsOf3          = {18, 0, 2, 12, 12, 2, 2, 14, 1, 2,  5,  5};
constexpr TPoints kPointsOf4To6       = {18, 0, 3, 12, 12, 3, 3, 14, 0, 3,  3,  3};
constexpr TPoints kPointsOf0Or7AndMore = {18, 8, 8, 12, 12, 6, 5, 14, 4, 4, 10, 10};
// clang-format on

/// In chords of seven and more intervals the three lowest count four times.
constexpr std::size_t kLowIntvlCount = 3;
constexpr int kLowIntvlWeight = 4;

const TPoints& PointsFor(std::size_t intvlCount) {
    switch (intvlCount) {
        case 1:
        case 2:
            return kPointsOfUpTo2;
        case 3:
            return kPointsOf3;
        case 4:
        case 5:
        case 6:
            return kPointsOf4To6;
        default:
            return kPointsOf0Or7AndMore;
    }
}

/// A chord of exactly these intervals, in which one key has a fixed score.
struct CExactShape {
    std::array<int, 4> mIntvls;
    std::size_t mIntvlCount;
    int mRootAboveBass;  ///< semitones from the bass key up to that key
    int mScore;
    std::size_t mNoteCount;  ///< of the chord; 0 if it does not matter
};

// clang-format off
constexpr CExactShape kExactShapes[] = {
    // intervals    count  above bass  score  notes
    {{0, 6, 11},        3,          2,    33,     0},
    {{0, 4, 9, 10},     4,          0,    45,     0},
    {{0, 2, 6, 11},     4,          2,    45,     0},
    {{0, 3, 6, 10},     4,          0,    48,     0},
    {{0, 7},            2,          0,     5,     3},
};
// clang-format on

const CExactShape* ExactShapeOf(const CChordHeavy& chord) {
    for (const CExactShape& shape : kExactShapes) {
        const std::span<const int> intvls(shape.mIntvls.data(), shape.mIntvlCount);
        if (!chord.IntvlSet().HasExactTheseIntvls(intvls)) continue;
        const bool fits = shape.mNoteCount == 0 || shape.mNoteCount == chord.Notes().size();
        return fits ? &shape : nullptr;
    }
    return nullptr;
}

/// What the scores of all keys depend on.
class RootScores {
public:
    explicit RootScores(const CChordHeavy& chord)
        : mExactShape(ExactShapeOf(chord)), mBassKeyNr(chord.LowestNote().KeyNr()) {
        // A search for each interval; there are no more of them than the wrap interval.
        const int intvlCount = static_cast<int>(chord.IntvlSet().size());
        for (int ix = 0; ix < intvlCount; ++ix) mKeyNrs.push_back(chord.IntvlIxToKeyNr(ix));
    }

    [[nodiscard]] int Of(int keyNr) const {
        // Kept: the sum is not folded, so over a bass on A sharp or B the shape does not count.
        if (mExactShape != nullptr && keyNr == mBassKeyNr + mExactShape->mRootAboveBass) {
            return mExactShape->mScore;
        }
        const TPoints& points = PointsFor(mKeyNrs.size());
        const bool lowCountsMore = &points == &kPointsOf0Or7AndMore;
        int score = 0;
        for (std::size_t ix = 0; ix < mKeyNrs.size(); ++ix) {
            const int distance = AbsKeyIntvlFromTo(keyNr, mKeyNrs[ix]);
            if (distance == kIntvlUndef) continue;
            const int weight = lowCountsMore && ix < kLowIntvlCount ? kLowIntvlWeight : 1;
            score += points[static_cast<std::size_t>(distance)] * weight;
        }
        return score;
    }

private:
    boost::container::small_vector<int, 24> mKeyNrs;  ///< of the note at each interval
    const CExactShape* mExactShape;
    int mBassKeyNr;
};

}  // namespace

int CChordHeavy::ProbThatNoteIsRootNote(const CNote& note) const {
    return RootScores(*this).Of(note.KeyNr());
}

CNote CChordHeavy::_LikeliestRootByScore() const {
    const RootScores scores(*this);
    CNote best;
    best.SetEnhAndDontMakeSenseful(TEnh_n);
    int bestScore = 0;
    for (int keyNr = 0; keyNr < 12; ++keyNr) {
        const CNote candidate(keyNr, TEnh_n);
        const int score = scores.Of(keyNr);
        if (score < bestScore) continue;
        if (score == bestScore && !_WinsTie(candidate, best)) continue;
        best = candidate;
        bestScore = score;
    }
    return best;
}

bool CChordHeavy::_WinsTie(const CNote& candidate, const CNote& best) const {
    // Kept: the key number of an undefined best or root is used as it is.
    const auto isInChord = [this](const CNote& note) {
        return HasIntvl(FoldIntoOctave(note.KeyNr() - mRootNote.KeyNr()));
    };
    if (isInChord(best) != isInChord(candidate)) return isInChord(candidate);
    return KeyDistanceBetween(LowestNote(), candidate) < KeyDistanceBetween(LowestNote(), best);
}

}  // namespace brindle
