// SPDX-License-Identifier: MIT
#include "brindle/platform/Utf16.h"

#include "brindle/platform/Utf8.h"

#include <cstdint>

namespace brindle {

namespace {

constexpr std::string_view kBigEndianMark = "\xFE\xFF";
constexpr std::string_view kLittleEndianMark = "\xFF\xFE";

constexpr std::uint32_t kHighSurrogates = 0xD800;
constexpr std::uint32_t kLowSurrogates = 0xDC00;
constexpr std::uint32_t kSurrogatesEnd = 0xE000;
constexpr std::uint32_t kFirstPair = 0x10000;

std::uint32_t CodeByteAt(std::string_view bytes, std::size_t index) {
    return static_cast<unsigned char>(bytes[index]);
}

void AppendUnit(std::string& bytes, std::uint32_t unit) {
    bytes += static_cast<char>(unit >> 8 & 0xFF);
    bytes += static_cast<char>(unit & 0xFF);
}

void AppendUtf8(std::string& text, std::uint32_t code) {
    const auto append = [&](std::uint32_t byte) { text += static_cast<char>(byte); };
    const auto appendRest = [&](unsigned shift) { append(0x80 | (code >> shift & 0x3F)); };
    if (code < 0x80) return append(code);
    if (code < 0x800) {
        append(0xC0 | code >> 6);
        return appendRest(0);
    }
    if (code < kFirstPair) {
        append(0xE0 | code >> 12);
    } else {
        append(0xF0 | code >> 18);
        appendRest(12);
    }
    appendRest(6);
    appendRest(0);
}

}  // namespace

std::optional<std::string> Utf16FromUtf8(std::string_view text) {
    std::string bytes(kBigEndianMark);
    while (!text.empty()) {
        const std::size_t length = Utf8Length(text);
        if (length == 0) return std::nullopt;
        const std::uint32_t code = CodePointOf(text.substr(0, length));
        if (code >= kFirstPair) {
            AppendUnit(bytes, kHighSurrogates + ((code - kFirstPair) >> 10));
            AppendUnit(bytes, kLowSurrogates + ((code - kFirstPair) & 0x3FF));
        } else {
            AppendUnit(bytes, code);
        }
        text.remove_prefix(length);
    }
    return bytes;
}

std::optional<std::string> Utf8FromUtf16(std::string_view bytes) {
    if (bytes.size() % 2 != 0) return std::nullopt;
    const std::string_view mark = bytes.substr(0, 2);
    const bool isLittleEndian = mark == kLittleEndianMark;
    if (isLittleEndian || mark == kBigEndianMark) bytes.remove_prefix(2);
    const auto unitAt = [&](std::size_t index) {
        const std::uint32_t first = CodeByteAt(bytes, index);
        const std::uint32_t second = CodeByteAt(bytes, index + 1);
        return isLittleEndian ? second << 8 | first : first << 8 | second;
    };
    std::string text;
    text.reserve(bytes.size() / 2);
    for (std::size_t i = 0; i < bytes.size(); i += 2) {
        std::uint32_t code = unitAt(i);
        if (code >= kHighSurrogates && code < kSurrogatesEnd) {
            if (code >= kLowSurrogates || i + 2 >= bytes.size()) return std::nullopt;
            const std::uint32_t low = unitAt(i + 2);
            if (low < kLowSurrogates || low >= kSurrogatesEnd) return std::nullopt;
            code = kFirstPair + ((code - kHighSurrogates) << 10) + (low - kLowSurrogates);
            i += 2;
        }
        AppendUtf8(text, code);
    }
    return text;
}

}  // namespace brindle
