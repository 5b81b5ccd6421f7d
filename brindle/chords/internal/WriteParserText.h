// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordLite.h"

#include <string>

namespace brindle {
struct CChordNamePrefs;
}

namespace brindle::ChordText {

/// A text for CChordSetFromStringHelper.
struct CParserText {
    std::string mText;
    /// False: the text says the nearest chord, since none says this one.
    bool mIsExact = false;
};

/// Whether a text can say these tones above a root.
[[nodiscard]] bool IsExpressible(CSemitones semitones);

/// Writes a chord with a root, so that CChordSetFromStringHelper (with these preferences) and
/// ReadChordText (with `mBIsBFlat` as `mBForBFlat`) both read it back.
[[nodiscard]] CParserText WriteParserText(const CChordLite& chord, const CChordNamePrefs& prefs);

}  // namespace brindle::ChordText
