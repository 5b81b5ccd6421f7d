// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/RomanNumeral.h"
#include "brindle/platform/CTextFault.h"

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace brindle {

/// A word of a text of numerals.
struct CNumeralWord {
    std::string mText;  ///< as it is written
    /// The line, from 1.
    std::size_t mLine = 0;
    /// The column in characters, not bytes, from 1.
    std::size_t mColumn = 0;
    /// Undefined for a mark, for a word such as "N.C.", and for what is not understood.
    CChordLite mChord;

    /// A bar line or a hold: `|`, `||`, `.`
    [[nodiscard]] bool IsMark() const { return mText == "|" || mText == "||" || mText == "."; }
};

/// What ReadNumerals makes of a text.
struct CNumeralsReading {
    std::vector<CNumeralWord> mWords;  ///< with marks and what is not understood
    /// Empty if all is understood.
    std::vector<CTextFault> mFaults;
};

/// The words between white space, with their places; their chords are undefined.
[[nodiscard]] std::vector<CNumeralWord> NumeralWords(std::string_view text);

/// The numerals of the chords of all words in one key; empty for words without a chord.
[[nodiscard]] std::vector<std::string> NumeralsOfWords(const std::vector<CNumeralWord>& words,
                                                       const CSignKeyLite& key,
                                                       const CNumeralOptions& options = {});

/// Reads a text of Roman numerals or Nashville numbers with bar lines and holds: `ii7 V7 | I^7`.
///
/// Hyphens, arrows and commas between numerals mean nothing, also without white space: `ii-V-I`
/// is three words. A hyphen that makes sense in a numeral is part of it: `2-7` is a minor seventh.
/// In a row of bare degrees, `1-5-6-4`, these are the triads of the key, of natural minor in minor.
/// A word that is not understood is a fault and has no chord; the others are read all the same.
/// "N.C." and its like have no chord either and are no faults.
/// Time is linear in the length of the text.
[[nodiscard]] CNumeralsReading ReadNumerals(std::string_view text, const CSignKeyLite& key,
                                            const CNumeralOptions& options = {});

/// Reads a text of chord symbols with bar lines in the same way.
[[nodiscard]] CNumeralsReading ReadChordWords(std::string_view text);

/// Whether the first word that is no mark and no "N.C." is a numeral; no chord symbol begins as
/// one.
[[nodiscard]] bool BeginsWithNumeral(std::string_view text, const CSignKeyLite& key);

}  // namespace brindle
