// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsChords.h"

#include <string>
#include <vector>

namespace brindle {

struct TMusicXMLDoc;

/// The symbol that stands for a chord of an analysis: what the user typed at its position. Every
/// presentation asks here, so that printed chord names have one place.
class CChordSymbols {
public:
    CChordSymbols() = default;
    /// The symbol of each chord but the end marker.
    CChordSymbols(const std::vector<std::string>& symbols, const CHarmAnlsChords& chords);
    /// `chords` are those of the score, with rests.
    CChordSymbols(const TMusicXMLDoc& sheet, const CHarmAnlsChords& chords);

    /// Empty for the end marker and for a chord that does not come from the text.
    [[nodiscard]] const std::string& SymbolOf(const CHarmAnlsChordWithPos& chord) const;

private:
    // Ascending, and the chord and the symbol of each.
    std::vector<double> mPositions;
    std::vector<CChordLite> mChords;
    std::vector<std::string> mSymbols;
};

}  // namespace brindle
