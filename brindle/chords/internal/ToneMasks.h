// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/internal/ChordKinds.h"

#include <string_view>

namespace brindle {

/// The set of some tones, in semitones above the root.
template <class... T>
constexpr TToneMask Tones(T... tones) {
    return (TToneMask{0} | ... | (TToneMask{1} << tones));
}

/// The tones of a kind of chord, by its suffix.
consteval TToneMask TonesOfKind(std::string_view suffix) {
    return static_cast<TToneMask>(TonesOfChordKind(suffix).Mask());
}

/// Whether all of the wanted tones are there.
constexpr bool HasAll(TToneMask tones, TToneMask wanted) {
    return (tones & wanted) == wanted;
}
/// Whether one of the wanted tones is there.
constexpr bool HasAny(TToneMask tones, TToneMask wanted) {
    return (tones & wanted) != 0;
}

/// Takes a tone out; false if it is not there.
constexpr bool TakeTone(TToneMask& tones, int tone) {
    if (!HasAny(tones, Tones(tone))) return false;
    tones &= ~Tones(tone);
    return true;
}

/// A number of chord symbols and all the tones that it stands for.
struct CNumberOfTones {
    TToneMask mTones;
    std::string_view mText;
    bool mIsForSus4Alone = false;

    [[nodiscard]] constexpr bool IsSingleTone() const { return (mTones & (mTones - 1)) == 0; }
};

}  // namespace brindle
