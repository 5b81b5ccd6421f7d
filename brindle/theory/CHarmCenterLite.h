// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/CScaleLite.h"
#include "brindle/theory/CSemitones.h"

#include <iosfwd>
#include <string>
#include <tuple>

namespace brindle {

struct CSignKeyLite;

/// A tonal center that holds for a passage: a root and a modal mask.
struct CHarmCenterLite {
    /// The tonic; undefined for no center.
    CKeyEnh mRootKeyEnh;
    /// Intervals of its scale above the tonic: 2741 for major, 1709 for dorian.
    CSemitones mSemitones;

    constexpr CHarmCenterLite() = default;
    /// Root and mask as they are.
    constexpr CHarmCenterLite(CKeyEnh root, CSemitones semitones)
        : mRootKeyEnh(root), mSemitones(semitones) {}
    /// The root of a scale as tonic, with the scale's tones.
    constexpr explicit CHarmCenterLite(const CScaleLite& scale)
        : CHarmCenterLite(scale.mRootKeyEnh, scale.mSemitones) {}
    /// The tonic of a sign key, 2741 or 1453 above its root; undefined for an undefined type.
    explicit CHarmCenterLite(const CSignKeyLite& signKey);

    /// True when the root is undefined, whatever the mask.
    [[nodiscard]] constexpr bool IsUndef() const { return mRootKeyEnh.IsUndef(); }
    /// The same root and mask as a scale.
    [[nodiscard]] constexpr CScaleLite ToScaleLite() const { return {mRootKeyEnh, mSemitones}; }

    /// The key counted from the root, 0 to 11; 15 when either is undefined.
    [[nodiscard]] int KeyNrToHarmCenterKeyNr(int keyNr) const;
    /// The key that stands `harmCenterKeyNr` semitones above the root; 15 when either is undefined.
    [[nodiscard]] int HarmCenterKeyNrToKeyNr(int harmCenterKeyNr) const;

    /// The name of the root, with "m" behind it for natural minor only; "Undef".
    [[nodiscard]] std::string NameShort(const CChordNamePrefs& prefs) const;
    /// The name of the root and of the mode, as in "D Dorian". A mask that is no mode prints the
    /// root alone; "Undef".
    [[nodiscard]] std::string NameLong(const CChordNamePrefs& prefs) const;

    friend constexpr bool operator==(const CHarmCenterLite&, const CHarmCenterLite&) = default;
    friend constexpr bool operator<(const CHarmCenterLite& a, const CHarmCenterLite& b) {
        return std::tie(a.mRootKeyEnh, a.mSemitones) < std::tie(b.mRootKeyEnh, b.mSemitones);
    }
};

/// Writes root and mask on one line, for debugging.
std::ostream& operator<<(std::ostream& stream, const CHarmCenterLite& center);

/// No center: an undefined root and an empty mask.
inline constexpr CHarmCenterLite CHarmCenterLite_Undef{};

}  // namespace brindle
