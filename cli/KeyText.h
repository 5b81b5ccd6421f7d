// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CScaleHeavy.h"
#include "brindle/theory/CSignKeyLite.h"

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

namespace brindle::cli {

// The library takes a word that it does not know for "major". Somebody who typed it wants to know.

/// A key that was typed, or what is wrong with it and where.
struct TKeyText {
    CSignKeyLite mSignKey;
    std::string mError;
    std::size_t mColumn = 0;
};

/// Reads "F# minor", "Bb", "am" with accidentals in # and b.
[[nodiscard]] TKeyText ReadKeyText(std::string_view text);

/// Reads what was typed behind --key. Nothing when that is no key; then the error has been printed.
[[nodiscard]] std::optional<CSignKeyLite> ReadKeyOption(std::string_view typed);

/// A scale that was typed, or what is wrong with it and where.
struct TScaleText {
    CScaleHeavy mScale;
    std::string mError;
    std::size_t mColumn = 0;
};

/// Reads "D dorian", "Bb blues minor", "Am" with accidentals in # and b.
[[nodiscard]] TScaleText ReadScaleText(std::string_view text);

}  // namespace brindle::cli
