// SPDX-License-Identifier: MIT
#pragma once

// Internal to musicxml/: how attributes and texts of a score become fields of records.

#include "brindle/musicxml/CMuxmlAttributes.h"
#include "brindle/musicxml/CMuxmlBiMap.h"
#include "brindle/musicxml/MuxmlLimits.h"
#include "brindle/platform/ReadNumber.h"
#include "brindle/platform/Utf8.h"

#include <cmath>
#include <cstddef>
#include <cstdint>
#include <limits>
#include <string>
#include <string_view>
#include <type_traits>

namespace brindle::muxml {

/// A whole number for an unsigned field; a negative one wraps around.
[[nodiscard]] inline std::uint64_t ReadUnsigned(std::string_view text) {
    return static_cast<std::uint64_t>(std::int64_t{ReadInteger(text)});
}

[[nodiscard]] inline float ReadFloat(std::string_view text) {
    return static_cast<float>(ReadDecimal(text));
}

/// Toward zero; what lies beyond 32 bits is the nearest limit.
[[nodiscard]] inline std::int32_t TruncatedToInteger(float number) {
    constexpr float kLimit = 2147483648.0F;
    if (number >= kLimit) return std::numeric_limits<std::int32_t>::max();
    if (number < -kLimit) return std::numeric_limits<std::int32_t>::min();
    return std::isnan(number) ? 0 : static_cast<std::int32_t>(number);
}

[[nodiscard]] inline std::int64_t TruncatedToLargeInteger(float number) {
    constexpr float kLimit = 9223372036854775808.0F;
    if (number >= kLimit) return std::numeric_limits<std::int64_t>::max();
    if (number < -kLimit) return std::numeric_limits<std::int64_t>::min();
    return std::isnan(number) ? 0 : static_cast<std::int64_t>(number);
}

/// Arithmetic of 32 bits that wraps around.
[[nodiscard]] constexpr std::int32_t WrappedSum(std::int32_t a, std::int32_t b) {
    return static_cast<std::int32_t>(static_cast<std::uint32_t>(a) + static_cast<std::uint32_t>(b));
}
[[nodiscard]] constexpr std::int32_t WrappedDifference(std::int32_t a, std::int32_t b) {
    return static_cast<std::int32_t>(static_cast<std::uint32_t>(a) - static_cast<std::uint32_t>(b));
}
[[nodiscard]] constexpr std::int32_t WrappedProduct(std::int32_t a, std::int32_t b) {
    return static_cast<std::int32_t>(static_cast<std::uint32_t>(a) * static_cast<std::uint32_t>(b));
}
/// The integer part, wrapped around at 32 bits; 0 for what is no finite number.
[[nodiscard]] inline std::int32_t WrappedInteger(double number) {
    if (!std::isfinite(number)) return 0;
    const double part = std::fmod(std::trunc(number), 4294967296.0);
    return static_cast<std::int32_t>(static_cast<std::uint32_t>(static_cast<std::int64_t>(part)));
}

/// The text, or as many whole characters as kMuxmlMaxWordLength bytes hold.
[[nodiscard]] inline std::string_view Shortened(std::string_view text) {
    if (text.size() <= kMuxmlMaxWordLength) return text;
    std::size_t size = kMuxmlMaxWordLength;
    while (size > 0 && !BeginsUtf8Character(text[size])) --size;
    return text.substr(0, size);
}

// The attribute read into the field; a missing attribute and an unknown word leave it as it is.

template <class Field>
void ReadAttribute(const CMuxmlAttributes& attributes, std::string_view name, Field& field) {
    const auto text = attributes.Find(name);
    if (!text) return;
    if constexpr (std::is_enum_v<Field>) {
        field = MuxmlValueOf(*text, field);
    } else if constexpr (std::is_same_v<Field, float>) {
        field = ReadFloat(*text);
    } else if constexpr (std::is_same_v<Field, std::uint64_t>) {
        field = ReadUnsigned(*text);
    } else if constexpr (std::is_same_v<Field, std::int32_t>) {
        field = ReadInteger(*text);
    } else {
        field = Shortened(*text);
    }
}

}  // namespace brindle::muxml
