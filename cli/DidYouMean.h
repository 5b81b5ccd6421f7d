// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace brindle::cli {

/// The word that somebody who typed `typed` most likely meant: one that it begins, or the one with
/// the fewest letters wrong, missing, too many or exchanged, at most a third of them. Empty if none
/// is near.
[[nodiscard]] std::string NearestWord(std::string_view typed,
                                      const std::vector<std::string>& words);

/// A problem with the question whether a word was meant; the problem alone without one.
[[nodiscard]] std::string WithMeant(const std::string& problem, const std::string& meant);

}  // namespace brindle::cli
