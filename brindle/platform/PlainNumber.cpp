// SPDX-License-Identifier: MIT
#include "brindle/platform/PlainNumber.h"

#include <clocale>
#include <cstdlib>
#include <limits>
#include <string>

#include <locale.h>

namespace brindle::PlainNumber {

namespace {

constexpr std::string_view kWhiteSpace = " \t\n\v\f\r";

bool IsDigit(char character) {
    return character >= '0' && character <= '9';
}

std::string_view WithoutWhiteSpace(std::string_view text) {
    const std::size_t first = text.find_first_not_of(kWhiteSpace);
    return first == std::string_view::npos ? std::string_view() : text.substr(first);
}

// Moves `pos` over decimal digits and tells whether there were any.
bool SkipDigits(std::string_view text, std::size_t& pos) {
    const std::size_t first = pos;
    while (pos < text.size() && IsDigit(text[pos])) ++pos;
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
    using Limits = std::numeric_limits<std::int32_t>;
    text = WithoutWhiteSpace(text);
    const bool isNegative = !text.empty() && text.front() == '-';
    std::size_t pos = 0;
    SkipSign(text, pos);
    std::int64_t value = 0;
    for (; pos < text.size() && IsDigit(text[pos]); ++pos) {
        value = value * 10 + (text[pos] - '0');
        if (value > Limits::max()) return isNegative ? Limits::min() : Limits::max();
    }
    return static_cast<std::int32_t>(isNegative ? -value : value);
}

double ReadDouble(std::string_view text) {
    static const locale_t plain = newlocale(LC_ALL_MASK, "C", nullptr);
    const std::string number(NumberAtFront(WithoutWhiteSpace(text)));
    return number.empty() ? 0.0 : strtod_l(number.c_str(), nullptr, plain);
}

}  // namespace brindle::PlainNumber
