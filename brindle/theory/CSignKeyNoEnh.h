// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/CSemitones.h"
#include "brindle/theory/TSignKeyType.h"

#include <iosfwd>
#include <nlohmann/json_fwd.hpp>
#include <string>
#include <string_view>
#include <type_traits>

namespace brindle {

class CSignKeyHeavy;
struct CChordNamePrefs;
struct CHarmCenterLite;
struct CScaleLite;
struct CSignKeyLite;

/// A major or minor key whose root has no spelling. Where a spelling is needed, the root is
/// spelled as the root of a major scale with few signs, also in minor: key 1 minor is D flat minor.
struct CSignKeyNoEnh {
    int mRootKeyNr = kKeyNrUndef;                    ///< the tonic, 0 (C) to 11 (B); 15 for none
    TSignKeyType mSignKeyType = TSignKeyType_Undef;  ///< major or minor

    constexpr CSignKeyNoEnh() = default;
    /// Root and type as they are.
    constexpr CSignKeyNoEnh(int rootKeyNr, TSignKeyType type)
        : mRootKeyNr(rootKeyNr), mSignKeyType(type) {}
    /// Key and type of a full sign key.
    explicit CSignKeyNoEnh(const CSignKeyHeavy& signKey);
    /// The sign key that a text such as "F# minor" names, read with CurrentChordNamePrefs.
    explicit CSignKeyNoEnh(std::string_view text);
    /// The same; null is the undefined sign key.
    explicit CSignKeyNoEnh(const char* text);

    /// True when the root or the type is undefined.
    [[nodiscard]] constexpr bool IsUndef() const {
        return mRootKeyNr == kKeyNrUndef || mSignKeyType == TSignKeyType_Undef;
    }

    /// The spelled form.
    [[nodiscard]] CSignKeyLite SignKey() const;
    /// The scale of the spelled form.
    [[nodiscard]] CScaleLite Scale() const;
    /// Its tones above the tonic: 2741 or 1453; empty for an undefined type.
    [[nodiscard]] constexpr CSemitones Semitones() const {
        return SemitonesFromSignKeyType(mSignKeyType);
    }
    /// The full form of the spelled form.
    [[nodiscard]] CSignKeyHeavy ToSignKeyHeavy() const;
    /// The tonic of the spelled form as a center.
    [[nodiscard]] CHarmCenterLite ToHarmCenter() const;

    /// Distances and keys as in CSignKeyLite.
    [[nodiscard]] int DistToSignKeyRoot(int keyNr) const;
    /// The key counted from the root, 0 to 11; 15 when either is undefined.
    [[nodiscard]] int KeyNrToSignKeyKeyNr(int keyNr) const;
    /// The key that stands `signKeyKeyNr` semitones above the root; 15 when either is undefined.
    [[nodiscard]] int SignKeyKeyNrToKeyNr(int signKeyKeyNr) const;

    /// Sharps of the spelled form, flats as a negative number.
    [[nodiscard]] int SignsCount() const;
    /// The same without its sign.
    [[nodiscard]] int SignsCountAbs() const;

    /// The relative key, despite the given name: the one with the same signature in the other
    /// type, A minor for C major, and back. (C minor would be the parallel key.)
    [[nodiscard]] CSignKeyNoEnh ParallelSignKey() const;
    /// The major key with the same signature.
    [[nodiscard]] CSignKeyNoEnh IonicSignKey() const;

    /// Names of the spelled form.
    [[nodiscard]] std::string NameShort(const CChordNamePrefs& prefs) const;
    /// "Db Minor"; "Undef".
    [[nodiscard]] std::string NameLong(const CChordNamePrefs& prefs) const;

    /// Writes `{"RootKeyNr":3,"Type":"major"}`.
    void AppendJSONString(std::ostream& stream) const;
    /// Reads what AppendJSONString wrote. A missing or unreadable root or type is undefined.
    [[nodiscard]] static CSignKeyNoEnh FromJSONDict(const nlohmann::json& dictionary);

    friend constexpr bool operator==(const CSignKeyNoEnh&, const CSignKeyNoEnh&) = default;
};

static_assert(std::is_trivially_copyable_v<CSignKeyNoEnh>);

/// Writes root and type on one line, for debugging.
std::ostream& operator<<(std::ostream& stream, const CSignKeyNoEnh& signKey);

/// No key: no root, no type.
inline constexpr CSignKeyNoEnh CSignKeyNoEnh_Undef{};

}  // namespace brindle
