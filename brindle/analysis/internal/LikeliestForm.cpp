// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/ChordSheetTokens.h"
#include "brindle/analysis/internal/ChordSheetWords.h"

#include <algorithm>
#include <array>

namespace brindle::ChordSheet {
namespace {

// Directives that songs with lyrics begin with.
constexpr auto kDirectives = std::to_array<std::string_view>(
    {"{title", "{t:", "{subtitle", "{st:", "{artist", "{key", "{time", "{tempo", "{capo",
     "{comment", "{c:", "{start_of", "{soc", "{sov", "{sob", "{sot", "{sog"});

bool HasDirective(std::string_view text) {
    while (!text.empty()) {
        const std::string_view line = WithoutBlanksInFront(TakeLine(text));
        const bool found = std::any_of(kDirectives.begin(), kDirectives.end(),
                                       [&](std::string_view d) { return line.starts_with(d); });
        if (found) return true;
    }
    return false;
}

/// A bracket with a chord in it, directly at a word: `A[G]mazing`.
bool HasChordInLyrics(std::string_view text) {
    std::size_t begin = text.find('[');
    while (begin != text.npos) {
        const std::size_t end = text.find_first_of("[]", begin + 1);
        if (end == text.npos) return false;
        const bool isClosed = text[end] == ']' && !IsDigit(text[begin + 1]);
        if (isClosed && end + 1 < text.size() && text[end + 1] >= 'a' && text[end + 1] <= 'z') {
            return true;
        }
        begin = text.find('[', text[end] == '[' ? end : end + 1);
    }
    return false;
}

/// A time such as `T44`, or the mark of a part, `*A`.
bool HasMarkOfChart(std::string_view text) {
    for (std::size_t i = 0; i + 2 < text.size(); ++i) {
        if (text[i] == 'T' && IsDigit(text[i + 1]) && IsDigit(text[i + 2])) return true;
        const bool isPart = text[i] == '*' && text[i + 1] >= 'A' && text[i + 1] <= 'Z';
        if (isPart) return true;
    }
    return false;
}

}  // namespace

TChordSheetForm LikeliestForm(std::string_view text) {
    if (HasDirective(text)) return TChordSheet_ChordPro;
    if (HasMarkOfChart(text)) return TChordSheet_IReal;
    return HasChordInLyrics(text) ? TChordSheet_ChordPro : TChordSheet_Plain;
}

}  // namespace brindle::ChordSheet
