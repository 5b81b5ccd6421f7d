// SPDX-License-Identifier: MIT
#pragma once

#include <string_view>
#include <vector>

/// Chords and numerals as people type them in one word: `C-G-Am`, `ii7→V7→I`.
namespace brindle::ChordText {

/// Whether a word stands between chords and means nothing: a hyphen, an arrow, a comma.
[[nodiscard]] bool IsSeparator(std::string_view word);

[[nodiscard]] std::string_view WithoutCommasBehind(std::string_view word);

/// What stands between the separators of a word, without commas behind it. Pieces may be empty.
/// Only for words that make no sense as a whole: `C-7` is one chord.
[[nodiscard]] std::vector<std::string_view> PiecesOfRow(std::string_view word);

}  // namespace brindle::ChordText
