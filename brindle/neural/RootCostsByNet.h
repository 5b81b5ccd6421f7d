// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CNote.h"

#include <array>
#include <span>

namespace brindle {

/// What the net that hears roots says to each root key, as a cost for CNamingOptions::mRootCosts:
/// one tenth of a bit for each bit of doubt. With it, NameNotes finds the roots of fingerings
/// better: the net knows where the notes of a chord usually lie. Notes that are undefined are left
/// out; without notes there are no costs. Waits for the lock of the net.
[[nodiscard]] std::array<int, 12> RootCostsByNet(std::span<const CNote> notes);

}  // namespace brindle
