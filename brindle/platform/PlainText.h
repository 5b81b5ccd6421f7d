// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <iosfwd>
#include <string_view>

/// Output that looks the same whatever width, fill, flags, precision and locale the stream was
/// given. It uses up the width, as all output does, and leaves the others as they were.
namespace brindle::PlainText {

/// The text as it is, without padding.
void Write(std::ostream& stream, std::string_view text);
/// Decimal, right-aligned in at least `width` places.
void WriteInteger(std::ostream& stream, std::int64_t value, int width = 0);
/// Decimal, without padding.
void WriteUnsigned(std::ostream& stream, std::uint64_t value);
/// Two digits after the point, right-aligned in at least 6 places: "  1.00", "  -inf",
/// "   nan".
void WriteFixed(std::ostream& stream, double value);
/// A line feed, and flushes the stream.
void EndLine(std::ostream& stream);

}  // namespace brindle::PlainText
