// SPDX-License-Identifier: MIT
#include "brindle/analysis/ScaleLite.h"

#include "brindle/analysis/CSemitonesMatch.h"
#include "brindle/analysis/ModalCenters.h"

#include <bit>
#include <cstdint>

namespace brindle::ScaleLite {

namespace {

bool IsUndef(const CChordLite& chord, const CScaleLite& scale) {
    return chord.IsUndef() || scale.mRootKeyEnh.IsUndef();
}

int IntvlAboveScaleRoot(const CChordLite& chord, const CScaleLite& scale) {
    const auto distance =
        std::int64_t{chord.mRootKeyEnh.mKeyNr} - std::int64_t{scale.mRootKeyEnh.mKeyNr};
    return static_cast<int>(((distance % 12) + 12) % 12);
}

/// The fifth tone of a scale counted from its root, -1 for a scale of fewer tones.
int IntvlOfFifthDegree(CSemitones scale) {
    std::uint64_t tones = scale.Mask() & 0xFFF;
    for (int degree = 0; degree < 4; ++degree) tones &= tones - 1;
    return tones == 0 ? -1 : std::countr_zero(tones);
}

bool StandsOnFifthDegree(const CChordLite& chord, const CScaleLite& scale) {
    return !IsUndef(chord, scale) &&
           IntvlAboveScaleRoot(chord, scale) == IntvlOfFifthDegree(scale.mSemitones);
}

bool IsDiatonic(const CChordLite& chord, const CScaleLite& scale) {
    const auto inScale =
        scale.mRootKeyEnh.IsUndef()
            ? ModalCenters::TPitchClasses{0}
            : ModalCenters::PitchClassesAbove(scale.mRootKeyEnh.mKeyNr, scale.mSemitones);
    return (ModalCenters::PitchClassesOf(chord) & ~inScale) == 0;
}

}  // namespace

bool ChordIsCompatibleWithScale(const CChordLite& chord, const CScaleLite& scale) {
    return StandsOnFifthDegree(chord, scale) || IsCompatibleOutlierChordOfScale(chord, scale) ||
           IsDiatonic(chord, scale);
}

bool IsCompatibleOutlierChordOfScale(const CChordLite& chord, const CScaleLite& scale) {
    if (scale.mSemitones != kSemitonesMajor || IsUndef(chord, scale)) return false;
    switch (IntvlAboveScaleRoot(chord, scale)) {
        case 3:
        case 10:
            return ChordPattern::Major.Matches(chord.mSemitones);
        case 5:
            return ChordPattern::Minor.Matches(chord.mSemitones);
        default:
            return false;
    }
}

}  // namespace brindle::ScaleLite
