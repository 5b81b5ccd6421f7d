// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/ReadChordText.h"

#include <optional>

namespace brindle::ChordText {

class CUnifiedText;

/// The reading of a text that stands for no chord or for a repeat; nothing for any other text.
[[nodiscard]] std::optional<CChordTextReading> ReadNonChord(const CUnifiedText& text);

}  // namespace brindle::ChordText
