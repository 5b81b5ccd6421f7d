// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CSeparatorPattern.h"
#include "brindle/theory/CChordNamePrefs.h"

#include <string>
#include <vector>

namespace brindle {

/// How a chord text is read.
struct TChordStringParse {
    /// What stands between tokens; white space by default.
    CSeparatorPattern mSeparator;
    /// The length of a bar. Where it is 0, a bar line makes positions that are not a number.
    double mBeatsPerBar = 4.0;
    /// How far a chord or a hold mark moves on, in beats.
    double mBeatsPerChord = 1.0;
    /// Marks that move on to the next bar line; at a bar line they move nothing.
    std::vector<std::string> mBarTokens{"|"};
    /// Marks that hold the chord before them.
    std::vector<std::string> mHoldTokens{"."};
    /// Carried for the host; the reader finds slashes through `mChordNamePrefs`.
    std::vector<std::string> mSlashTokens{"/"};
    CChordNamePrefs mChordNamePrefs;  ///< how roots are named: German, syllables
};

}  // namespace brindle
