// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordLite.h"
#include "brindle/theory/CKeyEnh.h"

namespace brindle {

/// The place of a key on the line of fifths: F -1, C 0, G 1, F sharp 6, B flat -2. The key is
/// spelled, as its key number allows.
[[nodiscard]] int FifthOf(const CKeyEnh& key);

/// An interval by its semitones and its steps on the line of fifths.
struct CSpelledInterval {
    int mSemitones = 0;
    int mFifths = 0;

    /// A key that would need more than three sharps or two flats takes another letter; one without
    /// a spelling stays without, and an undefined one undefined.
    void Move(CKeyEnh& key) const;
    /// Its root and its bass.
    void Move(CChordLite& chord) const;
};

}  // namespace brindle
