// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/TScaleType.h"

namespace brindle {

class CSemitones;

/// Relations between keys that need to know of scales.
struct CKeyEnhUtil {
    /// The root of the major scale that holds the same notes as a modal scale on `root`: C for
    /// D dorian. `CKeyEnh_Undef` for scales that are no mode of major.
    [[nodiscard]] static CKeyEnh RelatedIonianScaleRootKeyEnh(const CKeyEnh& root,
                                                              TScaleType scaleType);
    /// The same for a scale given by its semitones above the root.
    [[nodiscard]] static CKeyEnh RelatedIonianScaleRootKeyEnh(const CKeyEnh& root,
                                                              const CSemitones& semitones);
};

}  // namespace brindle
