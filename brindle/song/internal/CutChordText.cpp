// SPDX-License-Identifier: MIT
#include "brindle/chords/internal/ChordRows.h"
#include "brindle/platform/Ascii.h"
#include "brindle/platform/ReadNumber.h"
#include "brindle/song/internal/PlayWords.h"
#include "brindle/song/internal/SongTokens.h"
#include "brindle/song/internal/SongWords.h"

#include <algorithm>
#include <vector>

namespace brindle::SongText {
namespace {

constexpr int kLastEnding = 63;
/// A chord of several words is not longer than this.
constexpr std::size_t kLongestJoined = 80;

bool IsBar(const CToken& token) {
    return token.mKind == TTokenKind::Bar;
}

bool IsMusic(const CToken& token) {
    return token.mKind == TTokenKind::Chord || token.mKind == TTokenKind::Hold ||
           token.mKind == TTokenKind::RepeatBars;
}

/// Cuts one line into sections, bar lines, endings and chords.
class CChordLine {
public:
    CChordLine(std::string_view line, CTokenList& list) : mRest(line), mList(list) {}

    void Cut() {
        TakeSectionInFront();
        while (!mList.IsGivenUp()) {
            mRest = TrimmedInFront(mRest);
            if (mRest.empty()) return;
            if (TakeBar() || TakeSectionInBraces() || TakePlayWords() || TakeEnding()) continue;
            TakeWord();
        }
    }

private:
    std::string_view Take(std::size_t length) {
        const std::string_view taken = mRest.substr(0, length);
        mRest.remove_prefix(taken.size());
        return taken;
    }

    /// `Verse 2: C F`; the name may have several words, as long as they are no chords.
    void TakeSectionInFront() {
        std::size_t colon = mRest.find_first_of(":|{");
        while (colon < mRest.size() && mRest[colon] == ':' && !EndsWord(colon + 1)) {
            colon = mRest.find_first_of(":|{", colon + 1);
        }
        if (colon >= mRest.size() || mRest[colon] != ':') return;
        const std::string_view name = Trimmed(mRest.substr(0, colon));
        if (!IsName(name)) return;
        mList.Add(TTokenKind::Section, name);
        Take(colon + 1);
    }

    [[nodiscard]] bool EndsWord(std::size_t pos) const {
        return pos >= mRest.size() || IsBlank(mRest[pos]);
    }

    [[nodiscard]] static bool IsName(std::string_view name) {
        std::string_view rest = name;
        const std::string_view first = TakeWordOf(rest);
        const std::string_view second = TakeWordOf(rest);
        if (second.empty()) return !first.empty();
        // `A section:`
        if (first.size() == 1 && Ascii::IsCapital(first[0]) && rest.empty()) return true;
        rest = name;
        for (std::string_view word = TakeWordOf(rest); !rest.empty(); word = TakeWordOf(rest)) {
            if (ReadChordText(word).mKind == TChordText_NotUnderstood) return true;
        }
        return false;
    }

    bool TakeBar() {
        std::size_t length = 0;
        bool endsRepeat = false;
        while (length < mRest.size() && mRest[length] == ':') ++length;
        if (length == mRest.size() || mRest[length] != '|') return false;
        endsRepeat = length > 0;
        while (length < mRest.size() && mRest[length] == '|') ++length;
        if (length < mRest.size() && mRest[length] == ']') ++length;
        const bool colonFollows = length < mRest.size() && mRest[length] == ':';
        // The colon of `|:|` ends a repeat.
        const bool startsRepeat =
            colonFollows && (length + 1 == mRest.size() || mRest[length + 1] != '|');
        mList.AddBar(endsRepeat, startsRepeat);
        Take(length + (startsRepeat ? 1 : 0));
        return true;
    }

    bool TakeSectionInBraces() {
        if (mRest.front() != '{') return false;
        const std::size_t end = mRest.find('}');
        if (end == mRest.npos) {
            // The rest of the line is the name, then.
            mList.AddFault(mRest, "\"{\" has no \"}\" behind it");
            Take(mRest.size());
            return true;
        }
        mList.Add(TTokenKind::Section, Trimmed(mRest.substr(1, end - 1)));
        Take(end + 1);
        return true;
    }

    /// `[1`, `[2.`, `[1,2`, `[1-3`
    bool TakeEnding() {
        if (mRest.size() < 2 || mRest[0] != '[' || !IsDigit(mRest[1])) return false;
        const std::string_view begin = mRest;
        Take(1);
        std::uint64_t endings = 0;
        int first = 0;
        do {
            const int last = TakeEndingNumber();
            if (last < 1 || last > kLastEnding) {
                mList.AddFault(begin, "an ending has a number from 1 to 63");
                return true;
            }
            for (int n = first > 0 ? first : last; n <= last; ++n) endings |= std::uint64_t{1} << n;
            first = !mRest.empty() && mRest[0] == '-' ? last : 0;
        } while (TakeOneOf(",-"));
        TakeOneOf(".");
        TakeOneOf("]");
        mList.Add(TTokenKind::Ending).mEndings = endings;
        return true;
    }

    bool TakePlayWords() {
        if (const std::size_t sign = LengthOfCodaSign(mRest); sign > 0) {
            mList.Add(TTokenKind::CodaSign, Take(sign));
            return true;
        }
        const std::size_t length = LengthOfPlayWords(mRest);
        if (length == 0) return false;
        mChordBefore = {};
        // `Coda:` begins a section, too.
        const bool isName = mRest.substr(length, 1) == ":" && EndsWord(length + 1);
        mList.Add(isName ? TTokenKind::Section : TTokenKind::PlayWords, Take(length));
        if (isName) Take(1);
        return true;
    }

    int TakeEndingNumber() {
        int number = 0;
        while (!mRest.empty() && IsDigit(mRest[0])) {
            number = std::min(number * 10 + (Take(1)[0] - '0'), kLastEnding + 1);
        }
        return number;
    }

    bool TakeOneOf(std::string_view characters) {
        if (mRest.empty() || characters.find(mRest[0]) == characters.npos) return false;
        Take(1);
        return true;
    }

    void TakeWord() {
        std::size_t length = 0;
        while (length < mRest.size() && !EndsWord(length) && !BeginsSign(length)) ++length;
        std::string_view word = Take(std::max<std::size_t>(length, 1));
        const std::string_view withoutComma = ChordText::WithoutCommasBehind(word);
        if (ChordText::IsSeparator(withoutComma)) {
            mChordBefore = {};
            return;
        }
        const bool endsPhrase = withoutComma.size() < word.size();
        word = withoutComma;
        if (word.size() > 1 && word.back() == ':') {
            mList.Add(TTokenKind::Section, word.substr(0, word.size() - 1));
            return;
        }
        if (LooksLikeAnOption(word) && JoinWithChordBefore(word)) return;
        const CChordTextReading reading = ReadChordText(word, mList.Prefs().mChordTextPrefs);
        if (reading.mKind == TChordText_NotUnderstood) {
            if (JoinWithChordBefore(word) || TakeRow(word)) return;
        }
        mList.AddReading(word, reading);
        const bool goesOn = reading.mKind == TChordText_Chord && !endsPhrase;
        mChordBefore = goesOn ? word : std::string_view();
    }

    /// A bar line, a section or an ending, which need no blank before them.
    [[nodiscard]] bool BeginsSign(std::size_t pos) const {
        const char c = mRest[pos];
        const char next = pos + 1 < mRest.size() ? mRest[pos + 1] : '\0';
        return c == '|' || c == '{' || (c == ':' && next == '|') || (c == '[' && IsDigit(next));
    }

    /// `(b9)` and `b9` could be chords on B; behind a chord on a capital they belong to it.
    [[nodiscard]] bool LooksLikeAnOption(std::string_view word) const {
        if (mChordBefore.empty() || !Ascii::IsCapital(mChordBefore[0])) return false;
        if (word[0] == '(') return word.size() > 1 && !Ascii::IsCapital(word[1]);
        return word.size() > 1 && word[0] == 'b' && IsDigit(word[1]) && word[1] != '7';
    }

    /// `C-G-Am`; a piece that is no chord is a fault of its own.
    bool TakeRow(std::string_view word) {
        const std::vector<std::string_view> pieces = ChordText::PiecesOfRow(word);
        const auto kindOf = [](std::string_view piece) { return ReadChordText(piece).mKind; };
        const bool hasRepeat =
            std::any_of(pieces.begin(), pieces.end(),
                        [&](std::string_view piece) { return kindOf(piece) == TChordText_Repeat; });
        const bool isRow = pieces.size() > 1 && !pieces.back().empty() && !hasRepeat &&
                           kindOf(pieces.front()) == TChordText_Chord;
        if (!isRow) return false;
        for (const std::string_view piece : pieces) {
            if (!mList.IsGivenUp()) mList.AddChordText(piece);
        }
        mChordBefore = {};
        return true;
    }

    /// `C maj7` is one chord in two words.
    bool JoinWithChordBefore(std::string_view word) {
        if (mChordBefore.empty()) return false;
        const auto length =
            static_cast<std::size_t>(word.data() + word.size() - mChordBefore.data());
        if (length > kLongestJoined) return false;
        const std::string_view joined(mChordBefore.data(), length);
        const CChordTextReading reading = ReadChordText(joined, mList.Prefs().mChordTextPrefs);
        if (reading.mKind != TChordText_Chord) return false;
        mList.mTokens.pop_back();
        mList.AddReading(joined, reading);
        mChordBefore = joined;
        return true;
    }

    std::string_view mRest;
    CTokenList& mList;
    /// The last token, if it is a chord of this line.
    std::string_view mChordBefore;
};

}  // namespace

void CutChordLine(std::string_view line, CTokenList& list) {
    CChordLine(line, list).Cut();
}

namespace {

/// More than anybody means by "x3" behind a line.
constexpr int kMostTimes = 16;

/// How often a line is played that ends in "x3"; the words are taken off. Behind `:|` they belong
/// to the repeat.
int TakeTimes(std::string_view& line) {
    const std::size_t blank = line.find_last_of(Ascii::kWhiteSpace);
    if (blank == line.npos) return 1;
    const std::string_view word = line.substr(blank + 1);
    const std::size_t digits = word.find_first_of("0123456789");
    const bool isTimes = digits != word.npos && word.find_first_of("xX") != word.npos &&
                         LengthOfPlayWords(word) == word.size();
    const std::string_view before = Trimmed(line.substr(0, blank));
    const std::size_t signs = before.find_last_not_of("|:]") + 1;
    if (!isTimes || before.substr(signs).find(":|") != before.npos) return 1;
    line = before;
    return std::clamp(ReadInteger(word.substr(digits)), 1, kMostTimes);
}

/// Plays what stands from `begin` on so many times in all, without the names of parts in front.
void RepeatLine(std::size_t begin, int times, std::string_view line, CTokenList& list) {
    const std::size_t end = list.mTokens.size();
    while (list.mTokens[begin].mKind == TTokenKind::Section) ++begin;
    for (int i = 1; i < times; ++i) {
        if (!list.AddAgain(begin, end)) {
            return list.AddFault(line, "its repeated lines make the song too long");
        }
    }
}

}  // namespace

void CutSheetLine(std::string_view line, CTokenList& list) {
    const std::string_view whole = line = Trimmed(line);
    const int times = TakeTimes(line);
    std::size_t begin = list.mTokens.size();
    CutChordLine(line, list);
    const auto at = [&](std::size_t index) {
        return list.mTokens.begin() + static_cast<std::ptrdiff_t>(index);
    };
    const auto music = std::find_if(at(begin), list.mTokens.end(), IsMusic);
    if (music == list.mTokens.end()) {
        if (times > 1) list.AddNote(whole, "there are no chords on this line to play again");
        return;
    }
    const bool hasBars = std::any_of(at(begin), list.mTokens.end(), IsBar);
    if (list.mEndOfBars > 0 && music->mKind != TTokenKind::Hold) {
        list.mTokens.insert(at(list.mEndOfBars), CToken());
        ++begin;
    }
    if (hasBars && times > 1) list.AddBar(false, false);
    RepeatLine(begin, times, whole, list);
    list.mEndOfBars = hasBars ? list.mTokens.size() : 0;
}

void CutChordText(CTokenList& list) {
    std::string_view rest = list.Text();
    while (!rest.empty() && !list.IsGivenUp()) CutSheetLine(TakeLine(rest), list);
}

}  // namespace brindle::SongText
