// SPDX-License-Identifier: MIT
#include "brindle/analysis/ModalCenters.h"

#include "brindle/analysis/CSemitonesMatch.h"

#include <array>
#include <bit>
#include <cstddef>

namespace brindle::ModalCenters {

namespace {

constexpr std::uint32_t kAllKeys = 0xFFF;
constexpr TCenters kAll = (TCenters{1} << kCount) - 1;

/// The twelve lowest bits moved up by 0 to 11 places, round the octave.
constexpr TKeys RotatedUp(std::uint64_t mask, int places) {
    const auto keys = static_cast<std::uint32_t>(mask & kAllKeys);
    return (keys << places | keys >> (12 - places)) & kAllKeys;
}

constexpr int KeyInOctave(int keyNr) {
    const int key = keyNr % 12;
    return key < 0 ? key + 12 : key;
}

/// For each key the centers whose scale holds it.
constexpr auto kCentersHoldingKey = [] {
    std::array<TCenters, 12> centersHoldingKey{};
    for (int center = 0; center < 12; ++center) {
        const TKeys major = RotatedUp(kSemitonesMajor.Mask(), center);
        const TKeys minor = RotatedUp(kSemitonesNaturalMinor.Mask(), center);
        for (std::size_t key = 0; key < 12; ++key) {
            const TCenters bit = TCenters{1} << center;
            if (major >> key & 1) centersHoldingKey[key] |= bit;
            if (minor >> key & 1) centersHoldingKey[key] |= bit << kMinorOffset;
        }
    }
    return centersHoldingKey;
}();

/// The major center that lies `intvl` semitones below a key.
constexpr TCenters MajorBelow(int keyNr, int intvl) {
    return TCenters{1} << KeyInOctave(keyNr - intvl);
}

/// The major and the minor center that have the key as their fifth degree.
constexpr TCenters CentersWithFifthDegree(int keyNr) {
    const TCenters major = MajorBelow(keyNr, 7);
    return major | major << kMinorOffset;
}

/// The major centers that borrow the chord: Eb, Bb and Fm in C.
TCenters CentersBorrowing(const CChordLite& chord) {
    const int root = KeyInOctave(chord.mRootKeyEnh.mKeyNr);
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

TKeys KeysAbove(int rootKeyNr, CSemitones semitones) {
    return RotatedUp(semitones.Mask(), KeyInOctave(rootKeyNr));
}

TKeys KeysOf(const CChordLite& chord) {
    if (chord.IsUndef()) return 0;
    const CKeyEnh& lowest = chord.mBassKeyEnh.IsUndef() ? chord.mRootKeyEnh : chord.mBassKeyEnh;
    return KeysAbove(chord.mRootKeyEnh.mKeyNr, chord.mSemitones) |
           TKeys{1} << KeyInOctave(lowest.mKeyNr);
}

int PlaceOf(const CHarmCenterLite& center) {
    const int key = KeyInOctave(center.mRootKeyEnh.mKeyNr);
    if (center.mSemitones == kSemitonesMajor) return key;
    if (center.mSemitones == kSemitonesNaturalMinor) return key + kMinorOffset;
    return kNoScale;
}

TCenters CentersHolding(TKeys keys) {
    TCenters centers = kAll;
    for (; keys != 0; keys &= keys - 1) {
        centers &= kCentersHoldingKey[static_cast<std::size_t>(std::countr_zero(keys))];
    }
    return centers;
}

TCenters CentersTolerating(const CChordLite& chord) {
    if (chord.IsUndef()) return kAll;
    return CentersHolding(KeysOf(chord)) | CentersWithFifthDegree(chord.mRootKeyEnh.mKeyNr) |
           CentersBorrowing(chord);
}

TCenters KeysOwning(const CChordLite& chord) {
    if (chord.IsUndef()) return 0;
    const TCenters dominantOf =
        CentersWithFifthDegree(chord.mRootKeyEnh.mKeyNr) >> kMinorOffset << kMinorOffset;
    const TCenters owning = CentersHolding(KeysOf(chord));
    return HasMajorThird(chord) ? owning | dominantOf : owning & ~dominantOf;
}

}  // namespace brindle::ModalCenters
