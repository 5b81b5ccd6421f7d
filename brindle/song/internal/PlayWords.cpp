// SPDX-License-Identifier: MIT
#include "brindle/song/internal/PlayWords.h"

#include "brindle/musicxml/internal/PlayMarks.h"
#include "brindle/musicxml/internal/ScoreWords.h"
#include "brindle/platform/Ascii.h"
#include "brindle/song/internal/SongWords.h"

#include <algorithm>
#include <array>
#include <string>

namespace brindle::SongText {

namespace {

constexpr std::string_view kSegnoSign = "\U0001D10B";
constexpr std::string_view kCodaSign = "\U0001D10C";
constexpr int kMostWords = 4;

// Without blanks and points, in lower case.
constexpr auto kPhrases = std::to_array<std::string_view>({
    "dc",
    "dcalfine",
    "dcalcoda",
    "dacapo",
    "dacapoalfine",
    "dacapoalcoda",
    "ds",
    "dsalfine",
    "dsalcoda",
    "dalsegno",
    "dalsegnoalfine",
    "dalsegnoalcoda",
    "delsegno",
    "tocoda",
    "alcoda",
    "coda",
    "fine",
    "segno",
});

/// Letters and digits of a word in lower case; empty for a word with anything but points, commas
/// and brackets beside them.
std::string FoldedPlayWord(std::string_view word) {
    constexpr std::string_view kLeftOut = ".,()";
    std::string folded;
    for (const char c : Lower(word)) {
        if (Ascii::IsSmallLetter(c) || IsDigit(c)) {
            folded += c;
        } else if (kLeftOut.find(c) == kLeftOut.npos) {
            return {};
        }
    }
    return folded;
}

/// "3x", "x3".
bool IsTimes(std::string_view folded) {
    if (folded.size() < 2 || folded.size() > 3) return false;
    const std::size_t x = folded.find('x');
    const bool isAtAnEnd = x == 0 || x + 1 == folded.size();
    return isAtAnEnd && std::count_if(folded.begin(), folded.end(), IsDigit) ==
                            static_cast<std::ptrdiff_t>(folded.size()) - 1;
}

std::string_view WordAt(std::string_view text, std::size_t pos) {
    const std::size_t end = std::min(text.find_first_of(" \t\r\v\f\n|{}<>[]:", pos), text.size());
    return text.substr(pos, end - pos);
}

}  // namespace

std::size_t LengthOfPlayWords(std::string_view text) {
    if (text.starts_with(kSegnoSign)) return kSegnoSign.size();
    std::string joined;
    bool hasBareLetter = false;
    std::size_t found = 0;
    std::size_t end = 0;
    for (int count = 0; count < kMostWords; ++count) {
        const std::string_view word = WordAt(text, end);
        const std::string folded = FoldedPlayWord(word);
        if (folded.empty() || word.size() > 20) break;
        end += word.size();
        if (count == 0 && IsTimes(folded)) return end;
        joined += folded;
        hasBareLetter = hasBareLetter || word.size() == 1;
        // "D C" are two chords, "D. C." and "D C al Fine" are none.
        const bool areChords = hasBareLetter && joined.size() == 2;
        const bool isPhrase = std::find(kPhrases.begin(), kPhrases.end(), joined) != kPhrases.end();
        if (isPhrase && !areChords) found = end;
        while (end < text.size() && (text[end] == ' ' || text[end] == '\t')) ++end;
    }
    return found;
}

std::size_t LengthOfCodaSign(std::string_view text) {
    return text.starts_with(kCodaSign) ? kCodaSign.size() : 0;
}

void ReadPlayWordsOfText(std::string_view words, CPlayMarks& marks) {
    if (words == kSegnoSign || words == "S") return marks.mSegno.Set();
    ReadPlayWords(words, false, marks);
}

}  // namespace brindle::SongText
