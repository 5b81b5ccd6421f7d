// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/NameFingering.h"

#include "brindle/guitarchords/Tunings.h"
#include "brindle/neural/RootCostsByNet.h"
#include "brindle/theory/KeyIntervals.h"

#include <algorithm>

namespace brindle {
namespace {

// What players mind in a name beyond how common its chord is, in tenths of a bit. Checked on
// fingerings that people named, each half of the keys by itself.
constexpr int kCostOfSecondBelowSeventh = 12;  // a triad above the bass says it better: Em/A
constexpr int kCostOfFurtherOmission = 22;     // of each tone after the first
constexpr int kCostOfTurnedSuspension = 10;    // it is heard over its bass
constexpr int kCostOfUnstableRoot = 20;        // no bass holds a half-diminished chord: Dm6

bool IsTurned(const CChordLite& chord) {
    if (!chord.IsSlashChord()) return false;
    const int up = chord.mBassKeyEnh.mKeyNr - chord.mRootKeyEnh.mKeyNr;
    return chord.mSemitones.HasIntvl(FoldIntoOctave(up));
}

int CostForPlayers(const CNamedChord& name, bool bearsBass) {
    const auto has = [&](int tone) { return name.mChord.mSemitones.HasIntvl(tone); };
    const bool hasThird = has(3) || has(4);
    const bool isTurned = IsTurned(name.mChord);
    int cost = 0;
    if (!hasThird && !has(5) && has(2) && has(10) && !name.mChord.IsSlashChord()) {
        cost += kCostOfSecondBelowSeventh;
    }
    if (!hasThird && (has(2) || has(5)) && isTurned) cost += kCostOfTurnedSuspension;
    if (!bearsBass && has(3) && has(6) && has(10)) cost += kCostOfUnstableRoot;
    const auto omissions = static_cast<int>(name.mOmitted.size());
    return cost + kCostOfFurtherOmission * std::max(0, omissions - 1);
}

}  // namespace

std::vector<CNamedChord> NameFingering(std::span<const int> pitches, const GChShortTuning& tuning) {
    std::vector<CNote> notes;
    for (const int pitch : pitches) {
        if (pitch >= 0) notes.emplace_back(pitch, TEnh_Undef);
    }
    CNamingOptions options;
    options.mRootCosts = RootCostsByNet(notes);
    const bool bearsBass = BearsBass(tuning);
    if (!bearsBass) options.mBass = TBassUse::None;
    std::vector<CNamedChord> names = NameNotes(notes, options);
    for (CNamedChord& name : names) name.mCost += CostForPlayers(name, bearsBass);
    std::stable_sort(names.begin(), names.end(),
                     [](const CNamedChord& a, const CNamedChord& b) { return a.mCost < b.mCost; });
    return names;
}

}  // namespace brindle
