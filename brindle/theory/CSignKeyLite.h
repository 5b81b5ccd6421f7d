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
    CKeyEnh mRootKeyEnh;
    TSignKeyType mSignKeyType = TSignKeyType_Undef;

    constexpr CSignKeyLite() = default;
    constexpr CSignKeyLite(CKeyEnh root, TSignKeyType type)
        : mRootKeyEnh(root), mSignKeyType(type) {}
    /// Root and type of a full sign key.
    explicit CSignKeyLite(const CSignKeyHeavy& signKey);
    /// The sign key that a text such as "F# minor" names, read with CurrentChordNamePrefs.
    explicit CSignKeyLite(std::string_view text);
    explicit CSignKeyLite(const char* text);

    /// True when the root or the type is undefined.
    [[nodiscard]] constexpr bool IsUndef() const {
        return mRootKeyEnh.IsUndef() || mSignKeyType == TSignKeyType_Undef;
    }

    /// The major or natural minor scale on the root; an undefined type has an empty mask.
    [[nodiscard]] CScaleLite Scale() const;
    [[nodiscard]] constexpr CSemitones Semitones() const {
        return SemitonesFromSignKeyType(mSignKeyType);
    }
    /// The full form. An undefined type counts as major; an undefined root gives
    /// CSignKeyHeavy_Undef.
    [[nodiscard]] CSignKeyHeavy ToSignKeyHeavy() const;
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

    /// Sharps of the key signature, flats as a negative number.
    [[nodiscard]] int SignsCount() const;
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

std::ostream& operator<<(std::ostream& stream, const CSignKeyLite& signKey);

inline constexpr CSignKeyLite CSignKeyLite_Undef{};

}  // namespace brindle
