// SPDX-License-Identifier: MIT
// The reductions of a chord to small vocabularies. Suspended and augmented chords count as major
// where there is nothing but major and minor.

#include "brindle/analysis/CHarmAnlsChordForMetro.h"

namespace brindle {

namespace {

constexpr CSemitones kMajorTriad{0, 4, 7};
constexpr CSemitones kMinorTriad{0, 3, 7};
constexpr CSemitones kAugmentedTriad{0, 4, 8};
constexpr CSemitones kDiminishedTriad{0, 3, 6};
constexpr CSemitones kSus4{0, 5, 7};
constexpr CSemitones kSus2{0, 2, 7};
constexpr CSemitones kDrone{0, 7};
constexpr CSemitones kRootOnly{0};

bool HasAll(CSemitones chord, CSemitones tones) {
    return (tones - chord).IsEmpty();
}

CSemitones MajorOrMinorOf(CSemitones chord) {
    for (const CSemitones major : {kMajorTriad, kAugmentedTriad, kSus4, kSus2}) {
        if (HasAll(chord, major)) return kMajorTriad;
    }
    if (HasAll(chord, kMinorTriad) || HasAll(chord, kDiminishedTriad)) return kMinorTriad;
    return kMajorTriad;
}

/// A triad and what becomes of it under a minor or a major seventh.
struct CWithSevenths {
    CSemitones mMinorSeventh;
    CSemitones mMajorSeventh;
    CSemitones mOtherwise;
};

CSemitones Choose(CSemitones chord, const CWithSevenths& choice) {
    if (chord.HasIntvl(10)) return choice.mMinorSeventh;
    return chord.HasIntvl(11) ? choice.mMajorSeventh : choice.mOtherwise;
}

// In this order: a chord with both sevenths is one of the minor seventh, and a chord with both
// thirds is major.
CSemitones RecognizedOf(CSemitones chord) {
    const bool isAugmented = HasAll(chord, kAugmentedTriad);
    const bool isDiminished = HasAll(chord, kDiminishedTriad);
    if (HasAll(chord, kMajorTriad) || (chord.HasIntvl(4) && !isAugmented)) {
        const CSemitones triad = chord.HasIntvl(2) ? CSemitones{0, 2, 4, 7} : kMajorTriad;
        return Choose(chord, {{0, 4, 7, 10}, {0, 4, 7, 11}, triad});
    }
    if (HasAll(chord, kMinorTriad) || (chord.HasIntvl(3) && !isDiminished)) {
        return Choose(chord, {{0, 3, 7, 10}, {0, 3, 7, 11}, kMinorTriad});
    }
    if (isDiminished) return chord.HasIntvl(9) ? CSemitones{0, 3, 6, 9} : kDiminishedTriad;
    if (isAugmented) return chord.HasIntvl(10) ? CSemitones{0, 4, 8, 10} : kAugmentedTriad;
    if (HasAll(chord, kSus4)) return kSus4;
    if (HasAll(chord, kSus2)) return kSus2;
    if (HasAll(chord, kDrone)) return chord.HasIntvl(10) ? CSemitones{0, 7, 10} : kDrone;
    return kRootOnly;
}

/// Without distances and flag.
const CChordLite& AsLite(const CHarmAnlsChordForMetro& chord) {
    return chord;
}

}  // namespace

CHarmAnlsChordForMetro CHarmAnlsChordForMetro::SimplifiedToMajorOrMinor(bool dropBass) const {
    if (IsUndef() || mSemitones.IsEmpty()) return {};
    if (IsWildcard() || IsEADGBE()) return CHarmAnlsChordForMetro(AsLite(*this));
    return _WithSemitones(MajorOrMinorOf(mSemitones), dropBass);
}

void CHarmAnlsChordForMetro::SimplifyToMajorOrMinor(bool dropBass) {
    *this = SimplifiedToMajorOrMinor(dropBass);
}

CHarmAnlsChordForMetro CHarmAnlsChordForMetro::SimplifiedToRecognizedMetroChord(
    bool dropBass) const {
    if (IsUndef() || mSemitones.IsEmpty()) return {};
    if (IsWildcard() || IsEADGBE()) return CHarmAnlsChordForMetro(AsLite(*this));
    if (mSemitones == kRootOnly) return _WithSemitones(kRootOnly, true);
    return _WithSemitones(RecognizedOf(mSemitones), dropBass);
}

void CHarmAnlsChordForMetro::SimplifyToRecognizedMetroChord(bool dropBass) {
    *this = SimplifiedToRecognizedMetroChord(dropBass);
}

CHarmAnlsChordForMetro CHarmAnlsChordForMetro::_WithSemitones(CSemitones semitones,
                                                              bool dropBass) const {
    const CKeyEnh bass = dropBass || !HasBassNote() ? CKeyEnh_Undef : mBassKeyEnh;
    return CHarmAnlsChordForMetro(CChordLite(mRootKeyEnh, bass, semitones));
}

}  // namespace brindle
