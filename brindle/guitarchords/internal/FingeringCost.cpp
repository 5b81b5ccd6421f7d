// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/internal/FingeringCost.h"

#include "brindle/theory/KeyIntervals.h"

#include <algorithm>
#include <array>

namespace brindle {
namespace {

// Weights of what players mind, fitted to half of a collection of guitar and ukulele fingerings
// that people wrote down, checked on the other half, and rounded.

// The hand. Who chooses a fingering minds a barre less than it works: it can be moved and damped.
constexpr int kCostOfFinger = 40;
constexpr int kCostOfBarre = 45;
constexpr int kCostOfBentBarre = 320;  // that must not touch the string above it
constexpr int kCostOfHalfStretch = 30;
constexpr int kCostOfExtraWidth = 80;

// The neck.
constexpr int kCostOfPosition = 55;    // each fret from the nut to the lowest finger
constexpr int kCostOfHighFret = 85;    // each fret beyond the third
constexpr int kCostOfFarOpen = 280;    // each fret beyond the fourth above open strings
constexpr int kCostOfOpenString = 40;  // it rings on when the hand moves
constexpr int kCostOfAnyOpen = 10;     // the shape cannot be moved

// Tones.
constexpr int kCostOfOmittedTone = 230;
constexpr int kCostOfOmittedRoot = 600;
constexpr int kCostOfOtherBass = 340;
constexpr int kCostOfAnyBass = 200;      // where each tone may be the root
constexpr int kCostOfDoubledTone = 125;  // that is no root, third or fifth
// Elevenths and thirteenths have nearly a whole scale, more than a hand holds, and are told apart
// only by their bass; the eleventh rubs on a major third.
constexpr int kTonesOfScale = 6;
constexpr int kCostOfTonesOutOfScale = 60;
constexpr int kCostOfOtherBassOfScale = 900;
constexpr int kCostOfRubbingEleventh = 300;
constexpr int kCostOfDoubledBass = 150;  // that is foreign to its chord, beside that

// Strings that do not sound.
constexpr int kCostOfSilentTreble = 150;
constexpr int kSavedByHand = 60;  // a hand without open strings lies over those it mutes
constexpr int kCostOfSilentBass = 15;
constexpr int kCostOfThinChord = 480;  // each bass string beyond two that is silent
constexpr int kCostOfThreeStrings = 100;
constexpr int kFewestOfChord = 4;
constexpr int kCostOfSilentInside = 290;
constexpr int kCostOfSilentOfFew = 250;  // each, where there are few strings
constexpr int kFewStrings = 5;
constexpr int kCostOfNeedlessMute = 80;  // the open string is a tone of the chord
constexpr int kCostOfMutedBass = 160;    // it is the bass

constexpr int kMinorThird = 3;
constexpr int kMajorThird = 4;
constexpr int kPerfectFourth = 5;
constexpr int kPerfectFifth = 7;

CShapeCounts CountsOf(std::span<const std::int8_t> frets) {
    CShapeCounts shape;
    int mutes = 0;
    bool hasSounded = false;
    for (const int fret : frets) {
        if (fret < 0) {
            ++mutes;
            continue;
        }
        (hasSounded ? shape.mSilentInside : shape.mSilentBass) += mutes;
        mutes = 0;
        hasSounded = true;
        shape.mOpen += fret == 0 ? 1 : 0;
        shape.mHighest = std::max(shape.mHighest, fret);
        const bool isLower = shape.mPosition == 0 || fret < shape.mPosition;
        if (fret > 0 && isLower) shape.mPosition = fret;
    }
    return shape;
}

/// Strings that do not sound, beside those that LeastCostOf counts.
int CostOfSilence(const CFingering& fingering, const CShapeCounts& shape) {
    const auto frets = fingering.Frets();
    const auto silent =
        static_cast<int>(std::count(frets.begin(), frets.end(), std::int8_t{kMutedString}));
    const int treble = silent - shape.mSilentBass - shape.mSilentInside;
    int cost = treble * (kCostOfSilentTreble - (shape.mOpen > 0 ? 0 : kSavedByHand));
    if (fingering.mStringCount - silent < kFewestOfChord) cost += kCostOfThreeStrings;
    return fingering.mStringCount > kFewStrings ? cost : cost + kCostOfSilentOfFew * silent;
}

int CostOfMutes(const CFingering& fingering, const CFingeringTask& task) {
    int cost = 0;
    int lowest = kHighestMidi;
    for (int string = 0; string < task.mStrings; ++string) {
        const int pitch = fingering.Pitch(string);
        if (pitch >= 0) lowest = std::min(lowest, pitch);
    }
    for (int string = 0; string < task.mStrings; ++string) {
        if (fingering.Pitch(string) >= 0) continue;
        const int open = task.mTuning[static_cast<std::size_t>(string)] + task.mCapo;
        if (task.KeyAt(string, 0) == task.mBass) {
            cost += kCostOfMutedBass;
        } else if (task.Allows(string, 0) && open > lowest) {
            cost += kCostOfNeedlessMute;
        }
    }
    return cost;
}

/// Of a tone above the root for each string that sounds it again.
int CostOfDoubling(int tone, const CFingeringTask& task) {
    const bool isOfChord = task.mSemitones.HasIntvl(tone);
    const bool isThird = tone == kMinorThird || tone == kMajorThird;
    int cost = isOfChord ? 0 : kCostOfDoubledBass;
    const bool mayBeDoubled = tone == 0 || tone == kPerfectFifth || (isThird && isOfChord);
    return mayBeDoubled ? cost : cost + kCostOfDoubledTone;
}

int CostOfDoubledTones(const CFingering& fingering, const CFingeringTask& task) {
    int cost = 0;
    std::array<bool, 12> hasSounded{};
    for (int string = 0; string < fingering.mStringCount; ++string) {
        const int pitch = fingering.Pitch(string);
        if (pitch < 0) continue;
        const int tone = FoldIntoOctave(pitch - task.mRoot);
        auto& isDoubled = hasSounded[static_cast<std::size_t>(tone)];
        if (isDoubled) cost += CostOfDoubling(tone, task);
        isDoubled = true;
    }
    return cost;
}

int CostOfOtherBass(const CFingeringTask& task) {
    if (task.mSemitones.size() >= kTonesOfScale) return kCostOfOtherBassOfScale;
    const bool isAnyBass = task.mBass == task.mRoot && task.mIsSymmetric;
    return isAnyBass ? kCostOfAnyBass : kCostOfOtherBass;
}

int CostOfOmissions(const CFingering& fingering, const CFingeringTask& task) {
    const bool isRootOut = fingering.mOmitted.HasIntvl(0);
    const int others = fingering.mOmitted.size() - (isRootOut ? 1 : 0);
    const int cost = isRootOut ? kCostOfOmittedRoot : 0;
    if (task.mSemitones.size() < kTonesOfScale) return cost + kCostOfOmittedTone * others;
    const bool isRubbing =
        task.mSemitones.HasIntvl(kMajorThird) && !fingering.mOmitted.HasIntvl(kPerfectFourth);
    return cost + kCostOfTonesOutOfScale * others + (isRubbing ? kCostOfRubbingEleventh : 0);
}

int CostOfTones(const CFingering& fingering, const CFingeringTask& task) {
    const bool isOverBass = !task.mBassCounts || fingering.mBassIsLowest;
    return CostOfOmissions(fingering, task) + (isOverBass ? 0 : CostOfOtherBass(task));
}

}  // namespace

int LeastCostOf(const CShapeCounts& shape) {
    int cost = kCostOfPosition * std::max(0, shape.mPosition - 1) +
               kCostOfHighFret * std::max(0, shape.mHighest - 3) + kCostOfOpenString * shape.mOpen +
               kCostOfFinger * shape.mFingers + kCostOfSilentBass * shape.mSilentBass +
               kCostOfThinChord * std::max(0, shape.mSilentBass - 2) +
               kCostOfSilentInside * shape.mSilentInside;
    if (shape.mOpen == 0) return cost;
    return cost + kCostOfAnyOpen + kCostOfFarOpen * std::max(0, shape.mHighest - 4);
}

int CostOfSoundAndPlace(const CFingering& fingering, const CFingeringTask& task) {
    const CShapeCounts shape = CountsOf(fingering.Frets());
    return LeastCostOf(shape) + CostOfSilence(fingering, shape) + CostOfMutes(fingering, task) +
           CostOfDoubledTones(fingering, task) + CostOfTones(fingering, task);
}

int CostOfHand(const CHand& hand) {
    return kCostOfFinger * hand.mCount + kCostOfBarre * hand.mBarres +
           kCostOfBentBarre * hand.mBentBarres + kCostOfHalfStretch * hand.mStretch +
           kCostOfExtraWidth * hand.mExtraWidth;
}

}  // namespace brindle
