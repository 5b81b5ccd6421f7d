// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/Positions.h"
#include "brindle/chords/CChordLite.h"

#include <cstdint>
#include <iosfwd>
#include <nlohmann/json_fwd.hpp>
#include <type_traits>

namespace brindle {

/// A chord and its function: how far its root and its bass lie above the root of the harmonic
/// center that it belongs to. G7 in C major has the root distance 7.
class CHarmAnlsChord : public CChordLite {
public:
    /// Semitones from the center's root up to the chord's root, 0 to 11; -1 undefined.
    std::int32_t mRootDistToHarmCenter = -1;
    /// The same for the bass; -1 for a chord without a bass of its own.
    std::int32_t mBassDistToHarmCenter = -1;

    constexpr CHarmAnlsChord() = default;
    /// A chord with its distances as they are; they are not worked out.
    constexpr explicit CHarmAnlsChord(const CChordLite& chord, std::int32_t rootDist = -1,
                                      std::int32_t bassDist = -1)
        : CChordLite(chord), mRootDistToHarmCenter(rootDist), mBassDistToHarmCenter(bassDist) {}

    /// As `==`, but C sharp and D flat are the same key.
    [[nodiscard]] bool EqualWithoutEnh(const CHarmAnlsChord& other) const;
    /// Compares function and semitones only: G7 in C major equals A7 in D major.
    [[nodiscard]] bool EqualExceptRootAndBass(const CHarmAnlsChord& other) const;

    /// Writes the members without braces.
    void AppendJSONClassSubstring(std::ostream& stream) const;
    /// Writes the same in braces.
    void AppendJSONString(std::ostream& stream) const;

    /// Compares root, bass (spelling included), semitones and both distances.
    friend constexpr bool operator==(const CHarmAnlsChord& a, const CHarmAnlsChord& b) {
        return static_cast<const CChordLite&>(a) == static_cast<const CChordLite&>(b) &&
               a.mRootDistToHarmCenter == b.mRootDistToHarmCenter &&
               a.mBassDistToHarmCenter == b.mBassDistToHarmCenter;
    }
    /// The order of CChordLite; the distances do not count.
    friend constexpr bool operator<(const CHarmAnlsChord& a, const CHarmAnlsChord& b) {
        return static_cast<const CChordLite&>(a) < static_cast<const CChordLite&>(b);
    }
};

/// A chord of an analysis that knows where it starts.
class CHarmAnlsChordWithPos : public CHarmAnlsChord {
public:
    /// Start in beats.
    double mPosition = kPosUndef;

    constexpr CHarmAnlsChordWithPos() = default;
    /// A chord with its function at a position in beats.
    constexpr explicit CHarmAnlsChordWithPos(const CHarmAnlsChord& chord,
                                             double position = kPosUndef)
        : CHarmAnlsChord(chord), mPosition(position) {}
    /// A chord without a function at a position in beats.
    constexpr explicit CHarmAnlsChordWithPos(const CChordLite& chord, double position = kPosUndef)
        : CHarmAnlsChord(chord), mPosition(position) {}

    /// Writes the members without braces, the position first.
    void AppendJSONClassSubstring(std::ostream& stream) const;
    /// Writes the same in braces.
    void AppendJSONString(std::ostream& stream) const;

    friend constexpr bool operator==(const CHarmAnlsChordWithPos& a,
                                     const CHarmAnlsChordWithPos& b) {
        return static_cast<const CHarmAnlsChord&>(a) == static_cast<const CHarmAnlsChord&>(b) &&
               a.mPosition == b.mPosition;
    }
};

/// A chord of an analysis that knows how long it sounds.
class CHarmAnlsChordWithLength : public CHarmAnlsChord {
public:
    /// In beats.
    double mLength = kPosUndef;

    constexpr CHarmAnlsChordWithLength() = default;
    /// A chord with its function that sounds so many beats.
    constexpr explicit CHarmAnlsChordWithLength(const CHarmAnlsChord& chord,
                                                double length = kPosUndef)
        : CHarmAnlsChord(chord), mLength(length) {}
    /// A chord without a function that sounds so many beats.
    constexpr explicit CHarmAnlsChordWithLength(const CChordLite& chord, double length = kPosUndef)
        : CHarmAnlsChord(chord), mLength(length) {}

    /// Leaves of the chord its minor triad, or else the major triad on its root, without a bass and
    /// four beats long.
    void SimplifyChord();

    /// Writes the members without braces, the length first.
    void AppendJSONClassSubstring(std::ostream& stream) const;
    /// Writes the same in braces.
    void AppendJSONString(std::ostream& stream) const;

    /// Reads a chord with length from a dictionary.
    struct JSONDeserializer_Helper {
        /// Reads what AppendJSONString wrote. A missing number reads as 0, not as undefined.
        [[nodiscard]] static CHarmAnlsChordWithLength CHarmAnlsChordWithLengthFromJSONDictionary(
            const nlohmann::json& dictionary);
    };

    friend constexpr bool operator==(const CHarmAnlsChordWithLength& a,
                                     const CHarmAnlsChordWithLength& b) {
        return static_cast<const CHarmAnlsChord&>(a) == static_cast<const CHarmAnlsChord&>(b) &&
               a.mLength == b.mLength;
    }
};

static_assert(std::is_trivially_copyable_v<CHarmAnlsChordWithPos>);
static_assert(std::is_trivially_copyable_v<CHarmAnlsChordWithLength>);

/// Writes the JSON text, for debugging.
std::ostream& operator<<(std::ostream& stream, const CHarmAnlsChord& chord);
/// Writes the JSON text, for debugging.
std::ostream& operator<<(std::ostream& stream, const CHarmAnlsChordWithPos& chord);
/// Writes the JSON text, for debugging.
std::ostream& operator<<(std::ostream& stream, const CHarmAnlsChordWithLength& chord);

/// No chord: no root, no distances.
inline constexpr CHarmAnlsChord CHarmAnlsChord_Undef{};

}  // namespace brindle
