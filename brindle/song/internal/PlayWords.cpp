// SPDX-License-Identifier: MIT
#include "brindle/song/internal/PlayWords.h"

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
// What people type for these signs.
constexpr std::string_view kTypedSegno = "$";
constexpr std::string_view kTypedCoda = "@";
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

/// The bytes of `[3x]`, 0 for what is none.
std::size_t LengthOfTimesInBrackets(std::string_view text) {
    if (!text.starts_with('[')) return 0;
    const std::string_view inside = WordAt(text, 1);
    const bool isWhole = text.substr(1 + inside.size()).starts_with(']');
    return isWhole && inside.size() <= 4 && IsTimes(FoldedPlayWord(inside)) ? inside.size() + 2 : 0;
}

}  // namespace

std::size_t LengthOfPlayWords(std::string_view text) {
    if (text.starts_with(kSegnoSign)) return kSegnoSign.size();
    if (WordAt(text, 0) == kTypedSegno) return kTypedSegno.size();
    if (const std::size_t times = LengthOfTimesInBrackets(text); times > 0) return times;
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
    if (WordAt(text, 0) == kTypedCoda) return kTypedCoda.size();
    return text.starts_with(kCodaSign) ? kCodaSign.size() : 0;
}

void ReadPlayWordsOfText(std::string_view words, CPlayMarks& marks) {
    if (words == kSegnoSign || words == kTypedSegno || words == "S") return marks.mSegno.Set();
    ReadPlayWords(words, false, marks);
}

namespace {

/// What a song has of all that words may ask for.
struct CWaysOfSong {
    explicit CWaysOfSong(const std::vector<CPlayMarks>& bars) : mBars(bars) {
        for (const CPlayMarks& marks : bars) {
            mHasSegno |= marks.mSegno.mIsSet;
            mHasFine |= marks.mFine;
            mHasToCoda |= marks.mToCoda.mIsSet;
            mHasEndings |= marks.mEndingStarts;
            mJumps |= marks.Jumps();
            mCodaCount += marks.mCoda.mIsSet ? 1 : 0;
        }
    }
    /// Where nothing says "To Coda", the first of two signs does.
    [[nodiscard]] bool LeadsToCoda() const { return mCodaCount > (mHasToCoda ? 0 : 1); }
    /// Repeats with endings are told from the signs of other bars, too.
    [[nodiscard]] bool HasRepeatAt(std::size_t bar) const {
        const bool hasSign =
            bar < mBars.size() && (mBars[bar].mRepeatBackward || mBars[bar].mRepeatForward);
        return hasSign || mHasEndings;
    }

    const std::vector<CPlayMarks>& mBars;
    bool mHasSegno = false;
    bool mHasFine = false;
    bool mHasToCoda = false;
    bool mHasEndings = false;
    bool mJumps = false;
    int mCodaCount = 0;
};

/// Whether what words say is lost in the bar of a song that they steer, and what is told then.
struct CLossRow {
    bool (*mIsLost)(const CPlayMarks& words, std::size_t bar, const CWaysOfSong& song);
    const char* mText;
};

constexpr auto kLossRows = std::to_array<CLossRow>({
    {[](const CPlayMarks& words, std::size_t, const CWaysOfSong& song) {
         return words.mDalSegno.mIsSet && !song.mHasSegno;
     },
     "there is no segno to go back to, so the song begins again"},
    {[](const CPlayMarks& words, std::size_t, const CWaysOfSong& song) {
         return words.mToCoda.mIsSet && song.mCodaCount == 0;
     },
     "there is no coda to go to"},
    {[](const CPlayMarks& words, std::size_t, const CWaysOfSong& song) {
         return words.mToCoda.mIsSet && song.mCodaCount > 0 && !song.mJumps;
     },
     "no D.C. or D.S. plays this again, so nothing goes to the coda from here"},
    {[](const CPlayMarks& words, std::size_t, const CWaysOfSong& song) {
         return words.mAlCoda && !song.LeadsToCoda();
     },
     "nothing tells where to leave for a coda, or there is none"},
    {[](const CPlayMarks& words, std::size_t, const CWaysOfSong& song) {
         return words.mAlFine && !song.mHasFine;
     },
     "there is no Fine to stop at"},
    {[](const CPlayMarks& words, std::size_t bar, const CWaysOfSong& song) {
         return words.mRepeatTimes > 0 && !song.HasRepeatAt(bar);
     },
     "this stands behind no repeat and no line of chords"},
});

}  // namespace

void TellLostWords(const std::vector<CPlacedWords>& words, const std::vector<CPlayMarks>& bars,
                   CTokenList& list) {
    const CWaysOfSong song(bars);
    std::array<bool, kLossRows.size()> isTold{};
    for (const CPlacedWords& placed : words) {
        CPlayMarks marks;
        ReadPlayWordsOfText(placed.mText, marks);
        for (std::size_t i = 0; i < kLossRows.size(); ++i) {
            if (isTold[i] || !kLossRows[i].mIsLost(marks, placed.mBar, song)) continue;
            list.AddNote(placed.mText, std::string(placed.mText) + ": " + kLossRows[i].mText);
            isTold[i] = true;
        }
    }
}

}  // namespace brindle::SongText
