// SPDX-License-Identifier: MIT
#include "brindle/platform/ReadNumber.h"

#include <locale.h>
#include <stdlib.h>
#include <algorithm>
#include <limits>
#ifdef __APPLE__
#include <xlocale.h>
#endif

namespace brindle {

std::int32_t ReadInteger(std::string_view text) {
    constexpr std::int64_t kMin = std::numeric_limits<std::int32_t>::min();
    constexpr std::int64_t kMax = std::numeric_limits<std::int32_t>::max();
    text.remove_prefix(std::min(text.find_first_not_of(" \t\n\v\f\r"), text.size()));
    const bool isNegative = text.starts_with('-');
    if (isNegative || text.starts_with('+')) text.remove_prefix(1);
    std::int64_t magnitude = 0;
    for (const char c : text) {
        if (c < '0' || c > '9') break;
        magnitude = std::min(magnitude * 10 + (c - '0'), -kMin);
    }
    return static_cast<std::int32_t>(isNegative ? -magnitude : std::min(magnitude, kMax));
}

double ReadDouble(const std::string& text) {
    static const locale_t kClassic = newlocale(LC_ALL_MASK, "C", nullptr);
    return strtod_l(text.c_str(), nullptr, kClassic);
}

}  // namespace brindle
