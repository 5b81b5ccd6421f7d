// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordLite.h"
#include "brindle/theory/CHarmCenterLite.h"
#include "brindle/theory/CSignKeyLite.h"

namespace brindle::test {

/// The two questions of the analysis about a chord, asked of the full chord and the full scale as
/// they are described. Slow; answers are remembered so that tests can ask them again and again.

[[nodiscard]] bool PlainIsCompatible(const CChordLite& chord, const CHarmCenterLite& center);
[[nodiscard]] bool PlainIsInSignKey(const CChordLite& chord, const CSignKeyLite& signKey);

}  // namespace brindle::test
