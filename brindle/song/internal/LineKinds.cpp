// SPDX-License-Identifier: MIT
#include "brindle/song/internal/LineKinds.h"

#include "brindle/chords/ReadChordText.h"
#include "brindle/chords/internal/CTextScan.h"
#include "brindle/chords/internal/ChordRows.h"
#include "brindle/platform/Ascii.h"
#include "brindle/song/internal/PlayWords.h"
#include "brindle/song/internal/SongWords.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <string>

namespace brindle::SongText {

namespace {

constexpr auto kSectionWords = std::to_array<std::string_view>(
    {"intro",      "verse",  "chorus",     "refrain", "bridge",     "prechorus",
     "pre-chorus", "outro",  "ending",     "solo",    "interlude",  "instrumental",
     "coda",       "hook",   "tag",        "break",   "turnaround", "middle",
     "strophe",    "refrão", "estribillo", "couplet", "vers",       "part"});

constexpr auto kFieldNames =
    std::to_array<std::string_view>({"title", "artist", "composer", "by", "key", "capo", "tempo",
                                     "bpm", "time", "style", "tuning"});

// Chords that are words, too.
constexpr auto kWordsOrChords =
    std::to_array<std::string_view>({"A", "Am", "Go", "Do", "Bo", "Co"});

bool IsAnyOf(std::string_view word, const auto& list) {
    return std::find(list.begin(), list.end(), word) != list.end();
}

bool IsLetter(char c) {
    return Ascii::IsLetter(c) || (c & 0x80) != 0;
}

bool IsBarSign(std::string_view word) {
    return word.find_first_not_of("|:.-/%") == word.npos;
}

/// Of words that could be lyrics, `Go, Johnny`, a comma makes lyrics.
std::string_view WithoutCommasOfChords(std::string_view word) {
    const std::string_view chord = ChordText::WithoutCommasBehind(word);
    return IsAnyOf(chord, kWordsOrChords) ? word : chord;
}

/// `C-G-Am`, but not `Do-Do-Do`.
bool IsRowOfChords(std::string_view word) {
    const std::vector<std::string_view> pieces = ChordText::PiecesOfRow(word);
    const auto isChord = [](std::string_view piece) {
        return !piece.empty() && ChordText::IsCapitalNote(piece[0]) &&
               ReadChordText(piece).mKind == TChordText_Chord;
    };
    const auto couldBeWord = [](std::string_view piece) { return IsAnyOf(piece, kWordsOrChords); };
    return std::all_of(pieces.begin(), pieces.end(), isChord) &&
           !std::all_of(pieces.begin(), pieces.end(), couldBeWord);
}

/// A chord or several, a sign between chords or words that steer the playing.
bool IsChordWord(std::string_view word) {
    if (IsBarSign(word) || LengthOfPlayWords(word) == word.size()) return true;
    word = WithoutCommasOfChords(word);
    if (word.size() > 2 && word.front() == '(' && word.back() == ')') {
        word = word.substr(1, word.size() - 2);
    }
    const bool begins = ChordText::IsCapitalNote(word[0]) || word[0] == 'N' || word[0] == '(';
    if (!begins) return false;
    return ReadChordText(word).mKind != TChordText_NotUnderstood || IsRowOfChords(word);
}

/// No slip of a chord, but a word: "Down", "I", "don't".
bool IsLyricWord(std::string_view word) {
    const bool hasLettersAlone = std::all_of(word.begin(), word.end(), [](char c) {
        return IsLetter(c) || std::string_view("'’,.!?-\";").find(c) != std::string_view::npos;
    });
    return hasLettersAlone && (word.size() > 2 || !ChordText::IsCapitalNote(word[0]));
}

bool IsTablature(std::string_view line) {
    return line.find("--") != line.npos && line.find('|') != line.npos &&
           std::count(line.begin(), line.end(), '-') * 3 > static_cast<std::ptrdiff_t>(line.size());
}

/// `C x32010`, `G: 320003`: how a chord is played.
bool IsFingering(std::string_view line) {
    std::string_view frets = line;
    std::string_view chord = TakeWordOf(frets);
    if (chord.ends_with(':')) chord.remove_suffix(1);
    if (frets.starts_with('=')) TakeWordOf(frets);
    const bool areFrets = frets.size() >= 4 && frets.size() <= 8 &&
                          frets.find_first_not_of("0123456789xX") == frets.npos;
    return areFrets && !chord.empty() && IsChordWord(chord);
}

bool IsField(std::string_view line) {
    const std::size_t colon = line.find(':');
    if (colon != line.npos) return IsAnyOf(Lower(Trimmed(line.substr(0, colon))), kFieldNames);
    std::string_view rest = line;
    return Lower(TakeWordOf(rest)) == "capo" && !rest.empty() && IsDigit(rest[0]);
}

bool IsSection(std::string_view line) {
    const std::string_view name = NameOfSection(line);
    if (name.empty()) return false;
    if (name.size() < line.size() && line.front() == '[') {
        return name.size() == 1 || !IsChordWord(name);
    }
    std::string_view rest = name;
    const std::string first = Lower(TakeWordOf(rest));
    if (IsAnyOf(first, kSectionWords)) return rest.size() <= 12 && rest.find('|') == rest.npos;
    return name.size() < line.size() && !IsChordWord(name) && rest.empty();
}

TLineKind KindOfWords(std::string_view line) {
    std::size_t chords = 0;
    std::size_t others = 0;
    std::size_t lyrics = 0;
    for (std::string_view rest = line; !rest.empty();) {
        const std::string_view word = TakeWordOf(rest);
        if (ChordText::IsSeparator(word)) continue;
        const bool isChord = IsChordWord(word);
        chords += isChord;
        others += !isChord;
        lyrics += !isChord && IsLyricWord(word);
    }
    const bool isLyrics = others > chords || (others == chords && lyrics == others);
    return isLyrics && line.find_first_of("|{") == line.npos ? TLineKind::Lyrics
                                                             : TLineKind::Chords;
}

/// The bytes of the name in front of other things, `Intro: G C`, `[Intro] G C`; 0 without one.
std::size_t LengthOfSectionInFront(std::string_view line) {
    const std::size_t end = line.starts_with('[') ? line.find(']') : line.find(": ");
    const bool isName =
        end != line.npos && end + 1 < line.size() && IsSection(line.substr(0, end + 1));
    return isName ? end + 1 : 0;
}

TLineKind KindOf(std::string_view line) {
    if (line.empty()) return TLineKind::Blank;
    if (IsTablature(line) || IsFingering(line)) return TLineKind::Tablature;
    if (IsField(line)) return TLineKind::Field;
    if (IsSection(line)) return TLineKind::Section;
    return KindOfWords(line.substr(LengthOfSectionInFront(line)));
}

bool CouldBeLyrics(std::string_view line) {
    for (std::string_view rest = line; !rest.empty();) {
        if (!IsAnyOf(TakeWordOf(rest), kWordsOrChords)) return false;
    }
    return true;
}

/// "A" behind a line of chords, with no lyrics of its own, is a line of lyrics.
void ResolveByNeighbours(std::vector<CTextLine>& lines) {
    for (std::size_t i = 1; i < lines.size(); ++i) {
        if (lines[i].mKind != TLineKind::Chords || !CouldBeLyrics(lines[i].mText)) continue;
        const bool isBehindChords = lines[i - 1].mKind == TLineKind::Chords;
        const bool hasLyrics = i + 1 < lines.size() && lines[i + 1].mKind == TLineKind::Lyrics;
        if (isBehindChords && !hasLyrics) lines[i].mKind = TLineKind::Lyrics;
    }
}

}  // namespace

std::string_view NameOfSection(std::string_view line) {
    if (line.size() > 2 && line.front() == '[' && line.back() == ']') {
        const std::string_view name = line.substr(1, line.size() - 2);
        return name.find_first_of("[]") == name.npos && !IsDigit(name[0]) ? Trimmed(name)
                                                                          : std::string_view();
    }
    if (line.ends_with(':')) line.remove_suffix(1);
    return line.find_first_of(":|[]{}") == line.npos ? Trimmed(line) : std::string_view();
}

std::vector<CTextLine> LinesOf(std::string_view text) {
    std::vector<CTextLine> lines;
    while (!text.empty()) {
        const std::string_view line = Trimmed(TakeLine(text));
        lines.push_back({line, KindOf(line)});
    }
    ResolveByNeighbours(lines);
    return lines;
}

namespace {

/// `[A]` in front of nothing, of bare chords or of `(x2)`; in front of lyrics it is a chord.
bool IsLetterOfPart(std::string_view inside, std::string_view behind) {
    if (inside.size() != 1) return false;
    if (behind.empty()) return true;
    const bool isApart = IsBlank(behind[0]) && behind.find_first_of("[]") == behind.npos;
    return isApart && KindOfWords(Trimmed(behind)) == TLineKind::Chords;
}

}  // namespace

bool BeginsWithSection(std::string_view line) {
    return line.starts_with('[') && LengthOfSectionInFront(line) > 0;
}

std::size_t LengthOfNameInBrackets(std::string_view line) {
    const std::size_t end = line.starts_with('[') ? line.find(']') : line.npos;
    if (end == line.npos) return 0;
    std::string_view name = line.substr(1, end - 1);
    const std::string first = Lower(TakeWordOf(name));
    return IsAnyOf(first, kSectionWords) ? end + 1 : 0;
}

bool IsLineOfChords(std::string_view line) {
    std::size_t chords = 0;
    bool isNoLyric = false;
    for (std::string_view rest = line; !rest.empty();) {
        const std::string_view word = TakeWordOf(rest);
        if (IsBarSign(word) || ChordText::IsSeparator(word)) continue;
        if (!IsChordWord(word)) return false;
        isNoLyric |= !IsAnyOf(word, kWordsOrChords);
        ++chords;
    }
    return chords > 1 && isNoLyric;
}

bool HasChordInBrackets(std::string_view text) {
    while (!text.empty()) {
        const std::string_view line = Trimmed(TakeLine(text));
        std::size_t begin = line.find('[');
        while (begin != line.npos) {
            const std::size_t end = line.find_first_of("[]", begin + 1);
            if (end == line.npos) break;
            const std::string_view inside = line.substr(begin + 1, end - begin - 1);
            const bool isName = begin == 0 && IsLetterOfPart(inside, line.substr(end + 1));
            if (line[end] == ']' && !inside.empty() && !isName &&
                ChordText::IsCapitalNote(inside[0]) &&
                ReadChordText(inside).mKind == TChordText_Chord) {
                return true;
            }
            begin = line[end] == '[' ? end : line.find('[', end);
        }
    }
    return false;
}

}  // namespace brindle::SongText
