// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>

namespace brindle {

/// A kind of chord in a lead sheet: its word, and the semitones above the root.
struct CKindRow {
    std::string_view mWord;
    std::size_t mCount;
    std::array<int, 7> mIntvls;
    bool mIsTested = true;  ///< whether a mask is named by this word

    [[nodiscard]] constexpr std::uint64_t Mask() const {
        std::uint64_t mask = 0;
        for (std::size_t i = 0; i < mCount; ++i) mask |= std::uint64_t{1} << mIntvls[i] % 12;
        return mask;
    }
};

// Word, number of semitones, semitones above the root.
// clang-format off
inline constexpr auto kKindRows = std::to_array<CKindRow>({
    {"major",              3, {0, 4, 7}},
    {"minor",              3, {0, 3, 7}},
    {"augmented",          3, {0, 4, 8}},
    {"diminished",         3, {0, 3, 6}},
    {"dominant",           4, {0, 4, 7, 10}},
    {"major-seventh",      4, {0, 4, 7, 11}},
    {"minor-seventh",      4, {0, 3, 7, 10}},
    {"diminished-seventh", 4, {0, 3, 6, 9}},
    {"augmented-seventh",  4, {0, 4, 8, 10}},
    {"half-diminished",    4, {0, 3, 6, 10}},
    {"major-minor",        4, {0, 3, 7, 11}},
    {"major-sixth",        4, {0, 4, 7, 9}},
    {"minor-sixth",        4, {0, 3, 7, 9}},
    {"dominant-ninth",     5, {0, 4, 7, 10, 14}},
    {"major-ninth",        5, {0, 4, 7, 11, 14}},
    {"minor-ninth",        5, {0, 3, 7, 10, 14}},
    {"dominant-11th",      6, {0, 4, 7, 10, 14, 17}},
    {"major-11th",         6, {0, 4, 7, 11, 14, 17}},
    {"minor-11th",         6, {0, 3, 7, 10, 14, 17}},
    {"dominant-13th",      7, {0, 4, 7, 10, 14, 17, 21}},
    {"major-13th",         7, {0, 4, 7, 11, 14, 17, 21}},
    {"minor-13th",         7, {0, 3, 7, 10, 14, 17, 21}},
    {"suspended-second",   3, {0, 2, 7}},
    {"suspended-fourth",   3, {0, 5, 7}},
    {"Neapolitan",         3, {0, 3, 8}},
    {"Italian",            3, {0, 4, 10}},
    {"French",             4, {0, 4, 6, 10}},
    {"pedal",              1, {0}, false},
    {"power",              2, {0, 7}},
});
// clang-format on

/// Null for a word that is no kind.
[[nodiscard]] constexpr const CKindRow* KindRowOf(std::string_view kind) {
    for (const CKindRow& row : kKindRows) {
        if (row.mWord == kind) return &row;
    }
    return nullptr;
}

}  // namespace brindle
