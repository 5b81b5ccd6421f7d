// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CSemitones.h"

#include <string>
#include <string_view>

namespace brindle {

struct CNumeralOptions;

/// What stands behind the degree of a chord: a sign of kNumeralSigns and what changes it.
struct CChordSign {
    std::string_view mSign;
    /// `b9`, `add13`, `no5`.
    std::string mAlterations;
};

/// Whether the numeral of a chord has small letters.
[[nodiscard]] bool HasSmallNumeral(CSemitones semitones);

/// The sign that says all tones of a chord, from which TonesOfTail reads these again.
[[nodiscard]] CChordSign SignOfChord(CSemitones semitones, const CNumeralOptions& options);

}  // namespace brindle
