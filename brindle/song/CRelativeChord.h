// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordLite.h"
#include "brindle/theory/CSignKeyLite.h"

#include <cstdint>
#include <optional>

namespace brindle {

/// A chord as it stands in its key, whichever that is: G7 in C and Bb7 in Eb are one. With it
/// stands how the key has changed since the chord before, so that a row of them is a song in any
/// key.
struct CRelativeChord {
    /// Semitones from the tonic of the chord before, of the first chord from that of the song, up
    /// to the tonic of this one: 0 to 11.
    std::uint8_t mShift = 0;
    bool mIsMinorKey = false;  ///< of the key that the chord is in
    /// Semitones from the tonic up to the root, 0 to 11.
    std::uint8_t mRoot = 0;
    /// Semitones from the root up to the bass, 1 to 11; 0 for none of its own.
    std::uint8_t mBass = 0;
    /// The tones above the root, 12 bits.
    std::uint16_t mMask = 0;

    /// All fields in 25 bits.
    [[nodiscard]] std::uint32_t Code() const;
    /// Nothing for a number that is no code.
    [[nodiscard]] static std::optional<CRelativeChord> FromCode(std::uint32_t code);

    friend constexpr bool operator==(const CRelativeChord&, const CRelativeChord&) = default;
};

/// A defined chord in a defined key; `tonicBefore` is the key number of the tonic before, 0 to 11.
[[nodiscard]] CRelativeChord RelativeChordOf(const CChordLite& chord, const CSignKeyLite& key,
                                             int tonicBefore);

/// The chord in the key on the tonic, spelled as it is written there: bVI in C is Ab, `#ivo` F#o.
[[nodiscard]] CChordLite ChordInKey(const CRelativeChord& chord, const CSignKeyLite& key);

/// The key `semitones` above the tonic of `home`, spelled as a degree of it, or with fewer signs if
/// it has more than six.
[[nodiscard]] CSignKeyLite KeyAbove(const CSignKeyLite& home, int semitones, bool isMinor);

}  // namespace brindle
