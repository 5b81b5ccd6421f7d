// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/CSemitones.h"
#include "brindle/theory/TSignKeyType.h"

#include <iosfwd>
#include <string>
#include <string_view>
#include <tuple>
#include <type_traits>

namespace brindle {

class CSignKeyHeavy;
struct CChordNamePrefs;
struct CHarmCenterLite;
struct CScaleLite;
struct CSignKeyNoEnh;

/// A major or minor key as a key signature names it: a spelled root and a type.
struct CSignKeyLite {
    CKeyEnh mRootKeyEnh;                             ///< the tonic
    TSignKeyType mSignKeyType = TSignKeyType_Undef;  ///< major or minor

    constexpr CSignKeyLite() = default;
    /// Root and type as they are.
    constexpr CSignKeyLite(CKeyEnh root, TSignKeyType type)
        : mRootKeyEnh(root), mSignKeyType(type) {}
    /// Root and type of a full sign key.
    explicit CSignKeyLite(const CSignKeyHeavy& signKey);
    /// The sign key that a text such as "F# minor" names, read with CurrentChordNamePrefs.
    explicit CSignKeyLite(std::string_view text);
    /// The same; null is the undefined sign key.
    explicit CSignKeyLite(const char* text);

    /// True when the root or the type is undefined.
    [[nodiscard]] constexpr bool IsUndef() const {
        return mRootKeyEnh.IsUndef() || mSignKeyType == TSignKeyType_Undef;
    }

    /// The major or natural minor scale on the root; an undefined type has an empty mask.
    [[nodiscard]] CScaleLite Scale() const;
    /// Its tones above the tonic: 2741 or 1453; empty for an undefined type.
    [[nodiscard]] constexpr CSemitones Semitones() const {
        return SemitonesFromSignKeyType(mSignKeyType);
    }
    /// The full form. An undefined type counts as major; an undefined root gives
    /// CSignKeyHeavy_Undef.
    [[nodiscard]] CSignKeyHeavy ToSignKeyHeavy() const;
    /// Key and type, without the spelling.
    [[nodiscard]] CSignKeyNoEnh ToSignKeyNoEnh() const;
    /// The tonic as a center, with the mask of Semitones().
    [[nodiscard]] CHarmCenterLite ToHarmCenter() const;

    /// Semitones from the root up to the key, 0 to 11; -1 when the sign key is undefined. A key of
    /// 15 is not tested.
    [[nodiscard]] int DistToSignKeyRoot(int keyNr) const;
    /// The key counted from the root, 0 to 11; 15 when either is undefined.
    [[nodiscard]] int KeyNrToSignKeyKeyNr(int keyNr) const;
    /// The key that stands `signKeyKeyNr` semitones above the root; 15 when either is undefined.
    [[nodiscard]] int SignKeyKeyNrToKeyNr(int signKeyKeyNr) const;

    /// Sharps of the key signature, flats as a negative number: -3 for C minor. 0 for an undefined
    /// root or type.
    [[nodiscard]] int SignsCount() const;
    /// The same without its sign.
    [[nodiscard]] int SignsCountAbs() const;

    /// The relative key, despite the given name: the one with the same signature in the other
    /// type, A minor for C major, and back. (C minor would be the parallel key.)
    [[nodiscard]] CSignKeyLite ParallelSignKey() const;
    /// The major key with the same signature.
    [[nodiscard]] CSignKeyLite IonicSignKey() const;

    /// Spells the root so that the signature has the fewest signs. At a tie the given spelling
    /// stays, so both F sharp and G flat major do; otherwise flats win over sharps.
    void SetRootNoteEnhWithLeastSigns();

    /// The name of the root, with "m" behind it for minor; "Undef".
    [[nodiscard]] std::string NameShort(const CChordNamePrefs& prefs) const;
    /// The name of the root, then " Major" or " Minor"; "Undef".
    [[nodiscard]] std::string NameLong(const CChordNamePrefs& prefs) const;

    /// Writes `{"CKeyEnh":...,"Type":"major"}`.
    void AppendJSONString(std::ostream& stream) const;

    friend constexpr bool operator==(const CSignKeyLite&, const CSignKeyLite&) = default;
    friend constexpr bool operator<(const CSignKeyLite& a, const CSignKeyLite& b) {
        return std::tie(a.mRootKeyEnh, a.mSignKeyType) < std::tie(b.mRootKeyEnh, b.mSignKeyType);
    }
};

static_assert(std::is_trivially_copyable_v<CSignKeyLite>);

/// Writes root and type on one line, for debugging.
std::ostream& operator<<(std::ostream& stream, const CSignKeyLite& signKey);

/// No key: no root, no type.
inline constexpr CSignKeyLite CSignKeyLite_Undef{};

}  // namespace brindle
