// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CScaleHeavy.h"
#include "brindle/theory/TSignKeyType.h"

#include <iosfwd>
#include <nlohmann/json_fwd.hpp>
#include <string>
#include <string_view>

namespace brindle {

struct CHarmCenterLite;
struct CSignKeyLite;
struct CSignKeyNoEnh;

/// A major or minor key in full: a root note with its major or natural minor scale.
class CSignKeyHeavy : public CScaleHeavy {
public:
    constexpr CSignKeyHeavy() = default;
    /// The key of that tonic and mode; an undefined root gives an undefined sign key.
    CSignKeyHeavy(const CKeyEnh& root, TSignKeyTypeNoUndef type);
    /// The root in the spelling whose major scale has the fewest signs.
    CSignKeyHeavy(int rootKeyNr, TSignKeyTypeNoUndef type);
    /// An undefined type counts as major; an undefined root gives the undefined sign key.
    explicit CSignKeyHeavy(const CSignKeyNoEnh& signKey);
    /// The sign key that a text such as "F# minor" names, see SignKeyStrings.h.
    CSignKeyHeavy(std::string_view text, const CChordNamePrefs& prefs);

    /// Major or minor, by the type of the scale; undefined for a scale without a type.
    [[nodiscard]] TSignKeyType SignKeyType() const;
    /// True when the root or the type is undefined.
    [[nodiscard]] bool IsUndef() const;

    /// Its scale, major or natural minor.
    [[nodiscard]] const CScaleHeavy& Scale() const { return *this; }
    /// Its tones above the tonic: 2741 or 1453; empty if undefined.
    [[nodiscard]] CSemitones Semitones() const { return SemitonesFromSignKeyType(SignKeyType()); }
    /// Key, spelling and type, without the octave.
    [[nodiscard]] CSignKeyLite ToSignKeyLite() const;
    /// Key and type, without the spelling.
    [[nodiscard]] CSignKeyNoEnh ToSignKeyNoEnh() const;
    /// The tonic as a center, with the mask of Semitones().
    [[nodiscard]] CHarmCenterLite ToHarmCenter() const;

    /// Distances and keys as in CSignKeyLite.
    [[nodiscard]] int DistToSignKeyRoot(int keyNr) const;
    /// The key counted from the root, 0 to 11; 15 when either is undefined.
    [[nodiscard]] int KeyNrToSignKeyKeyNr(int keyNr) const;
    /// The key that stands `signKeyKeyNr` semitones above the root; 15 when either is undefined.
    [[nodiscard]] int SignKeyKeyNrToKeyNr(int signKeyKeyNr) const;

    /// The relative key, despite the given name: the one with the same signature in the other
    /// type, A minor for C major, and back. (C minor would be the parallel key.)
    [[nodiscard]] CSignKeyHeavy ParallelSignKey() const;
    /// The major key with the same signature.
    [[nodiscard]] CSignKeyHeavy IonicSignKey() const;

    /// As the constructor.
    void SetRootKeyEnhAndSignKeyType(const CKeyEnh& root, TSignKeyTypeNoUndef type);
    /// Keeps the root.
    void SetSignKeyType(TSignKeyTypeNoUndef type);
    /// Spells the root as CSignKeyLite does; its octave stays.
    void SetRootNoteEnhWithLeastSigns();
    /// Walks `signs` fifths up from C, for minor from A; down if negative.
    void SetFromSignsCountAndType(int signs, TSignKeyTypeNoUndef type);
    /// Reads a text such as "F# minor", see SignKeyStrings.h.
    void SetFromString(std::string_view text, const CChordNamePrefs& prefs);

    /// The name of the root, with "m" behind it for minor; "Undef".
    [[nodiscard]] std::string NameShort(const CChordNamePrefs& prefs) const;
    /// The name of the root, then " Major" or " Minor"; "Undef".
    [[nodiscard]] std::string NameLong(const CChordNamePrefs& prefs) const;
    /// The same as NameLong.
    [[nodiscard]] std::string Name(const CChordNamePrefs& prefs) const { return NameLong(prefs); }

    /// Writes `{"root":<note>,"type":"major"}`.
    void AppendJSONString(std::ostream& stream) const;
    /// Reads what AppendJSONString wrote. A missing or unreadable root is undefined, a type other
    /// than "minor" is major.
    [[nodiscard]] static CSignKeyHeavy FromJSONDict(const nlohmann::json& dictionary);
};

/// Writes root and type on one line, for debugging.
std::ostream& operator<<(std::ostream& stream, const CSignKeyHeavy& signKey);

/// No key: no root, no type.
inline constexpr CSignKeyHeavy CSignKeyHeavy_Undef{};

}  // namespace brindle
