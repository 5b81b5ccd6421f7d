// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>
#include <vector>

/// How the texts of a lead sheet are set, as music publishers set them: signs for accidentals,
/// small raised figures. Sizes are in em, parts of the font size of the whole text.
namespace brindle::LeadSheet {

/// A piece of a text in one size.
struct CTextRun {
    std::string mText;
    double mSize = 1.0;
    /// Its base line above that of the whole text.
    double mRaise = 0.0;

    friend bool operator==(const CTextRun&, const CTextRun&) = default;
};
using CTextRuns = std::vector<CTextRun>;

/// A chord symbol as it was typed: "Bbm7b5/Ab" is set as a B with a flat, a small m, a raised 7
/// with a flat 5, and a smaller bass. What is no chord symbol is set as it is; what is very long is
/// cut.
[[nodiscard]] CTextRuns SetSymbol(std::string_view symbol);

/// A numeral: the figures of "V7/ii" or "Ger6" are raised.
[[nodiscard]] CTextRuns SetNumeral(std::string_view numeral);

/// At least the width of the text in the fonts that viewers have: the widths of ASCII are those of
/// the widest of them, bold.
[[nodiscard]] double WidthOf(std::string_view text);
[[nodiscard]] double WidthOf(const CTextRuns& runs);

/// As much of the text as fits, with an ellipsis where it is cut.
[[nodiscard]] std::string CutToWidth(std::string_view text, double width);

/// Only what XML and a picture can hold.
[[nodiscard]] std::string JoinRuns(const CTextRuns& runs);

}  // namespace brindle::LeadSheet
