// SPDX-License-Identifier: MIT
#pragma once

#include "cli/Output.h"

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace brindle::cli {

/// Whether the words of a command line are the single word "-", for standard input, or all look
/// like the names of files (keys.txt, ./keys, or one that is there) and are no chords.
[[nodiscard]] bool AreInputs(const std::vector<std::string>& words);

/// A song has a few kilobytes; what is larger than this is no chord text but a mistake.
inline constexpr std::size_t kMostInputBytes = std::size_t{64} << 20;

/// The content of a file, or of standard input for "-". Nothing when it cannot be read or is larger
/// than `mostBytes`; then the error has been printed.
[[nodiscard]] std::optional<std::string> ReadInput(const std::string& path,
                                                   std::size_t mostBytes = kMostInputBytes);

/// The same of a text, which is put into UTF-8 if it is UTF-16, or of a score as it is. Other bytes
/// are an error.
[[nodiscard]] std::optional<std::string> ReadTextInput(const std::string& path);

/// What messages call an input: its path, or "standard input" for "-".
[[nodiscard]] std::string InputName(const std::string& path);

/// Whether a word of a command line is the name of a file: one that is there, or a word that looks
/// as if it should be (song.txt, ./blues, songs/blues) and is no chord.
[[nodiscard]] bool IsFileName(const std::string& word);

/// What people type with the signs U+266F and U+266D, with # and b instead.
[[nodiscard]] std::string FoldAccidentals(std::string_view text);

/// The words of a command line as one line; of inputs the lines, without blank ones and without the
/// white space around the others. Nothing when there are none; then the error has been printed.
[[nodiscard]] std::optional<std::vector<std::string>> TypedLines(
    const std::vector<std::string>& words);

/// The pieces of a text between white space.
[[nodiscard]] std::vector<std::string> WordsOf(std::string_view text);

}  // namespace brindle::cli
