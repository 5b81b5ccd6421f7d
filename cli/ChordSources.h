// SPDX-License-Identifier: MIT
#pragma once

#include "cli/TypedChords.h"

#include "brindle/markov/MarkovChords.h"

#include <string>
#include <vector>

namespace brindle::cli {

/// A file with chords that have lengths.
struct CChordSource {
    /// The chords, cut where there is no chord.
    std::vector<CHarmAnlsChordsWithLength> mSequences;
    /// What is wrong, if the file cannot be read.
    std::string mError;
};

/// Reads a lead sheet in MusicXML, chord strings such as (4,C);(2,G7), one a line, or a chord text.
/// The content tells which of them it is. "-" is standard input.
[[nodiscard]] CChordSource ReadChordSource(const std::string& path, const CTypedChords& reading);

}  // namespace brindle::cli
