// SPDX-License-Identifier: MIT
#pragma once

#include "cli/Output.h"

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace brindle::cli {

/// Whether the words of a command line are the single word "-", for standard input, or all look
/// like the names of files (keys.txt, ./keys) and are no chords.
[[nodiscard]] bool AreInputs(const std::vector<std::string>& words);

/// The content of a file, or of standard input for "-". Nothing when it cannot be read; then the
/// error has been printed.
[[nodiscard]] std::optional<std::string> ReadInput(const std::string& path);

/// What messages call an input: its path, or "standard input" for "-".
[[nodiscard]] std::string InputName(const std::string& path);

/// Whether a word of a command line is the name of a file: one that is there, or a word that looks
/// as if it should be (song.txt, ./blues) and is no chord.
[[nodiscard]] bool IsFileName(const std::string& word);

/// The words of a command line as one text; inputs are read. Nothing when one cannot be.
[[nodiscard]] std::optional<std::string> TextFromWords(const std::vector<std::string>& words);

/// What people type with the signs U+266F and U+266D, with # and b instead.
[[nodiscard]] std::string FoldAccidentals(std::string_view text);

/// The words of a command line as one line; of inputs the lines, without blank ones and without the
/// white space around the others.
[[nodiscard]] std::optional<std::vector<std::string>> TypedLines(
    const std::vector<std::string>& words);

/// The same, where a single word that names a file is read, too.
[[nodiscard]] std::optional<std::vector<std::string>> TypedSongLines(
    const std::vector<std::string>& words);

/// The pieces of a text between white space.
[[nodiscard]] std::vector<std::string> WordsOf(std::string_view text);

/// The words of a command line, or those of its inputs, without bar lines and the "." of songs.
/// Nothing when there are none, or when an input cannot be read; then the error has been printed.
[[nodiscard]] std::optional<std::vector<std::string>> TypedSymbols(
    const std::vector<std::string>& words);

}  // namespace brindle::cli
