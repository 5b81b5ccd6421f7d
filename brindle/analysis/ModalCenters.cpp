// SPDX-License-Identifier: MIT
#include "brindle/analysis/ModalCenters.h"

#include "brindle/analysis/CSemitonesMatch.h"
#include "brindle/theory/KeyIntervals.h"

#include <array>
#include <bit>
#include <cstddef>

namespace brindle::ModalCenters {

namespace {

constexpr std::uint32_t kAllPitchClasses = 0xFFF;
constexpr TCenters kAll = (TCenters{1} << kCount) - 1;

/// The twelve lowest bits moved up by 0 to 11 places, round the octave.
constexpr TPitchClasses RotatedUp(std::uint64_t mask, int places) {
    const auto pitchClasses = static_cast<TPitchClasses>(mask & kAllPitchClasses);
    return (pitchClasses << places | pitchClasses >> (12 - places)) & kAllPitchClasses;
}

/// For each pitch class the centers whose scale holds it.
constexpr auto kCentersHoldingPitchClass = [] {
    std::array<TCenters, 12> holding{};
    for (int center = 0; center < 12; ++center) {
        const TPitchClasses major = RotatedUp(kSemitonesMajor.Mask(), center);
        const TPitchClasses minor = RotatedUp(kSemitonesNaturalMinor.Mask(), center);
        for (std::size_t pitchClass = 0; pitchClass < 12; ++pitchClass) {
            const TCenters bit = TCenters{1} << center;
            if (major >> pitchClass & 1) holding[pitchClass] |= bit;
            if (minor >> pitchClass & 1) holding[pitchClass] |= bit << kMinorOffset;
        }
    }
    return holding;
}();

/// The major center that lies `intvl` semitones below a pitch class.
constexpr TCenters MajorBelow(int keyNr, int intvl) {
    return TCenters{1} << FoldIntoOctave(keyNr - intvl);
}

/// The major and the minor center that have the pitch class as their fifth degree: the chord on it
/// is their dominant, and in any other center their secondary dominant.
constexpr TCenters CentersWithFifthDegree(int keyNr) {
    const TCenters major = MajorBelow(keyNr, 7);
    return major | major << kMinorOffset;
}

/// The major centers that borrow the chord from their parallel minor: Eb, Bb and Fm in C.
TCenters CentersBorrowing(const CChordLite& chord) {
    const int root = FoldIntoOctave(chord.mRootKeyEnh.mKeyNr);
    TCenters centers = 0;
    if (ChordPattern::Major.Matches(chord.mSemitones)) {
        centers |= MajorBelow(root, 3) | MajorBelow(root, 10);
    }
    if (ChordPattern::Minor.Matches(chord.mSemitones)) centers |= MajorBelow(root, 5);
    return centers;
}

/// Whether the third of a major chord sounds, as a tone or as a bass above the root.
bool HasMajorThird(const CChordLite& chord) {
    const bool isInBass = !chord.mBassKeyEnh.IsUndef() &&
                          std::int64_t{chord.mBassKeyEnh.mKeyNr} - chord.mRootKeyEnh.mKeyNr == 4;
    return isInBass || (chord.mSemitones.Mask() >> 4 & 1) != 0;
}

}  // namespace

TPitchClasses PitchClassesAbove(int rootKeyNr, CSemitones semitones) {
    return RotatedUp(semitones.Mask(), FoldIntoOctave(rootKeyNr));
}

TPitchClasses PitchClassesOf(const CChordLite& chord) {
    if (chord.IsUndef()) return 0;
    const CKeyEnh& lowest = chord.mBassKeyEnh.IsUndef() ? chord.mRootKeyEnh : chord.mBassKeyEnh;
    return PitchClassesAbove(chord.mRootKeyEnh.mKeyNr, chord.mSemitones) |
           TPitchClasses{1} << FoldIntoOctave(lowest.mKeyNr);
}

int PlaceOf(const CHarmCenterLite& center) {
    const int tonic = FoldIntoOctave(center.mRootKeyEnh.mKeyNr);
    if (center.mSemitones == kSemitonesMajor) return tonic;
    if (center.mSemitones == kSemitonesNaturalMinor) return tonic + kMinorOffset;
    return kNoScale;
}

TCenters CentersHolding(TPitchClasses pitchClasses) {
    TCenters centers = kAll;
    for (TPitchClasses left = pitchClasses; left != 0; left &= left - 1) {
        centers &= kCentersHoldingPitchClass[static_cast<std::size_t>(std::countr_zero(left))];
    }
    return centers;
}

TCenters CentersTolerating(const CChordLite& chord) {
    if (chord.IsUndef()) return kAll;
    return CentersHolding(PitchClassesOf(chord)) |
           CentersWithFifthDegree(chord.mRootKeyEnh.mKeyNr) | CentersBorrowing(chord);
}

TCenters CentersOwning(const CChordLite& chord) {
    if (chord.IsUndef()) return 0;
    const TCenters dominantOf =
        CentersWithFifthDegree(chord.mRootKeyEnh.mKeyNr) >> kMinorOffset << kMinorOffset;
    const TCenters owning = CentersHolding(PitchClassesOf(chord));
    return HasMajorThird(chord) ? owning | dominantOf : owning & ~dominantOf;
}

}  // namespace brindle::ModalCenters
