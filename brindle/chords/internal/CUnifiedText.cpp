// SPDX-License-Identifier: MIT
#include "brindle/chords/internal/CUnifiedText.h"

#include "brindle/theory/SetFromStringHelper.h"

#include <algorithm>
#include <array>

namespace brindle::ChordText {
namespace {

struct CUnifyRow {
    std::string_view mCharacter;
    std::string_view mUnified;
};

// clang-format off
constexpr auto kUnifyRows = std::to_array<CUnifyRow>({
    {"♯", "#"}, {"＃", "#"},
    {"♭", "b"},
    {"♮", ""},
    {"\U0001D12A", "x"}, {"\U0001D12B", "bb"},  // double sharp, double flat
    {"Δ", "^"}, {"∆", "^"}, {"△", "^"}, {"▵", "^"},
    {"°", "o"}, {"º", "o"}, {"˚", "o"}, {"⁰", "o"},
    {"ø", "%"}, {"Ø", "%"}, {"∅", "%"},
    {"−", "-"}, {"‐", "-"}, {"‑", "-"}, {"–", "-"}, {"—", "-"}, {"⁻", "-"},
    {"⁺", "+"}, {"＋", "+"},
    {"¹", "1"}, {"²", "2"}, {"³", "3"}, {"⁴", "4"}, {"⁵", "5"},
    {"⁶", "6"}, {"⁷", "7"}, {"⁸", "8"}, {"⁹", "9"},
    {"（", "("}, {"）", ")"}, {"［", "("}, {"］", ")"},
    {"∕", "/"}, {"⁄", "/"},
    // No-break blanks, and the blanks thinner than usual.
    {"\u00A0", " "}, {"\u202F", " "}, {"\u2002", " "}, {"\u2004", " "}, {"\u2005", " "},
    {"\u2006", " "}, {"\u2007", " "}, {"\u2008", " "}, {"\u2009", " "}, {"\u200A", " "},
});
// clang-format on

constexpr std::string_view kDroppedInFront = " |";
constexpr std::string_view kDroppedAtTheEnd = " ,;|";

char UnifiedAscii(char c) {
    switch (c) {
        case '[':
            return '(';
        case ']':
            return ')';
        case '\\':
            return '/';
        case '\t':
            return ' ';
        default:
            return c;
    }
}

bool IsAscii(char c) {
    return static_cast<unsigned char>(c) < 0x80;
}

}  // namespace

CUnifiedText::CUnifiedText(std::string_view input) : mInput(input) {
    for (std::size_t i = 0; i < input.size();) {
        if (IsAscii(input[i])) {
            Append(UnifiedAscii(input[i]), i);
            ++i;
        } else {
            AppendNonAscii(i);
        }
    }
    mOffsets.push_back(input.size());
    mEnd = mText.size();
    Trim();
    TakeInsideOfBrackets();
}

void CUnifiedText::Append(char folded, std::size_t offset) {
    mText.push_back(folded);
    mLower.push_back(SetFromStringHelper::ToLower(folded));
    mOffsets.push_back(offset);
}

void CUnifiedText::AppendNonAscii(std::size_t& offset) {
    const std::string_view rest = mInput.substr(offset);
    const auto* const row =
        std::find_if(kUnifyRows.begin(), kUnifyRows.end(),
                     [&](const CUnifyRow& fold) { return rest.starts_with(fold.mCharacter); });
    if (row == kUnifyRows.end()) {
        Append(mInput[offset], offset);
        ++offset;
        return;
    }
    for (const char folded : row->mUnified) Append(folded, offset);
    offset += row->mCharacter.size();
}

void CUnifiedText::Trim() {
    while (mBegin < mEnd && kDroppedInFront.find(mText[mBegin]) != kDroppedInFront.npos) ++mBegin;
    while (mBegin < mEnd && kDroppedAtTheEnd.find(mText[mEnd - 1]) != kDroppedAtTheEnd.npos) --mEnd;
}

void CUnifiedText::TakeInsideOfBrackets() {
    if (IsEmpty() || mText[mBegin] != '(') return;
    std::size_t depth = 0;
    for (std::size_t i = mBegin; i < mEnd; ++i) {
        if (mText[i] == '(') ++depth;
        if (mText[i] == ')') --depth;
        if (depth > 0) continue;
        if (i + 1 != mEnd) return;
        ++mBegin;
        --mEnd;
        return Trim();
    }
}

}  // namespace brindle::ChordText
