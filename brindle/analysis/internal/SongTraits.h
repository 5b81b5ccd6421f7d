// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/internal/KeyNumbers.h"

#include <span>

namespace brindle {

/// What the chords of a song together tell about each of them.
struct CSongTraits {
    int mHome = 0;         ///< number of the key of the song
    bool mIsVamp = false;  ///< a Dorian vamp: the one key is home, throughout
    bool mIsBlues = false;
    bool mIsJazz = false;
};

/// The minor key of a vamp of i and IV, Dm7 G7 Dm7 G7; -1 if the song is none.
[[nodiscard]] int KeyOfVamp(std::span<const CKeyChord> chords);

/// The traits of a song in the key `home`.
[[nodiscard]] CSongTraits SongTraitsOf(std::span<const CKeyChord> chords, int home);

}  // namespace brindle
