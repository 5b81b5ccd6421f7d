// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/ReadChordText.h"
#include "brindle/chords/internal/CTextScan.h"
#include "brindle/chords/internal/KeySpelling.h"

#include <optional>

namespace brindle::ChordText {

/// A note as it is written: a letter and an accidental.
struct CWrittenNote {
    /// 0 (C) to 6 (B).
    int mLetter = 0;
    /// -2 to 2 from the notes that are read.
    int mAccidental = 0;
    /// Written with H for B.
    bool mIsH = false;

    /// Accidentals beyond -3 to 3 have no spelling.
    [[nodiscard]] CKeyEnh KeyEnh() const;
};

/// Reads a note name with its accidental and moves behind it: `Eb`, `fis`, `C sharp`, `As`.
[[nodiscard]] std::optional<CWrittenNote> TakeNote(CTextScan& scan, const CChordTextOptions& prefs);

/// Whether the accidental behind a note that was just read is one too many, as in `C###`; a sign
/// that alters a degree, as in `C##5`, is none.
[[nodiscard]] bool SeesOneAccidentalTooMany(const CTextScan& scan, const CWrittenNote& note);

}  // namespace brindle::ChordText
