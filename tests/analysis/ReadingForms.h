// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/analysis/ReadHarmony.h"

#include <string>
#include <string_view>

namespace brindle::test {

/// Chord symbols in bars of four beats: those of a bar share it, what stands before a "|" is a bar.
[[nodiscard]] CHarmAnlsChords BarsOf(std::string_view text);

/// "C", or "c" for C minor; empty for an undefined key.
[[nodiscard]] std::string ShortKey(const CSignKeyLite& key);

/// "C: ii7~related second>1 V7~dominant!": the keys where they change, the numerals, the relations
/// and the resolutions of all chords that there are.
[[nodiscard]] std::string ReadingText(const CSongReading& reading);

}  // namespace brindle::test
