// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/internal/FingeringCost.h"

#include <algorithm>
#include <array>

namespace brindle {
namespace {

// On the scale of the effort of a hand. Fitted to guitar and ukulele fingerings that people wrote
// down, and rounded. Mutes and the bass weigh most: without them far fewer of ours are theirs.
constexpr int kCostOfPosition = 55;    // each fret from the nut to the lowest finger
constexpr int kCostOfHighFret = 60;    // each fret beyond the third
constexpr int kCostOfFarOpen = 200;    // each fret beyond the fourth above open strings
constexpr int kCostOfOpenString = 40;  // it rings on when the hand moves
constexpr int kCostOfOmittedTone = 150;
constexpr int kCostOfOmittedRoot = 600;
constexpr int kCostOfOtherBass = 320;
constexpr int kCostOfSilentTreble = 150;
constexpr int kSavedByHand = 40;  // a hand without open strings lies over those it mutes
constexpr int kCostOfSilentBass = 35;
constexpr int kCostOfThinChord = 450;  // each bass string beyond two that is silent
constexpr int kCostOfSilentInside = 150;
constexpr int kCostOfSilentOfFew = 250;  // each, where there are few strings
constexpr int kFewStrings = 5;
constexpr int kCostOfNeedlessMute = 80;  // the open string is a tone of the chord
constexpr int kCostOfUnison = 30;        // two strings at the same pitch

bool HasOpen(std::span<const std::int8_t> frets) {
    return std::find(frets.begin(), frets.end(), 0) != frets.end();
}

int CostOfPlace(const CFingering& fingering) {
    const auto frets = fingering.Frets();
    const int highest = *std::max_element(frets.begin(), frets.end());
    int cost = kCostOfPosition * std::max(0, fingering.Position() - 1);
    cost += kCostOfHighFret * std::max(0, highest - 3);
    cost += kCostOfOpenString * static_cast<int>(std::count(frets.begin(), frets.end(), 0));
    return HasOpen(frets) ? cost + kCostOfFarOpen * std::max(0, highest - 4) : cost;
}

int CostOfSilence(const CFingering& fingering) {
    const auto frets = fingering.Frets();
    const auto sounds = [](int fret) { return fret >= 0; };
    const auto first = std::find_if(frets.begin(), frets.end(), sounds) - frets.begin();
    const auto treble = std::find_if(frets.rbegin(), frets.rend(), sounds) - frets.rbegin();
    const auto silent = std::count(frets.begin(), frets.end(), kMutedString);
    const int ofTreble = kCostOfSilentTreble - (HasOpen(frets) ? 0 : kSavedByHand);
    const bool areFew = fingering.mStringCount <= kFewStrings;
    return (areFew ? kCostOfSilentOfFew * static_cast<int>(silent) : 0) +
           ofTreble * static_cast<int>(treble) + kCostOfSilentBass * static_cast<int>(first) +
           kCostOfThinChord * std::max(0, static_cast<int>(first) - 2) +
           kCostOfSilentInside * static_cast<int>(silent - first - treble);
}

int CostOfMutes(const CFingering& fingering, const CFingeringTask& task) {
    int cost = 0;
    int lowest = kHighestMidi;
    for (int string = 0; string < task.mStrings; ++string) {
        const int pitch = fingering.Pitch(string);
        if (pitch >= 0) lowest = std::min(lowest, pitch);
    }
    for (int string = 0; string < task.mStrings; ++string) {
        const auto at = static_cast<std::size_t>(string);
        const bool mayRing = task.KeyAt(string, 0) == task.mBass ||
                             (task.Allows(string, 0) && task.mTuning[at] + task.mCapo > lowest);
        if (fingering.Pitch(string) < 0 && mayRing) cost += kCostOfNeedlessMute;
    }
    return cost;
}

int CostOfUnisons(const CFingering& fingering) {
    int cost = 0;
    std::array<bool, kHighestMidi + 1> hasSounded{};
    for (int string = 0; string < fingering.mStringCount; ++string) {
        const int pitch = fingering.Pitch(string);
        if (pitch < 0) continue;
        auto& isUnison = hasSounded[static_cast<std::size_t>(pitch)];
        if (isUnison) cost += kCostOfUnison;
        isUnison = true;
    }
    return cost;
}

}  // namespace

int CostOfFingering(const CFingering& fingering, const CFingeringTask& task, int effort) {
    int cost = effort + CostOfPlace(fingering) + CostOfSilence(fingering) +
               CostOfMutes(fingering, task) + CostOfUnisons(fingering);
    const bool anyBass = !task.mBassCounts || (task.mBass == task.mRoot && task.mIsSymmetric);
    if (!anyBass && !fingering.mBassIsLowest) cost += kCostOfOtherBass;
    cost += kCostOfOmittedTone * fingering.mOmitted.size();
    if (fingering.mOmitted.HasIntvl(0)) cost += kCostOfOmittedRoot - kCostOfOmittedTone;
    return cost;
}

}  // namespace brindle
