// SPDX-License-Identifier: MIT
// A chord fits a stretch of music better the more of it belongs to the chord, and the more of the
// chord sounds. Notes that do not belong cost by how long they sound, tones that do not sound by
// how much the chord needs them; a bass that is foreign to the chord is no such note, as in C/D.
// How rare the chord is over that bass and in the key is counted as NameNotes does.
#include "brindle/musicxml/internal/WindowChords.h"

#include <algorithm>
#include <cmath>

namespace brindle {
namespace {

constexpr double kForeignShare = 200.0;  // of all that sounds
constexpr int kCostOfForeignNote = 6;
constexpr int kCostOfForeignBass = 17;
constexpr int kCostOfBassAtMost = 100;
constexpr int kCostOfNoRoot = 45;
constexpr int kCostOfNoThird = 50;
constexpr int kCostOfNoFifth = 12;
constexpr int kCostOfNoExtension = 5;
constexpr int kNoOther = 45;

int CostOfMissing(const CNamingType& type, int tone) {
    if (tone == 0) return kCostOfNoRoot;
    if (HasTone(type.mOptional, tone)) return kCostOfNoExtension;
    if (tone == type.mThird) return kCostOfNoThird;
    return tone == 7 && !type.mIsPlainSixth ? kCostOfNoFifth : kNoOther;
}

int CostInKey(int root, TToneMask tones, const CSignKeyLite& key) {
    if (key.IsUndef()) return 0;
    const bool isMinor = key.mSignKeyType == TSignKeyType_Minor;
    const auto degree = static_cast<std::size_t>(FoldIntoOctave(root - key.mRootKeyEnh.mKeyNr));
    return (isMinor ? kMinorKeyCosts : kMajorKeyCosts)[NamingFamilyOf(tones)][degree] * 4 / 10;
}

}  // namespace

int CostOfWindowChord(const CNoteWindow& window, int root, std::size_t type,
                      const CSignKeyLite& key) {
    const CNamingType& made = kNamingTypes[type];
    const CNamingTypeRow& row = kNamingTypeRows[type];
    const int bass = FoldIntoOctave(window.mBass - root);
    const int overBass = row.mCostOverBass[static_cast<std::size_t>(bass)];
    int cost = std::min(overBass, row.mCost + kCostOfBassAtMost) * 4 / 10;
    double foreign = 0.0;
    for (int tone = 0; tone < 12; ++tone) {
        const double share = window.mShares[static_cast<std::size_t>((root + tone) % 12)];
        if (HasTone(made.mTones, tone)) {
            if (share <= 0.0) cost += CostOfMissing(made, tone);
        } else if (share > 0.0) {
            if (tone != bass) foreign += share;
            cost += tone == bass ? kCostOfForeignBass : kCostOfForeignNote;
        }
    }
    return cost + static_cast<int>(std::lround(foreign * kForeignShare)) +
           CostInKey(root, made.mTones, key);
}

std::vector<CWindowChord> LikeliestChords(const CNoteWindow& window, const CSignKeyLite& key,
                                          std::size_t count) {
    std::vector<CWindowChord> chords;
    chords.reserve(12 * kNamingTypes.size());
    for (int root = 0; root < 12; ++root) {
        for (std::size_t type = 0; type < kNamingTypes.size(); ++type) {
            chords.push_back({CostOfWindowChord(window, root, type, key), root, type});
        }
    }
    const auto end = chords.begin() + static_cast<std::ptrdiff_t>(std::min(count, chords.size()));
    std::partial_sort(chords.begin(), end, chords.end());
    chords.erase(end, chords.end());
    return chords;
}

CNamingCandidate CandidateOf(const CWindowChord& chord, const CNoteWindow& window) {
    const int rootAboveBass = FoldIntoOctave(chord.mRoot - FoldIntoOctave(window.mBass));
    return {.mCost = chord.mCost,
            .mIsInverted = rootAboveBass != 0,
            .mType = static_cast<int>(chord.mType),
            .mRootAboveBass = rootAboveBass,
            .mRoot = chord.mRoot,
            .mTones = kNamingTypes[chord.mType].mTones};
}

}  // namespace brindle
