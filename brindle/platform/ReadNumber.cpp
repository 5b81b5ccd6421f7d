// SPDX-License-Identifier: MIT
#include "brindle/platform/ReadNumber.h"

#include "brindle/platform/Ascii.h"

#include <locale.h>
#include <stdlib.h>
#include <algorithm>
#include <limits>
#ifdef __APPLE__
#include <xlocale.h>
#endif

namespace brindle {

namespace {

// Moves `pos` over decimal digits and tells whether there were any.
bool SkipDigits(std::string_view text, std::size_t& pos) {
    const std::size_t first = pos;
    while (pos < text.size() && Ascii::IsDigit(text[pos])) ++pos;
    return pos > first;
}

bool SkipSign(std::string_view text, std::size_t& pos) {
    const bool isSign = pos < text.size() && (text[pos] == '-' || text[pos] == '+');
    if (isSign) ++pos;
    return isSign;
}

// The longest front of the text that is a decimal number; empty if there is none.
std::string_view NumberAtFront(std::string_view text) {
    std::size_t pos = 0;
    SkipSign(text, pos);
    bool hasDigits = SkipDigits(text, pos);
    if (pos < text.size() && text[pos] == '.') {
        ++pos;
        hasDigits = SkipDigits(text, pos) || hasDigits;
    }
    if (!hasDigits) return {};
    std::size_t exponent = pos + 1;
    if (pos < text.size() && (text[pos] == 'e' || text[pos] == 'E')) {
        SkipSign(text, exponent);
        if (SkipDigits(text, exponent)) pos = exponent;
    }
    return text.substr(0, pos);
}

}  // namespace

std::int32_t ReadInteger(std::string_view text) {
    constexpr std::int64_t kSmallest = std::numeric_limits<std::int32_t>::min();
    constexpr std::int64_t kLargest = std::numeric_limits<std::int32_t>::max();
    text = Ascii::TrimmedInFront(text);
    const bool isNegative = text.starts_with('-');
    if (isNegative || text.starts_with('+')) text.remove_prefix(1);
    std::int64_t magnitude = 0;
    for (const char c : text) {
        if (!Ascii::IsDigit(c)) break;
        magnitude = std::min(magnitude * 10 + (c - '0'), -kSmallest);
    }
    return static_cast<std::int32_t>(isNegative ? -magnitude : std::min(magnitude, kLargest));
}

double ReadDouble(const std::string& text) {
    static const locale_t kClassic = newlocale(LC_ALL_MASK, "C", nullptr);
    return strtod_l(text.c_str(), nullptr, kClassic);
}

double ReadDecimal(std::string_view text) {
    return ReadDouble(std::string(NumberAtFront(Ascii::TrimmedInFront(text))));
}

}  // namespace brindle
