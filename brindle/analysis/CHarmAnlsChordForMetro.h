// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsChord.h"

#include <cstddef>
#include <iosfwd>
#include <nlohmann/json_fwd.hpp>
#include <span>
#include <string>
#include <type_traits>
#include <vector>

namespace brindle {

/// A chord prepared for a learning system: as a vector of 46 places, under a short name, and
/// reduced to a small vocabulary of chords. Both distances stay -1.
///
/// Two chords have a meaning of their own here: C with all twelve semitones is the wildcard, E with
/// all twelve is EADGBE, the open strings of a guitar.
///
/// Each place of a vector is 0.0 or 1.0:
///
///     0         undefined chord
///     1         EADGBE
///     2         wildcard
///     3 to 14   root key 0 to 11
///     15 to 21  basic chord: major, minor, augmented, diminished, sus4, sus2, drone
///     22 to 33  semitone 0 to 11, if it is not one of the basic chord
///     34 to 45  bass key 0 to 11, if it is not the root key
///
/// Spellings and directions are lost in a vector.
class CHarmAnlsChordForMetro : public CHarmAnlsChord {
public:
    /// Places of a vector.
    static constexpr std::size_t VectorSize = 46;

    /// The JSON text is the vector. For the caller to set.
    bool mWriteVectorRep = false;

    constexpr CHarmAnlsChordForMetro() = default;
    /// The chord of this root, bass and semitones.
    constexpr explicit CHarmAnlsChordForMetro(const CChordLite& chord) : CHarmAnlsChord(chord) {}

    /// Root key 4, E, with all twelve semitones, in any spelling.
    [[nodiscard]] bool IsEADGBE() const;
    /// Root key 0, C, with all twelve semitones, in any spelling.
    [[nodiscard]] bool IsWildcard() const;
    /// The bass differs from the root, if only in spelling; never for the two chords above.
    [[nodiscard]] bool IsSlashChord() const;

    /// The name under `CurrentChordNamePrefs`; with `flag` one that is the same under all
    /// preferences: sharps only, "C#m7 / B".
    [[nodiscard]] std::string NameForMetroExport(bool flag) const;

    /// The 46 places as the class tells them, each 0.0 or 1.0.
    [[nodiscard]] std::vector<float> GetChordVectorRepresentation() const;
    /// Does nothing unless there are 46 entries of 0.0 or 1.0. Without a root place the record
    /// stays as it was, without a basic chord or a bass place its semitones or its bass do.
    void SetFromChordVectorRepresentation(std::span<const float> vector);

    // Reductions to major and minor triads, and to the vocabulary of IsRecognizedMetroChord. The
    // argument drops the bass. An undefined root or a chord without semitones becomes undefined.

    /// The major or the minor triad: minor if the chord holds 0 3 7 or 0 3 6 and no major,
    /// augmented or suspended triad.
    [[nodiscard]] CHarmAnlsChordForMetro SimplifiedToMajorOrMinor(bool dropBass) const;
    /// Becomes that chord.
    void SimplifyToMajorOrMinor(bool dropBass);
    /// The nearest of _sSemitones_Chords_MetroRecognizedMode: the triad with its seventh, or less.
    [[nodiscard]] CHarmAnlsChordForMetro SimplifiedToRecognizedMetroChord(bool dropBass) const;
    /// Becomes that chord.
    void SimplifyToRecognizedMetroChord(bool dropBass);

    // Whether the semitones are a row of the vocabulary. With the argument true a chord with a bass
    // is none.

    /// A major or a minor triad. Kept: no tones and all twelve count too, here and below, since the
    /// masks (_sSemitones_Chords_MajorMinorMode) hold them.
    [[nodiscard]] bool IsMajorOrMinor(bool withoutBass) const;
    /// A chord of the masks _sSemitones_Chords_MetroRecognizedMode.
    [[nodiscard]] bool IsRecognizedMetroChord(bool withoutBass) const;
    /// A chord of the masks _sSemitones_Chords_CommonMode.
    [[nodiscard]] bool IsCommonChord(bool withoutBass) const;

    /// Sets the places of the keys that sound to 1.0; the others, and all places for an undefined
    /// root, stay as they were.
    void GetChromaVector(std::span<float, 12> chroma, bool withBass) const;

    /// Writes root, bass and semitones, or the vector, as JSON members without braces.
    void AppendJSONClassSubstring(std::ostream& stream) const;
    /// Writes the same in braces.
    void AppendJSONString(std::ostream& stream) const;
    /// Reads what AppendJSONString wrote, in either form. The flag stays as it was.
    void FromDictionary(const nlohmann::json& dictionary);

private:
    /// This root, and this bass unless it is to be dropped, with other semitones.
    [[nodiscard]] CHarmAnlsChordForMetro _WithSemitones(CSemitones semitones, bool dropBass) const;
};

static_assert(std::is_trivially_copyable_v<CHarmAnlsChordForMetro>);

/// Writes the JSON text.
std::ostream& operator<<(std::ostream& stream, const CHarmAnlsChordForMetro& chord);

}  // namespace brindle
