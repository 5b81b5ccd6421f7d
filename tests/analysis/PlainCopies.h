// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/analysis/CHarmCopy.h"

#include <cstdint>
#include <utility>
#include <vector>

namespace brindle::test {

using TPlainSequences = std::vector<std::pair<std::vector<std::uint64_t>, std::uint64_t>>;

// The search for repeated passages step by step: every chord against every later one. The library
// must find the same in far fewer steps.

[[nodiscard]] CHarmAnlsChordsWithLength PlainChordsWithLength(const CHarmAnlsChords& chords);
[[nodiscard]] TPlainSequences PlainSequences(const CHarmAnlsChordsWithLength& chords);
[[nodiscard]] CHarmCopies PlainCopies(const CHarmAnlsChords& chords);

}  // namespace brindle::test
