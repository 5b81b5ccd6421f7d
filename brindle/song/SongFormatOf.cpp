// SPDX-License-Identifier: MIT
#include "brindle/musicxml/ScoreContainer.h"
#include "brindle/platform/Ascii.h"
#include "brindle/song/ReadSong.h"
#include "brindle/song/internal/ChartLinks.h"
#include "brindle/song/internal/LineKinds.h"
#include "brindle/song/internal/SongReaders.h"
#include "brindle/song/internal/SongWords.h"
#include "brindle/theory/KeyIntervals.h"

#include <algorithm>
#include <array>
#include <vector>

namespace brindle {

using namespace SongText;

namespace {

// Directives that songs with lyrics begin with.
constexpr auto kDirectives = std::to_array<std::string_view>(
    {"{title", "{t:",    "{subtitle", "{st:",     "{artist", "{composer", "{key",
     "{time",  "{tempo", "{capo",     "{comment", "{c:",     "{meta",     "{start_of",
     "{soc",   "{sov",   "{sob",      "{sot",     "{sog",    "{new_song", "{ns}"});

bool HasDirective(std::string_view text) {
    while (!text.empty()) {
        const std::string line = Lower(TrimmedInFront(TakeLine(text)).substr(0, 12));
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
        const bool isPart = text[i] == '*' && Ascii::IsCapital(text[i + 1]);
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
    const std::vector<CTextLine> lines = LinesOf(text);
    const auto has = [&](TLineKind kind) {
        return std::any_of(lines.begin(), lines.end(),
                           [&](const CTextLine& line) { return line.mKind == kind; });
    };
    const bool hasNames = std::any_of(lines.begin(), lines.end(), [](const CTextLine& line) {
        return line.mKind == TLineKind::Section || BeginsWithSection(line.mText);
    });
    return has(TLineKind::Chords) && (has(TLineKind::Lyrics) || hasNames);
}

bool IsMeasureNumber(std::string_view word) {
    return word.size() > 1 && word[0] == 'm' && std::all_of(word.begin() + 1, word.end(), IsDigit);
}

/// `C:`, `f#:`, or the last word of `E flat:`
bool IsKeyMark(std::string_view word) {
    if (word.size() < 2 || word.back() != ':') return false;
    word.remove_suffix(1);
    constexpr auto lastWords = std::to_array<std::string_view>({"flat", "sharp", "major", "minor"});
    if (std::find(lastWords.begin(), lastWords.end(), word) != lastWords.end()) return true;
    const bool isNote = KeyNrOfLetter(word[0]) != kKeyNrUndef;
    return isNote && word.substr(1).find_first_not_of("#b-") == word.npos;
}

std::string_view TakeWord(std::string_view& line) {
    line = TrimmedInFront(line);
    const std::string_view word = line.substr(0, line.find_first_of(" \t\r"));
    line.remove_prefix(word.size());
    return word;
}

/// The first measure of an analysis states its key: `m1 C: I`, `m0 b3 f#: V7`.
bool HasMeasureWithKey(std::string_view text) {
    while (!text.empty()) {
        std::string_view line = TakeLine(text);
        if (!IsMeasureNumber(TakeWord(line))) continue;
        for (std::string_view word = TakeWord(line); !word.empty(); word = TakeWord(line)) {
            if (IsKeyMark(word)) return true;
        }
        return false;
    }
    return false;
}

TSongFormat FormatOfText(std::string_view text) {
    if (BeginsWithChordString(text)) return TSongFormat_ChordStrings;
    if (HasMeasureWithKey(text)) return TSongFormat_RomanText;
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

bool SongReaders::HoldsCharts(std::string_view bytes, TSongFormat format) {
    if (format == TSongFormat_ChartLink || format == TSongFormat_ChartPage) return true;
    if (format != TSongFormat_Auto || IsScoreContainer(bytes)) return false;
    const std::string_view text = WithoutMarksInFront(bytes);
    return text.starts_with('<') ? IsPage(text) : ChartLinks::BeginsWithLink(text);
}

TSongFormat SongFormatOf(std::string_view bytes) {
    if (IsScoreContainer(bytes)) return TSongFormat_CompressedMusicXml;
    const std::string_view text = WithoutMarksInFront(bytes);
    if (text.starts_with('<')) return IsPage(text) ? TSongFormat_ChartPage : TSongFormat_MusicXml;
    return ChartLinks::BeginsWithLink(text) ? TSongFormat_ChartLink : FormatOfText(text);
}

}  // namespace brindle
