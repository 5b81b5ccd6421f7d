// SPDX-License-Identifier: MIT
#include "brindle/chords/CChordLite.h"
#include "brindle/theory/CSignKeyHeavy.h"
#include "brindle/theory/CSignKeyLite.h"

#include <algorithm>
#include <array>

namespace brindle {

namespace {

/// A chord shape and its tones that must be in the key together with the root.
struct CShapeInKey {
    CSemitones semitones;
    CSemitones furtherTones;
};

// clang-format off
constexpr auto kShapesInKey = std::to_array<CShapeInKey>({
    // Kept: the first three pass on the root alone.
    {CSemitones( 145), {}},                       // major triad            0 4 7
    {CSemitones( 273), {}},                       // augmented triad        0 4 8
    {CSemitones(1169), {}},                       // dominant seventh       0 4 7 10
    {CSemitones( 129), CSemitones{7}},            // drone                  0 7
    {CSemitones( 133), CSemitones{2, 7}},         // sus2                   0 2 7
    {CSemitones( 161), CSemitones{5, 7}},         // sus4                   0 5 7
    {CSemitones( 137), CSemitones{3, 7}},         // minor triad            0 3 7
    {CSemitones(  73), CSemitones{3, 6}},         // diminished triad       0 3 6
    {CSemitones(1161), CSemitones{3, 7, 10}},     // minor seventh          0 3 7 10
    {CSemitones(2185), CSemitones{3, 7, 11}},     // minor major seventh    0 3 7 11
    {CSemitones(2193), CSemitones{4, 7, 11}},     // major seventh          0 4 7 11
});
// clang-format on

/// The tones that any other shape needs: fifth and minor seventh, where it has root and fifth.
CSemitones FurtherTonesOfOtherShape(const CSemitones& semitones) {
    if (!semitones.HasIntvl(0) || !semitones.HasIntvl(7)) return {};
    return semitones.HasIntvl(10) ? CSemitones{7, 10} : CSemitones{7};
}

CSemitones FurtherTones(const CSemitones& semitones) {
    const auto shape =
        std::find_if(kShapesInKey.begin(), kShapesInKey.end(),
                     [&](const CShapeInKey& row) { return row.semitones == semitones; });
    return shape != kShapesInKey.end() ? shape->furtherTones : FurtherTonesOfOtherShape(semitones);
}

}  // namespace

bool CChordLite::IsInSignKeyRegardlessOfEnh(const CSignKeyHeavy& signKey) const {
    constexpr CSemitones rootAlone{0};
    if (IsUndef() || mSemitones == rootAlone || !signKey.HasKeyNr(mRootKeyEnh.mKeyNr)) return false;
    const CSemitones tones = FurtherTones(mSemitones);
    for (int intvl = 1; intvl < 12; ++intvl) {
        if (tones.HasIntvl(intvl) && !signKey.HasKeyNr(KeyNrFromChordKeyNr(intvl))) return false;
    }
    return true;
}

bool CChordLite::IsInSignKeyRegardlessOfEnh(const CSignKeyLite& signKey) const {
    return IsInSignKeyRegardlessOfEnh(CSignKeyHeavy(
        signKey.mRootKeyEnh, FromSignKeyTypeInCaseOfUndefReturnMajor(signKey.mSignKeyType)));
}

int CChordLite::RootNoteDegreeNrInSignKey(const CSignKeyHeavy& signKey) const {
    return signKey.KeyNrToDegreeNr(mRootKeyEnh.mKeyNr);
}

int CChordLite::BassNoteDegreeNrInSignKey(const CSignKeyHeavy& signKey) const {
    return signKey.KeyNrToDegreeNr(mBassKeyEnh.mKeyNr);
}

}  // namespace brindle
