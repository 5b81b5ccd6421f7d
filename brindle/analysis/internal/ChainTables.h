// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>

namespace brindle {

/// Tenths of a point, so that sums are exact and equal ones are equal.
template <std::size_t Rows, std::size_t Columns>
using TChainTable = std::array<std::array<std::int16_t, Columns>, Rows>;

// The rows of eight are in the order of TKeyChordClass, those of sixteen in that of TKeyChordKind.
extern const TChainTable<16, 12> kChainMotion;
extern const TChainTable<16, 12> kChainGoal;
extern const TChainTable<8, 12> kChainTo;
extern const TChainTable<6, 16> kChainDepth;
extern const TChainTable<8, 24> kChainRest;

}  // namespace brindle
