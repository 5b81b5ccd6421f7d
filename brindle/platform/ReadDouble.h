// SPDX-License-Identifier: MIT
#pragma once

#include <string>

namespace brindle {

/// The number at the start of `text`, behind white space, as `atof` reads it in the "C" locale
/// whatever the program's locale is: 0.0 where there is none, infinity where it is too great.
[[nodiscard]] double ReadDouble(const std::string& text);

}  // namespace brindle
