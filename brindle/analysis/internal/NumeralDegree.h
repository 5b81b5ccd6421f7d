// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/internal/NumeralTables.h"
#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/CSignKeyLite.h"

#include <string_view>

namespace brindle {

/// A degree as it is written, and what is left of the text behind it.
struct CReadDegree {
    CNumeralDegree mDegree{0, 0};
    bool mIsSmall = false;
    bool mIsDigit = false;
    std::string_view mRest;

    [[nodiscard]] bool IsRead() const { return mDegree.mNumber > 0; }
};

/// `bVII`, `ii`, `#4`, `subV`; at most two accidentals. Reads on as far as the number goes.
[[nodiscard]] CReadDegree ReadDegree(std::string_view text);

/// In minor bIII, bVI and bVII are III, VI and VII, as many write them.
[[nodiscard]] CNumeralDegree FoldMinorFlat(CNumeralDegree degree, TSignKeyType type);

/// Semitones from the tonic to a degree, not folded: -1 for bI.
[[nodiscard]] int SemitonesOfDegree(CNumeralDegree degree, TSignKeyType type);

/// The note of a degree in a key, spelled: the third degree of E flat is a G.
[[nodiscard]] CKeyEnh NoteOfDegree(CNumeralDegree degree, const CSignKeyLite& key);

/// The note so many letters and semitones above another; -1 letters is one below.
[[nodiscard]] CKeyEnh SpelledAbove(const CKeyEnh& from, int letters, int semitones);

/// The letters from one spelled note up to another, 0 to 6.
[[nodiscard]] int LettersBetween(const CKeyEnh& from, const CKeyEnh& to);

}  // namespace brindle
