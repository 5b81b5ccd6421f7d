// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CScaleHeavy.h"
#include "brindle/theory/CSignKeyLite.h"

#include <cstddef>
#include <string>
#include <string_view>

namespace brindle {

// The readers of names take a word that it does not know for "major". Somebody who typed it wants
// to know.

/// A key that was typed, or what is wrong with it and where.
struct CKeyText {
    CSignKeyLite mSignKey;  ///< the key; undefined if it could not be read
    std::string mError;     ///< what is wrong, for people; empty for a key
    /// Where the fault begins, in bytes from 0; 0 without one.
    std::size_t mColumn = 0;
};

/// Reads "F# minor", "Bb", "am" with accidentals in # and b, as the signs U+266F and U+266D or as
/// words ("E flat minor"), and German names: "fis-Moll", "B-Dur" (B flat major), "h moll" (B
/// minor), "Es".
[[nodiscard]] CKeyText ReadKeyText(std::string_view text);

/// A scale that was typed, or what is wrong with it and where.
struct CScaleText {
    CScaleHeavy mScale;  ///< the scale; undefined if it could not be read
    std::string mError;  ///< what is wrong, for people; empty for a scale
    /// Where the fault begins, in bytes from 0; 0 without one.
    std::size_t mColumn = 0;
};

/// Reads "D dorian", "Bb blues minor", "Am" with accidentals in the same ways, and all names of the
/// catalogue as they are printed: "A Natural Minor".
[[nodiscard]] CScaleText ReadScaleText(std::string_view text);

}  // namespace brindle
