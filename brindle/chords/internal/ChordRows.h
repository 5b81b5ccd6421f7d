// SPDX-License-Identifier: MIT
#pragma once

#include <string_view>
#include <vector>

/// Chords and numerals as people type them in one word: `C-G-Am`, `ii7→V7→I`.
namespace brindle::ChordText {

/// Whether a word stands between chords and means nothing: a hyphen, an arrow, a comma.
[[nodiscard]] bool IsSeparator(std::string_view word);

[[nodiscard]] std::string_view WithoutCommasBehind(std::string_view word);

/// What stands between the separators of a word, without commas behind it; the first and the last
/// piece may be empty. Digits behind a hyphen belong to the chord before: `C-7-F` is `C-7` and `F`.
/// Only for words that make no sense as a whole.
[[nodiscard]] std::vector<std::string_view> PiecesOfRow(std::string_view word);

}  // namespace brindle::ChordText
