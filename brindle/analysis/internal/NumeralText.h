// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/internal/KeyChords.h"
#include "brindle/analysis/internal/NumeralTables.h"

#include <string>
#include <string_view>

namespace brindle {

/// Whether a class is written in small letters: the minor and diminished chords.
[[nodiscard]] constexpr bool IsSmallNumeral(TKeyChordClass chordClass) {
    return chordClass == TKeyChordClass_Min || chordClass == TKeyChordClass_Min7 ||
           chordClass == TKeyChordClass_HDim || chordClass == TKeyChordClass_Dim;
}

/// What stands behind the degree of a chord as far as its class goes: 7, ^7, h7, o7. One of
/// kNumeralSigns.
[[nodiscard]] std::string_view NumeralSignOf(CSemitones semitones);

/// The degree so many semitones above the tonic of a key by its number.
[[nodiscard]] const CNumeralDegree& NumeralDegreeOf(int degree, int key);

/// Appends so many sharps, or flats for a negative number.
void AppendAccidentals(std::string& text, int accidental);

/// Appends a degree of 1 to 7: "bVI", "ii".
void AppendDegree(std::string& text, const CNumeralDegree& degree, bool isSmall);

}  // namespace brindle
