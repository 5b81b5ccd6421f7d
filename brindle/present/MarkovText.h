// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CProgressionSpelling.h"
#include "brindle/markov/VariableLengthMarkovModel.h"
#include "brindle/theory/CSignKeyLite.h"

#include <string>

namespace brindle {

/// How the chords of a sequence are spelled: all in one key, that of the sequence, so that no Ab7
/// goes to F#7. Learned chords keep the spelling of the songs that they come from, which differ.
/// The names are those of CProgressionSpelling. Without a key chords stay as they are.
class CMarkovSpelling {
public:
    /// Spells in the key that FindKeys finds for the sequence; what is shown beside it has the same
    /// names.
    explicit CMarkovSpelling(MarkovSequenceView sequence, MarkovSequenceView beside = {});
    /// Spells in a key; an undefined one changes nothing.
    explicit CMarkovSpelling(const CSignKeyLite& key) : mKey(key), mNames(key) {}

    /// Undefined for a sequence without chords.
    [[nodiscard]] const CSignKeyLite& Key() const { return mKey; }
    /// The same tones with the spelling of this key.
    [[nodiscard]] CChordLite Spelled(const CChordLite& chord) const {
        return mNames.Spelled(chord);
    }
    /// A chord as people type it, "U" for a gap, "start" and "end", "#3" for an indexed symbol.
    [[nodiscard]] std::string SymbolOf(const CMarkovObject& object) const;

private:
    CSignKeyLite mKey;
    CProgressionSpelling mNames;
};

/// The chord string of a sequence, as it is typed: "(4,C);(2,G7)".
[[nodiscard]] std::string ChordString(MarkovSequenceView sequence, const CMarkovSpelling& spelling);

/// The sequence as a chord text with a step for each beat, "C | F . G7", in which a bar has
/// `beatsPerBar` beats and a line `barsPerLine` bars, 0 for one line; or the chord string if the
/// chords do not begin on beats.
[[nodiscard]] std::string BarsText(MarkovSequenceView sequence, const CMarkovSpelling& spelling,
                                   int beatsPerBar, int barsPerLine);

}  // namespace brindle
