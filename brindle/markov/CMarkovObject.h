// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsChord.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <iosfwd>
#include <limits>
#include <nlohmann/json_fwd.hpp>
#include <string>

namespace brindle {

/// What a symbol of a chord sequence is.
enum TMarkovObjectType : std::int32_t {
    TMarkovObjectType_Chord = 1,   ///< told apart by `mChord`
    TMarkovObjectType_Number = 2,  ///< told apart by `mNumber`
    TMarkovObjectType_Value = 3,   ///< told apart by `mValue`
    TMarkovObjectType_Start = 4,   ///< stands before a sequence
    TMarkovObjectType_End = 5,     ///< stands behind a sequence
    TMarkovObjectType_Gap = 6,     ///< silence, or a place that is to be filled
    TMarkovObjectType_Indexed = 7  ///< told apart by `mIndex`
};

/// A symbol of a chord sequence: a chord with its length, or one that marks the start, the end or a
/// gap. Those that are no chord hold an undefined chord, of length 1.0 unless they are gaps of
/// another length.
struct CMarkovObject {
    /// A TMarkovObjectType; others are kept as they are.
    std::int32_t mType = TMarkovObjectType_Chord;
    /// -1 unless the symbol is an indexed one.
    std::int32_t mIndex = -1;
    /// The chord, with its length in beats.
    CHarmAnlsChordWithLength mChord{CHarmAnlsChord{}, 1.0};
    /// Of a value symbol; the lowest double in others.
    double mValue = std::numeric_limits<double>::lowest();
    /// Take part in equality only.
    std::array<std::uint64_t, 3> mFurtherValues{};
    std::int32_t mNumber = 1;  ///< of a number symbol; 1 in others

    /// A gap takes up time, too.
    [[nodiscard]] constexpr bool IsGap() const { return mType == TMarkovObjectType_Gap; }
    /// Chords and gaps take up time, the other symbols do not.
    [[nodiscard]] constexpr bool HasBeats() const {
        return mType == TMarkovObjectType_Chord || IsGap();
    }
    /// The same for equal symbols.
    [[nodiscard]] std::size_t Hash() const;

    /// Writes an object with the type and the chord or the index. Kept: a number or a value is not
    /// written, and the text of these and of indexed symbols is no strict JSON.
    void AppendJSONString(std::ostream& stream) const;

    /// Reads a symbol from a dictionary.
    struct JSONDeserialization_Helper {
        /// Reads what AppendJSONString wrote. Kept: gaps, and whatever is not known, become the
        /// undefined chord of length 1.0.
        [[nodiscard]] static CMarkovObject CMarkovObjectFromJSONDictionary(
            const nlohmann::json& dictionary);
        /// The same from a text; one that is no JSON reads as an empty dictionary.
        [[nodiscard]] static CMarkovObject CMarkovObjectFromJSONString(const std::string& text);
    };

    /// Compares all fields: C sharp and D flat are two symbols.
    friend constexpr bool operator==(const CMarkovObject&, const CMarkovObject&) = default;
    /// The order of tables: by type; chords by root distance, length, bass distance and semitones,
    /// so that C sharp and D flat stand in one place there; numbers, values and indexed symbols by
    /// what tells them apart. Start, end and gap symbols have one place each.
    friend bool operator<(const CMarkovObject& a, const CMarkovObject& b);
};

/// Writes type, index and chord, for debugging.
std::ostream& operator<<(std::ostream& stream, const CMarkovObject& object);

/// A symbol of that type with the defaults of all other fields.
[[nodiscard]] constexpr CMarkovObject MarkovObjectOfType(TMarkovObjectType type) {
    CMarkovObject object;
    object.mType = type;
    return object;
}

/// Stands before a sequence, as often as the history is long.
inline constexpr CMarkovObject CMarkovObject_Start = MarkovObjectOfType(TMarkovObjectType_Start);
/// Stands behind a sequence, as often as the history is long.
inline constexpr CMarkovObject CMarkovObject_End = MarkovObjectOfType(TMarkovObjectType_End);
/// The plain gap, of one beat.
inline constexpr CMarkovObject CMarkovObject_Gap = MarkovObjectOfType(TMarkovObjectType_Gap);

}  // namespace brindle
