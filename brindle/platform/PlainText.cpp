// SPDX-License-Identifier: MIT
#include "brindle/platform/PlainText.h"

#include <fmt/format.h>

#include <cmath>
#include <limits>
#include <ostream>
#include <string>

namespace brindle::PlainText {

namespace {

constexpr std::string_view kPlainFixed = "{:>6.2f}";

}  // namespace

void Write(std::ostream& stream, std::string_view text) {
    stream.width(0);
    stream.write(text.data(), static_cast<std::streamsize>(text.size()));
}

void WriteInteger(std::ostream& stream, std::int64_t value, int width) {
    Write(stream, fmt::format("{:{}}", value, width));
}

void WriteUnsigned(std::ostream& stream, std::uint64_t value) {
    Write(stream, fmt::format_int(value).c_str());
}

// Undefined positions are the lowest number there is, and each analysis has some. Its 309 digits
// take as long as 600 other numbers.
void WriteFixed(std::ostream& stream, double value) {
    static const std::string lowest =
        fmt::format(kPlainFixed, std::numeric_limits<double>::lowest());
    if (value == std::numeric_limits<double>::lowest()) return Write(stream, lowest);
    // What is no number has no sign that means anything.
    if (std::isnan(value)) value = std::numeric_limits<double>::quiet_NaN();
    Write(stream, fmt::format(kPlainFixed, value));
}

void EndLine(std::ostream& stream) {
    stream.put('\n').flush();
}

}  // namespace brindle::PlainText
