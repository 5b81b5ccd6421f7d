// SPDX-License-Identifier: MIT
// The keys that a song passes through: the path through the 24 keys with the most points. A chord
// gives points to the keys that it fits, a change of key costs points, so a key changes where a few
// chords together outweigh the change (Viterbi's algorithm).
//
// What a change costs depends on the steps between the signatures on the circle of fifths. So the
// points stand in the order of that circle, and the best way into a key is a maximum over
// neighbours, taken for several keys at once and without a branch. Only the way that is taken in
// the end has to be known: the points are kept at every 32nd chord and made again between two of
// those on the way back, which costs less than to note 24 ways a chord.

#include "brindle/analysis/internal/LocalKeys.h"

#include "brindle/analysis/internal/KeyChanges.h"
#include "brindle/analysis/internal/KeyCircle.h"

#include <algorithm>
#include <array>
#include <bit>
#include <cmath>

namespace brindle {
namespace {

constexpr std::size_t kChordsPerBlock = 32;
constexpr double kShortestInBars = 1.0 / 16;
constexpr double kLongestInBars = 4.0;
// What the seventh chords on I and IV gain at home in a blues, where they are at rest.
constexpr double kBluesPoints = 2.7;

/// The points of the next chord: the better of staying in a key and of a change into it.
void StepOn(const CPointsOfKeys& changed, const CPointsOfKeys& gains, CPointsOfKeys& best) {
    for (std::size_t i = 0; i < kFifths; ++i) {
        best.mMajor[i] = gains.mMajor[i] + LargerPoints(best.mMajor[i], changed.mMajor[i]);
    }
    for (std::size_t i = 0; i < kFifths; ++i) {
        best.mMinor[i] = gains.mMinor[i] + LargerPoints(best.mMinor[i], changed.mMinor[i]);
    }
}

// One root of the fourth and not two square ones: rounded once, it leaves equal sums equal.
double Weight(double beats, double beatsPerBar) {
    return std::pow(std::clamp(beats / beatsPerBar, kShortestInBars, kLongestInBars), 0.25);
}

std::vector<double> WeightsOf(std::span<const CKeyChord> chords, double beatsPerBar) {
    std::vector<double> weights;
    weights.reserve(chords.size());
    for (std::size_t i = 0; i < chords.size(); ++i) {
        const bool isSame = i > 0 && chords[i].mBeats == chords[i - 1].mBeats;
        weights.push_back(isSame ? weights.back() : Weight(chords[i].mBeats, beatsPerBar));
    }
    return weights;
}

bool IsBluesChord(const CKeyChord& chord, int home) {
    const int degree = DegreeInKey(chord.mRoot, home);
    return chord.mClass == TKeyChordClass_Dom && (degree == 0 || degree == 5);
}

/// The path with the most points through the keys.
class CKeyPath {
public:
    CKeyPath(std::span<const CKeyChord> chords, std::span<const TKeyChordKind> kinds,
             const CSongTraits& traits, const CKeyOptions& options)
        : mChords(chords),
          mKinds(kinds),
          mTraits(traits),
          mHomeBonus(options.mHomeBonus),
          mWeights(WeightsOf(chords, options.mBeatsPerBar)),
          mCosts(options.mChangeCost) {}

    std::vector<std::uint8_t> Find() {
        const std::size_t last = mChords.size() - 1;
        int key = BestKey(BestAtEnd());
        std::vector<std::uint8_t> keys(mChords.size());
        keys[last] = static_cast<std::uint8_t>(key);
        for (std::size_t ix = last; ix-- > 0;) {
            key = KeyBefore(key, WayAt(ix));
            keys[ix] = static_cast<std::uint8_t>(key);
        }
        return keys;
    }

private:
    [[nodiscard]] CPointsOfKeys GainsAt(std::size_t ix) const {
        const CKeyChord& chord = mChords[ix];
        const double weight = mWeights[ix];
        const double* major = mTable.RowOf(0, mKinds[ix], chord.mRoot);
        const double* minor = mTable.RowOf(1, mKinds[ix], chord.mRoot);
        CPointsOfKeys gains;
        for (std::size_t i = 0; i < kFifths; ++i) gains.mMajor[i] = weight * major[i];
        for (std::size_t i = 0; i < kFifths; ++i) gains.mMinor[i] = weight * minor[i];
        double& home = gains.Of(mTraits.mHome);
        if (mTraits.mIsBlues && IsBluesChord(chord, mTraits.mHome)) {
            home = std::max(home, weight * kBluesPoints);
        }
        home += weight * mHomeBonus;
        return gains;
    }

    CPointsOfKeys BestAtEnd() {
        mBlockStarts.reserve(mChords.size() / kChordsPerBlock + 1);
        CPointsOfKeys best = GainsAt(0);
        CPointsOfKeys changed;
        for (std::size_t ix = 0; ix < mChords.size(); ++ix) {
            if (ix > 0) {
                ChangeKeys(best, mCosts, changed);
                StepOn(changed, GainsAt(ix), best);
            }
            if (ix % kChordsPerBlock == 0) mBlockStarts.push_back(best);
        }
        return best;
    }

    /// The points at a chord, and those that a change behind it would leave.
    struct CWay {
        CPointsOfKeys mBest;
        CPointsOfKeys mChanged;
    };

    const CWay& WayAt(std::size_t ix) {
        const std::size_t block = ix / kChordsPerBlock;
        if (block != mBlock) MakeBlock(block);
        return mWays[ix % kChordsPerBlock];
    }

    void MakeBlock(std::size_t block) {
        mBlock = block;
        const std::size_t begin = block * kChordsPerBlock;
        const std::size_t count = std::min(kChordsPerBlock, mChords.size() - begin);
        CPointsOfKeys best = mBlockStarts[block];
        for (std::size_t i = 0; i < count; ++i) {
            if (i > 0) StepOn(mWays[i - 1].mChanged, GainsAt(begin + i), best);
            mWays[i].mBest = best;
            ChangeKeys(best, mCosts, mWays[i].mChanged);
        }
    }

    // Of equal keys the lowest.
    [[nodiscard]] static int BestKey(const CPointsOfKeys& best) {
        int found = 0;
        for (int key = 1; key < kKeyCount; ++key) {
            if (best.Of(key) > best.Of(found)) found = key;
        }
        return found;
    }

    // The key from which the best way leads into `key`, and of equal ones that itself, or the
    // lowest. All keys are compared at once, since no branch could be foreseen.
    [[nodiscard]] int KeyBefore(int key, const CWay& way) const {
        const double changed = way.mChanged.Of(key);
        if (!(changed > way.mBest.Of(key))) return key;
        const auto [fromMajor, fromMinor] = mCosts.Into(key);
        std::uint32_t found = 0;
        for (std::size_t i = 0; i < kFifths; ++i) {
            const bool isMajor = way.mBest.mMajor[i] - fromMajor[i] == changed;
            const bool isMinor = way.mBest.mMinor[i] - fromMinor[i] == changed;
            found |= std::uint32_t{isMajor} << i | std::uint32_t{isMinor} << (i + kFifths);
        }
        int before = found == 0 ? key : kKeyCount;
        for (; found != 0; found &= found - 1) {
            before = std::min(before, KeyAtPlace(std::countr_zero(found)));
        }
        return before;
    }

    std::span<const CKeyChord> mChords;
    std::span<const TKeyChordKind> mKinds;
    const CSongTraits& mTraits;
    double mHomeBonus;
    std::vector<double> mWeights;
    CChangeCosts mCosts;
    CGainTable mTable;
    std::vector<CPointsOfKeys> mBlockStarts;
    std::array<CWay, kChordsPerBlock> mWays;
    std::size_t mBlock = static_cast<std::size_t>(-1);
};

bool IsSecondDegree(const CKeyChord& chord, int key) {
    return (chord.mClass == TKeyChordClass_Min7 || chord.mClass == TKeyChordClass_HDim) &&
           DegreeInKey(chord.mRoot, key) == 2;
}

bool IsDominant(const CKeyChord& chord, int key) {
    return chord.mClass == TKeyChordClass_Dom && DegreeInKey(chord.mRoot, key) == 7;
}

// A II before the dominant of a new key already belongs to it: Fm7 in C Fm7 Bb7 Eb.
void MovePivots(std::span<const CKeyChord> chords, std::vector<std::uint8_t>& keys) {
    for (std::size_t i = keys.size() - 1; i-- > 1;) {
        const std::uint8_t next = keys[i + 1];
        if (keys[i] != next && IsDominant(chords[i + 1], next) && IsSecondDegree(chords[i], next)) {
            keys[i] = next;
        }
    }
}

}  // namespace

std::vector<std::uint8_t> LocalKeys(std::span<const CKeyChord> chords,
                                    std::span<const TKeyChordKind> kinds, const CSongTraits& traits,
                                    const CKeyOptions& options) {
    if (chords.empty()) return {};
    std::vector<std::uint8_t> keys = CKeyPath(chords, kinds, traits, options).Find();
    MovePivots(chords, keys);
    return keys;
}

std::size_t CountRuns(std::span<const std::uint8_t> keys) {
    std::size_t count = keys.empty() ? 0 : 1;
    for (std::size_t i = 1; i < keys.size(); ++i) {
        if (keys[i] != keys[i - 1]) ++count;
    }
    return count;
}

}  // namespace brindle
