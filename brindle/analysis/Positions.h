// SPDX-License-Identifier: MIT
#pragma once

#include <limits>

namespace brindle {

/// No position, length or probability. Compared exactly.
inline constexpr double kPosUndef = std::numeric_limits<double>::lowest();

/// The open end of a range, behind every real position. Compared exactly.
inline constexpr double kPosEnd = std::numeric_limits<double>::max();

}  // namespace brindle
