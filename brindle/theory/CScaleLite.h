// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/CSemitones.h"

#include <iosfwd>
#include <string_view>
#include <tuple>
#include <type_traits>

namespace brindle {

class CChordLite;
class CScaleHeavy;
struct CChordNamePrefs;

/// The compact form of a scale: a root and the semitones above it.
struct CScaleLite {
    CKeyEnh mRootKeyEnh;    ///< the tonic; undefined for no scale
    CSemitones mSemitones;  ///< its tones above the root: 2741 for major

    constexpr CScaleLite() = default;
    /// Root and mask as they are.
    constexpr CScaleLite(CKeyEnh root, CSemitones semitones)
        : mRootKeyEnh(root), mSemitones(semitones) {}
    /// Root and tones of a full scale.
    explicit CScaleLite(const CScaleHeavy& scale);
    /// The scale that a text such as "C dorian" names, see ScaleStrings.h.
    explicit CScaleLite(std::string_view text, const CChordNamePrefs& prefs);
    /// The same; null is the undefined scale.
    explicit CScaleLite(const char* text, const CChordNamePrefs& prefs);

    /// True when the root is undefined.
    [[nodiscard]] constexpr bool IsUndef() const { return mRootKeyEnh.IsUndef(); }
    /// Whether the key, in any spelling, belongs to the scale. Key 15 does not.
    [[nodiscard]] bool HasKeyNr(int keyNr) const;
    /// Semitones from the root up to the key, 0 to 11; -1 when the root is undefined. A key of 15
    /// is not tested.
    [[nodiscard]] int DistToRootKey(int keyNr) const;
    /// Whether the mask is one of the seven modes of the major scale; the root does not matter.
    [[nodiscard]] bool IsModalScale() const;
    /// Whether it is one of those with a major third and a fifth: ionian, lydian, mixolydian.
    [[nodiscard]] bool IsModalScaleMajor() const;
    /// Whether it is one of those with a minor third and a fifth: dorian, phrygian, aeolian.
    [[nodiscard]] bool IsModalScaleMinor() const;

    /// The relative natural minor of a major scale, A minor for C major, and back; any other scale
    /// is its own.
    [[nodiscard]] CScaleLite ParallelModalScale() const;
    /// The major scale with the notes of this modal scale, C major for D dorian. The root is
    /// undefined when the scale is not modal.
    [[nodiscard]] CScaleLite RelatedIonianModalScale() const;

    /// The root, third and fifth degree of the scale. Defined in chords/.
    [[nodiscard]] CChordLite ChordTriadForScale() const;
    /// A scale on the root of the chord with all its keys, filled from this scale where the chord
    /// leaves a degree open. Defined in chords/.
    [[nodiscard]] CScaleLite ConstructScaleForChord(const CChordLite& chord) const;

    /// Reads a text such as "C dorian", see ScaleStrings.h.
    void SetFromString(std::string_view text, const CChordNamePrefs& prefs);
    /// Spells the root so that the scale has the fewest signs. Nothing happens to an undefined
    /// root. Defined in chords/.
    void SetRootKeyEnhWithLeastSigns();
    /// Makes the key the root of the same notes: C major rotated to D is D dorian. With an
    /// undefined key on either side the mask means nothing.
    void RotateRootToKeyEnh(CKeyEnh root);

    /// Writes `{"CKeyEnh":...,"Semitones":"[...]"}`.
    void AppendJSONString(std::ostream& stream) const;

    friend constexpr bool operator==(const CScaleLite&, const CScaleLite&) = default;
    friend constexpr bool operator<(const CScaleLite& a, const CScaleLite& b) {
        return std::tie(a.mRootKeyEnh, a.mSemitones) < std::tie(b.mRootKeyEnh, b.mSemitones);
    }
};

static_assert(std::is_trivially_copyable_v<CScaleLite>);

/// Writes root and mask on one line, for debugging.
std::ostream& operator<<(std::ostream& stream, const CScaleLite& scale);

/// No scale: an undefined root and an empty mask.
inline constexpr CScaleLite CScaleLite_Undef{};

}  // namespace brindle
