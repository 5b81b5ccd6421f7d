// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace brindle::test {

/// What is wrong with the #include lines of one file, each fault a line for the reader. `path` is
/// relative to the source tree, as in "brindle/chords/CChordLite.h".
[[nodiscard]] std::vector<std::string> IncludeFaults(std::string_view path, std::string_view text);

/// The first file that `text` includes, without quotes or brackets; empty when there is none.
[[nodiscard]] std::string FirstInclude(std::string_view text);

}  // namespace brindle::test
