// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/TSignKeyType.h"

namespace brindle {

/// Sharps of the key signature, flats as a negative number; 0 for an undefined key or type.
[[nodiscard]] int SignsCountForSignKeyWithKeyEnhAndSignKeyType(CKeyEnh root, TSignKeyType type);
/// The number of signs of the key signature, sharps or flats.
[[nodiscard]] int SignsCountAbsForSignKeyWithKeyEnhAndSignKeyType(CKeyEnh root, TSignKeyType type);

/// The fewest signs with which a sign key on this key can be written, flats as a negative number:
/// F sharp major and D sharp minor count with their six sharps. 0 for an undefined key or type.
[[nodiscard]] int MinimalSignsCountForSignKeyWithKeyNrAndSignKeyType(int keyNr, TSignKeyType type);

}  // namespace brindle
