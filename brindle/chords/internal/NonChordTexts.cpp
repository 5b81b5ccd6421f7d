// SPDX-License-Identifier: MIT
#include "brindle/chords/internal/NonChordTexts.h"

#include "brindle/chords/internal/CUnifiedText.h"
#include "brindle/theory/SetFromStringHelper.h"

#include <algorithm>
#include <array>

namespace brindle::ChordText {
namespace {

struct CNonChordRow {
    /// Without blanks, in lower case if any case will do.
    std::string_view mText;
    TChordTextKind mKind;
    std::string_view mParserText;
    bool mIsExact = false;
};

// clang-format off
constexpr auto kNonChordRows = std::to_array<CNonChordRow>({
    {"n",            TChordText_NoChord, "NoChord"},
    {"nc",           TChordText_NoChord, "NoChord"},
    {"n.c.",         TChordText_NoChord, "NoChord"},
    {"n.c",          TChordText_NoChord, "NoChord"},
    {"nochord",      TChordText_NoChord, "NoChord"},
    {"none",         TChordText_NoChord, "NoChord"},
    {"tacet",        TChordText_NoChord, "NoChord"},
    {"X",            TChordText_NoChord, "NoChord", true},
    {"nochordyield", TChordText_NoChord, "NoChordYield"},
    {"nochordforce", TChordText_NoChord, "NoChordForce"},
    {"undef",        TChordText_NoChord, "Undef"},
    {"undefined",    TChordText_NoChord, "Undef"},
    {"%",            TChordText_Repeat,  ""},
    {"/",            TChordText_Repeat,  ""},
    {"//",           TChordText_Repeat,  ""},
    {"///",          TChordText_Repeat,  ""},
    {"////",         TChordText_Repeat,  ""},
    {".",            TChordText_Repeat,  ""},
    {"./.",          TChordText_Repeat,  ""},
    {".//.",         TChordText_Repeat,  ""},
    {"-",            TChordText_Repeat,  ""},
    {"x",            TChordText_Repeat,  "", true},
    {"r",            TChordText_Repeat,  "", true},
    {"p",            TChordText_Repeat,  "", true},
    {"w",            TChordText_Repeat,  "", true},
    {"'",            TChordText_Repeat,  ""},
    {"\"",           TChordText_Repeat,  ""},
    {"''",           TChordText_Repeat,  ""},
    {"simile",       TChordText_Repeat,  ""},
    {"sim.",         TChordText_Repeat,  ""},
    {"\U0001D10E",   TChordText_Repeat,  ""},  // repeats of one bar and of two
    {"\U0001D10F",   TChordText_Repeat,  ""},
    {"÷",            TChordText_Repeat,  ""},
});
// clang-format on

constexpr std::size_t kLongestWord = 16;
static_assert(std::all_of(kNonChordRows.begin(), kNonChordRows.end(), [](const CNonChordRow& row) {
    return row.mText.size() <= kLongestWord;
}));

/// A text without its blanks; empty if it is longer than any word.
struct CSingleWord {
    std::array<char, kLongestWord> mExact{};
    std::array<char, kLongestWord> mLower{};
    std::size_t mSize = 0;

    explicit CSingleWord(const CUnifiedText& text) {
        const std::string_view folded = text.Text();
        for (std::size_t i = 0; i < folded.size(); ++i) {
            if (folded[i] == ' ') continue;
            const std::size_t begin = text.InputOffset(i);
            for (const char c : text.Input().substr(begin, text.InputOffset(i + 1) - begin)) {
                if (mSize == kLongestWord) {
                    mSize = 0;
                    return;
                }
                mExact[mSize] = c;
                mLower[mSize++] = SetFromStringHelper::ToLower(c);
            }
        }
    }

    [[nodiscard]] bool Is(const CNonChordRow& row) const {
        return row.mText == std::string_view((row.mIsExact ? mExact : mLower).data(), mSize);
    }
};

CChordLite NonChordOf(std::string_view parserText) {
    if (parserText == "Undef") return CChordLite_Undef;
    return parserText == "NoChordForce" ? CChordLite_NoChordForce : CChordLite_NoChordYield;
}

}  // namespace

std::optional<CChordTextReading> ReadNonChord(const CUnifiedText& text) {
    const CSingleWord word(text);
    const auto* const row = std::find_if(kNonChordRows.begin(), kNonChordRows.end(),
                                         [&](const CNonChordRow& r) { return word.Is(r); });
    if (row == kNonChordRows.end()) return std::nullopt;
    CChordTextReading reading;
    reading.mKind = row->mKind;
    reading.mParserText = row->mParserText;
    if (row->mKind == TChordText_NoChord) {
        reading.mChord = NonChordOf(row->mParserText);
        reading.mParserTextIsExact = true;
    }
    return reading;
}

}  // namespace brindle::ChordText
