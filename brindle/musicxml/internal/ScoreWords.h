// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <string_view>
#include <vector>

namespace brindle {

struct CPlayMarks;

/// Reads what a musician writes in words, "D.C. al Fine", "To Coda", "3x", in any case and
/// punctuation. `hasCodaSign` tells that the sign of the coda stands beside the words.
void ReadPlayWords(std::string_view words, bool hasCodaSign, CPlayMarks& marks);

/// Greatest number of a pass that an ending can be for.
inline constexpr std::int32_t kHighestEndingNumber = 9999;

/// The passes that an ending tells: "1, 2", "1.-3.". At most 64, each from 1 up to
/// kHighestEndingNumber.
[[nodiscard]] std::vector<std::int32_t> ReadEndingNumbers(std::string_view text);

}  // namespace brindle
