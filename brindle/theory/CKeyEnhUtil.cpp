// SPDX-License-Identifier: MIT
#include "brindle/theory/CKeyEnhUtil.h"

#include "brindle/theory/ScaleMasks.h"

#include <array>

namespace brindle {

namespace {

/// How far the related major root lies from the root of a mode, in semitones.
struct CRelation {
    TScaleType mScaleType;
    int mIntvl;
};

constexpr auto kRelations = std::to_array<CRelation>({
    {st_maj, 0},
    {st_min, -9},
    {st_lydian, -5},
    {st_mixolydian, -7},
    {st_dorian, -2},
    {st_phrygian, -4},
    {st_locrian, -11},
});

}  // namespace

CKeyEnh CKeyEnhUtil::RelatedIonianScaleRootKeyEnh(const CKeyEnh& root, TScaleType scaleType) {
    for (const CRelation& row : kRelations) {
        if (row.mScaleType == scaleType) return root.Add(row.mIntvl);
    }
    return CKeyEnh_Undef;
}

CKeyEnh CKeyEnhUtil::RelatedIonianScaleRootKeyEnh(const CKeyEnh& root,
                                                  const CSemitones& semitones) {
    return RelatedIonianScaleRootKeyEnh(root, ScaleTypeFromSemitones(semitones));
}

}  // namespace brindle
