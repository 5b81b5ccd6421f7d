// SPDX-License-Identifier: MIT
#include "brindle/platform/Utf8.h"

#include <algorithm>
#include <array>

namespace brindle {
namespace {

struct CLeadByte {
    unsigned char mFirst;
    unsigned char mLast;
    std::size_t mLength;
    // The range of the second byte; the others are 0x80 to 0xBF.
    unsigned char mSecondMin;
    unsigned char mSecondMax;
};

// The well-formed byte sequences of the Unicode standard, table 3-7.
constexpr auto kLeadBytes = std::to_array<CLeadByte>({
    {0x00, 0x7F, 1, 0x00, 0x00},
    {0xC2, 0xDF, 2, 0x80, 0xBF},
    {0xE0, 0xE0, 3, 0xA0, 0xBF},
    {0xE1, 0xEC, 3, 0x80, 0xBF},
    {0xED, 0xED, 3, 0x80, 0x9F},
    {0xEE, 0xEF, 3, 0x80, 0xBF},
    {0xF0, 0xF0, 4, 0x90, 0xBF},
    {0xF1, 0xF3, 4, 0x80, 0xBF},
    {0xF4, 0xF4, 4, 0x80, 0x8F},
});

struct CCodeRange {
    std::uint32_t mFirst;
    std::uint32_t mLast;
};

constexpr auto kUnprintable = std::to_array<CCodeRange>({
    {0x0000, 0x001F},
    {0x007F, 0x009F},
    {0x2028, 0x202E},
    {0x2066, 0x2069},
    {0xFFFE, 0xFFFF},
});

bool Fits(const CLeadByte& row, std::string_view text) {
    if (text.size() < row.mLength) return false;
    for (std::size_t i = 1; i < row.mLength; ++i) {
        const auto byte = static_cast<unsigned char>(text[i]);
        const unsigned char min = i == 1 ? row.mSecondMin : 0x80;
        const unsigned char max = i == 1 ? row.mSecondMax : 0xBF;
        if (byte < min || byte > max) return false;
    }
    return true;
}

}  // namespace

std::size_t Utf8Length(std::string_view text) {
    if (text.empty()) return 0;
    const auto lead = static_cast<unsigned char>(text[0]);
    for (const CLeadByte& row : kLeadBytes) {
        if (lead >= row.mFirst && lead <= row.mLast) return Fits(row, text) ? row.mLength : 0;
    }
    return 0;
}

std::uint32_t CodePointOf(std::string_view character) {
    std::uint32_t code = static_cast<unsigned char>(character[0]);
    if (character.size() > 1) code &= 0x7FU >> character.size();
    for (const char byte : character.substr(1)) {
        code = code << 6 | (static_cast<unsigned char>(byte) & 0x3FU);
    }
    return code;
}

bool IsUnprintable(std::string_view character) {
    const std::uint32_t code = CodePointOf(character);
    return std::any_of(kUnprintable.begin(), kUnprintable.end(), [code](const CCodeRange& range) {
        return code >= range.mFirst && code <= range.mLast;
    });
}

}  // namespace brindle
