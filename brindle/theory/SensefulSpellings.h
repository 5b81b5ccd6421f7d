// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CKeyEnh.h"

#include <array>
#include <cstddef>
#include <cstdint>

namespace brindle {

/// The spellings by which some keys can be written down, each with a letter of its own.
struct CSensefulSpellings {
    std::uint32_t mKeyNrs;  ///< bit k: key k
    std::uint32_t mEnhs;    ///< bit n: the spelling of value n - 1
};

/// Bit k for each key k of 0 to 11.
template <class... TKeyNr>
consteval std::uint32_t KeyNrBits(TKeyNr... keyNrs) {
    return ((1U << keyNrs) | ...);
}
/// Bit n for each spelling of value n - 1.
template <class... CSpelling>
consteval std::uint32_t EnhBits(CSpelling... enhs) {
    return ((1U << (enhs - TEnh_bbb)) | ...);
}

// clang-format off
/// All keys, those of equal spellings in one row.
inline constexpr auto kSensefulSpellings = std::to_array<CSensefulSpellings>({
    {KeyNrBits(0, 5),  EnhBits(TEnh_bb, TEnh_n, TEnh_s, TEnh_sss)},
    {KeyNrBits(1, 6),  EnhBits(TEnh_bbb, TEnh_b, TEnh_s, TEnh_ss)},
    {KeyNrBits(2),     EnhBits(TEnh_bbb, TEnh_bb, TEnh_n, TEnh_ss, TEnh_sss)},
    {KeyNrBits(3, 10), EnhBits(TEnh_bb, TEnh_b, TEnh_s, TEnh_sss)},
    {KeyNrBits(4, 11), EnhBits(TEnh_bbb, TEnh_b, TEnh_n, TEnh_ss)},
    {KeyNrBits(7),     EnhBits(TEnh_bb, TEnh_n, TEnh_ss, TEnh_sss)},
    {KeyNrBits(8),     EnhBits(TEnh_bbb, TEnh_b, TEnh_s, TEnh_sss)},
    {KeyNrBits(9),     EnhBits(TEnh_bbb, TEnh_bb, TEnh_n, TEnh_ss)},
});
// clang-format on

/// The spellings of each key, 0 to 11, as bits.
inline constexpr std::array<std::uint32_t, 12> kSensefulEnhsOfKeyNr = [] {
    std::array<std::uint32_t, 12> enhs{};
    for (std::size_t keyNr = 0; keyNr < enhs.size(); ++keyNr) {
        for (const CSensefulSpellings& row : kSensefulSpellings) {
            if ((row.mKeyNrs >> keyNr & 1U) != 0) enhs[keyNr] |= row.mEnhs;
        }
    }
    return enhs;
}();

// A spelling makes sense when taking the accidental away leaves a white key.
static_assert([] {
    for (int keyNr = 0; keyNr < 12; ++keyNr) {
        for (int enh = TEnh_bbb; enh <= TEnh_sss; ++enh) {
            const bool isLetter =
                IsWhiteKey((keyNr - EnhToSemitone(static_cast<TEnh>(enh)) + 12) % 12);
            const auto enhs = kSensefulEnhsOfKeyNr[static_cast<std::size_t>(keyNr)];
            if (isLetter != ((enhs >> (enh - TEnh_bbb) & 1U) != 0)) return false;
        }
    }
    return true;
}());

}  // namespace brindle
