// SPDX-License-Identifier: MIT
#include "brindle/chords/internal/CFoldedText.h"

#include "brindle/theory/SetFromStringHelper.h"

#include <algorithm>
#include <array>

namespace brindle::ChordText {
namespace {

struct TFoldRow {
    std::string_view mCharacter;
    std::string_view mFolded;
};

// clang-format off
constexpr auto kFoldRows = std::to_array<TFoldRow>({
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

char FoldAscii(char c) {
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

CFoldedText::CFoldedText(std::string_view input) : mInput(input) {
    for (std::size_t i = 0; i < input.size();) {
        if (IsAscii(input[i])) {
            Append(FoldAscii(input[i]), i);
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

void CFoldedText::Append(char folded, std::size_t offset) {
    mText.push_back(folded);
    mLower.push_back(SetFromStringHelper::ToLower(folded));
    mOffsets.push_back(offset);
}

void CFoldedText::AppendNonAscii(std::size_t& offset) {
    const std::string_view rest = mInput.substr(offset);
    const auto* const row =
        std::find_if(kFoldRows.begin(), kFoldRows.end(),
                     [&](const TFoldRow& fold) { return rest.starts_with(fold.mCharacter); });
    if (row == kFoldRows.end()) {
        Append(mInput[offset], offset);
        ++offset;
        return;
    }
    for (const char folded : row->mFolded) Append(folded, offset);
    offset += row->mCharacter.size();
}

void CFoldedText::Trim() {
    while (mBegin < mEnd && kDroppedInFront.find(mText[mBegin]) != kDroppedInFront.npos) ++mBegin;
    while (mBegin < mEnd && kDroppedAtTheEnd.find(mText[mEnd - 1]) != kDroppedAtTheEnd.npos) --mEnd;
}

void CFoldedText::TakeInsideOfBrackets() {
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
