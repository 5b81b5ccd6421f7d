// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace brindle {

/// A key with German words in English ones: "h-moll" is "B minor", "B-Dur" "Bb major", "Es" "Eb
/// major". Before Dur or Moll, B is B flat and H is B; signs (Bb moll, F# moll) are read, too.
/// Nothing when the text has neither a German word of a type nor a German name of a key.
[[nodiscard]] std::optional<std::string> EnglishKeyText(std::string_view german);

}  // namespace brindle
