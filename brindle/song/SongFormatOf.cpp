// SPDX-License-Identifier: MIT
#include "brindle/musicxml/ScoreContainer.h"
#include "brindle/song/ReadSong.h"
#include "brindle/song/internal/ChartLinks.h"
#include "brindle/song/internal/LineKinds.h"
#include "brindle/song/internal/SongWords.h"

#include <algorithm>
#include <array>
#include <vector>

namespace brindle {

using namespace SongText;

namespace {

// Directives that songs with lyrics begin with.
constexpr auto kDirectives = std::to_array<std::string_view>(
    {"{title", "{t:", "{subtitle", "{st:", "{artist", "{composer", "{key", "{time", "{tempo",
     "{capo", "{comment", "{c:", "{meta", "{start_of", "{soc", "{sov", "{sob", "{sot", "{sog"});

bool HasDirective(std::string_view text) {
    while (!text.empty()) {
        const std::string line = Lower(WithoutBlanksInFront(TakeLine(text)).substr(0, 12));
        const bool found = std::any_of(kDirectives.begin(), kDirectives.end(),
                                       [&](std::string_view d) { return line.starts_with(d); });
        if (found) return true;
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

/// `(4,C)`
bool BeginsWithChordString(std::string_view text) {
    if (text.size() < 2 || text[0] != '(' || !(IsDigit(text[1]) || text[1] == '.')) return false;
    const std::size_t end = text.find_first_of(",)");
    return end != text.npos && text[end] == ',';
}

/// Lines of chords, and between them lyrics or names of parts.
bool HasChordsAboveLyrics(std::string_view text) {
    const std::vector<TSheetLine> lines = LinesOf(text);
    const auto has = [&](TLineKind kind) {
        return std::any_of(lines.begin(), lines.end(),
                           [&](const TSheetLine& line) { return line.mKind == kind; });
    };
    return has(TLineKind::Chords) && (has(TLineKind::Lyrics) || has(TLineKind::Section));
}

TSongFormat FormatOfText(std::string_view text) {
    if (BeginsWithChordString(text)) return TSongFormat_ChordStrings;
    if (HasDirective(text) || HasChordInBrackets(text)) return TSongFormat_ChordPro;
    if (HasChordsAboveLyrics(text)) return TSongFormat_ChordsAboveLyrics;
    return HasMarkOfChart(text) ? TSongFormat_Chart : TSongFormat_ChordText;
}

/// UTF-16 has a zero beside each letter.
std::string_view WithoutMarksInFront(std::string_view bytes) {
    for (const std::string_view mark : {"\xEF\xBB\xBF", "\xFF\xFE", "\xFE\xFF"}) {
        if (bytes.starts_with(mark)) bytes.remove_prefix(mark.size());
    }
    const std::size_t first = bytes.find_first_not_of(std::string_view(" \t\r\n\0", 5));
    return first == bytes.npos ? std::string_view() : bytes.substr(first);
}

bool IsPage(std::string_view text) {
    const std::string begin = Lower(text.substr(0, 1024));
    return begin.find("<html") != begin.npos || begin.find("<!doctype html") != begin.npos ||
           begin.find("<a href") != begin.npos;
}

}  // namespace

TSongFormat SongFormatOf(std::string_view bytes) {
    if (IsScoreContainer(bytes)) return TSongFormat_CompressedMusicXml;
    const std::string_view text = WithoutMarksInFront(bytes);
    if (text.starts_with('<')) return IsPage(text) ? TSongFormat_ChartPage : TSongFormat_MusicXml;
    return ChartLinks::BeginsWithLink(text) ? TSongFormat_ChartLink : FormatOfText(text);
}

}  // namespace brindle
