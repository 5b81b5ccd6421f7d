// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace brindle::cli {

/// The symbols of a chord text: its words, without bar lines and the "." of songs.
[[nodiscard]] std::vector<std::string> SymbolsOf(std::string_view text);

/// The words of a command line, with the symbols of inputs (Input.h) in their places, be these
/// lists of symbols or songs in any form; without bar lines and the "." of songs. Nothing when
/// there are none, or when an input cannot be read; then the error has been printed.
[[nodiscard]] std::optional<std::vector<std::string>> TypedSymbols(
    const std::vector<std::string>& words);

}  // namespace brindle::cli
