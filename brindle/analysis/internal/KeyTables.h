// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstddef>

namespace brindle {

/// Points for [0 major, 1 minor][row][semitones above the tonic].
template <std::size_t Rows>
using TKeyTable = std::array<std::array<std::array<double, 12>, Rows>, 2>;

// The rows of eight are in the order of TKeyChordClass, those of sixteen in that of TKeyChordKind,
// those of 36 are the three groups of the chord before by the semitones up to the new root.
extern const TKeyTable<8> kKeyTimeTable;
extern const TKeyTable<1> kKeyBassTable;
extern const TKeyTable<8> kKeyFirstTable;
extern const TKeyTable<8> kKeyLastTable;
extern const TKeyTable<36> kKeyStepTable;
extern const TKeyTable<16> kKeyLocalTable;

}  // namespace brindle
