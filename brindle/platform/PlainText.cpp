// SPDX-License-Identifier: MIT
#include "brindle/platform/PlainText.h"

#include <fmt/format.h>

#include <cmath>
#include <iterator>
#include <limits>
#include <ostream>
#include <string>

namespace brindle::PlainText {

namespace {

// Room for the longest number: 309 digits of the largest double, sign, point, two decimals.
using TBuffer = fmt::basic_memory_buffer<char, 320>;

constexpr std::string_view kPlainFixed = "{:>6.2f}";

void Write(std::ostream& stream, const TBuffer& buffer) {
    PlainText::Write(stream, std::string_view(buffer.data(), buffer.size()));
}

}  // namespace

void Write(std::ostream& stream, std::string_view text) {
    stream.width(0);
    stream.write(text.data(), static_cast<std::streamsize>(text.size()));
}

void WriteInteger(std::ostream& stream, std::int64_t value, int width) {
    TBuffer buffer;
    fmt::format_to(std::back_inserter(buffer), "{:{}}", value, width);
    Write(stream, buffer);
}

void WriteUnsigned(std::ostream& stream, std::uint64_t value) {
    TBuffer buffer;
    fmt::format_to(std::back_inserter(buffer), "{}", value);
    Write(stream, buffer);
}

// Undefined positions are the lowest number there is, and each analysis has some. Its 309 digits
// take as long as 600 other numbers.
void WriteFixed(std::ostream& stream, double value) {
    static const std::string lowest =
        fmt::format(kPlainFixed, std::numeric_limits<double>::lowest());
    if (value == std::numeric_limits<double>::lowest()) return Write(stream, lowest);
    // What is no number has no sign that means anything.
    if (std::isnan(value)) value = std::numeric_limits<double>::quiet_NaN();
    TBuffer buffer;
    fmt::format_to(std::back_inserter(buffer), kPlainFixed, value);
    Write(stream, buffer);
}

void EndLine(std::ostream& stream) {
    stream.put('\n').flush();
}

}  // namespace brindle::PlainText
