// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/ReadHarmony.h"
#include "brindle/analysis/internal/KeyChords.h"
#include "brindle/song/CSong.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

namespace brindle {

enum TSixthChord : std::uint8_t {
    TSixthChord_German,
    TSixthChord_Italian,
    TSixthChord_French,
};

/// No chord.
inline constexpr std::ptrdiff_t kNoneAround = -1;

/// What sounds before and behind each chord of a song, and how it is named. A chord that is written
/// several times in a row is one; it is asked for by any of its places, and answered by its first.
class CChordsAround {
public:
    /// Both must outlive this.
    CChordsAround(const CSong& song, const CSongReading& reading);

    [[nodiscard]] const CChordReading& Reading(std::size_t ix) const {
        return mReading->mChords[ix];
    }
    /// Whether the place has a chord.
    [[nodiscard]] bool HasChord(std::size_t ix) const;
    [[nodiscard]] std::ptrdiff_t Previous(std::size_t ix) const { return Beside(ix, -1); }
    [[nodiscard]] std::ptrdiff_t Next(std::size_t ix) const { return Beside(ix, 1); }
    /// Whether it is one of a row of places that sound the same, but not the first.
    [[nodiscard]] bool IsRepeated(std::size_t ix) const;
    /// As the song writes it; empty for none.
    [[nodiscard]] std::string Symbol(std::ptrdiff_t ix) const;
    /// Pitch classes; `kKeyNrUndef` for none.
    [[nodiscard]] int Root(std::ptrdiff_t ix) const;
    [[nodiscard]] int Bass(std::ptrdiff_t ix) const;
    /// Whether the third of a chord is not that of the tonic of a key: Cm for C major.
    [[nodiscard]] bool HasOtherThird(std::ptrdiff_t ix, const CSignKeyLite& key) const;
    /// Which augmented sixth a chord of that relation is. By its tones, as numerals in another
    /// style do not tell it: b67.
    [[nodiscard]] TSixthChord SixthChord(std::size_t ix) const;
    /// Whether a Neapolitan chord has its third in the bass.
    [[nodiscard]] bool IsNeapolitanSixth(std::size_t ix) const;

private:
    [[nodiscard]] std::ptrdiff_t Beside(std::size_t ix, std::ptrdiff_t step) const;
    [[nodiscard]] const CKeyChord* ChordAt(std::ptrdiff_t ix) const;

    const CSong* mSong;
    const CSongReading* mReading;
    std::vector<CKeyChord> mChords;
    // Of each place of the song the number in mChords; kNoneAround before the first.
    std::vector<std::ptrdiff_t> mNumbers;
};

/// The key that a reading serves: A minor for V7/vi in C major; undefined for none.
[[nodiscard]] CSignKeyLite ServedKey(const CChordReading& reading);

}  // namespace brindle
