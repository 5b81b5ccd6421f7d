// SPDX-License-Identifier: MIT
#pragma once

namespace brindle {

/// The version of the library as text and as one number: major * 10000 + minor * 100 + patch.
inline constexpr const char* BrindleVersionString = "0.1.0";
inline constexpr int BrindleVersionNumber = 100;

}  // namespace brindle
