// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/markov/CMarkovObject.h"

#include <string>
#include <string_view>
#include <vector>

namespace brindle {

/// A sequence that was typed, or what is wrong with it.
struct CMarkovSequenceText {
    /// Empty after an error.
    std::vector<CMarkovObject> mSymbols;
    /// Empty if nothing is wrong.
    std::string mError;
};

/// Reads chords with their lengths in beats as people type them, such as "(4,C♯); (8,U); (4,G7)":
/// "U" is a gap, blanks are allowed. HarmChordsFromChordString takes what it does not know for no
/// chord; somebody who typed it wants to know.
[[nodiscard]] CMarkovSequenceText ReadMarkovSequence(std::string_view text);

}  // namespace brindle
