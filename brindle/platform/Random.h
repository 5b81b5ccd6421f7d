// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>

namespace brindle {

/// 32 random bits from the operating system's generator.
[[nodiscard]] std::uint32_t RandomBits();

}  // namespace brindle
