// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/internal/NamingScan.h"

#include <span>
#include <vector>

namespace brindle {

/// The first `options.mLimit` candidates with all their texts.
[[nodiscard]] std::vector<CNamedChord> NamedChords(std::span<const CNamingCandidate> candidates,
                                                   std::span<const CNote> notes,
                                                   const CNamingOptions& options);

}  // namespace brindle
