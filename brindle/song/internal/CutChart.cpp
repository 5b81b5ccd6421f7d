// SPDX-License-Identifier: MIT
#include "brindle/platform/Utf8.h"
#include "brindle/song/internal/PlayWords.h"
#include "brindle/song/internal/SongTokens.h"
#include "brindle/song/internal/SongWords.h"

#include <algorithm>
#include <array>
#include <optional>

namespace brindle::SongText {
namespace {

struct CTimeRow {
    std::string_view mText;
    CSongTime mTime;
};

constexpr auto kTimeRows = std::to_array<CTimeRow>({
    {"T22", {2, 2}},
    {"T32", {3, 2}},
    {"T24", {2, 4}},
    {"T34", {3, 4}},
    {"T44", {4, 4}},
    {"T54", {5, 4}},
    {"T64", {6, 4}},
    {"T74", {7, 4}},
    {"T38", {3, 8}},
    {"T58", {5, 8}},
    {"T68", {6, 8}},
    {"T78", {7, 8}},
    {"T98", {9, 8}},
    {"T12", {12, 8}},
});

// What a chord goes on with behind its root; a capital begins the next one.
constexpr auto kChordPieces = std::to_array<std::string_view>(
    {"sus", "add", "alt", "maj", "no", "b", "#", "^", "-", "+", "o",      "h",
     "0",   "1",   "2",   "3",   "4",  "5", "6", "7", "8", "9", "\u266F", "\u266D"});

bool IsRoot(char c) {
    return c >= 'A' && c <= 'G';
}

/// Fills what `Title=Composer=Style=Key=n=Chart` tells and gives the chart, or the chart alone.
std::string_view TakeFields(std::string_view text, CTokenList& list) {
    constexpr std::size_t kFieldCount = 6;
    std::array<std::string_view, kFieldCount> fields;
    for (std::size_t i = 0; i + 1 < kFieldCount; ++i) {
        const std::size_t end = text.find('=');
        if (end == text.npos) return i == 0 ? text : std::string_view();
        fields[i] = text.substr(0, end);
        text.remove_prefix(end + 1);
    }
    list.Song().mTitle = Trimmed(fields[0]);
    list.Song().mMakers = Trimmed(fields[1]);
    list.Song().mStyle = Trimmed(fields[2]);
    list.Add(TTokenKind::Key, Trimmed(fields[3]));
    return text;
}

/// A chart has no need of blanks: it is read character by character.
class CChart {
public:
    CChart(std::string_view chart, CTokenList& list) : mRest(chart), mList(list) {}

    void Cut() {
        while (!mRest.empty() && !mList.IsGivenUp()) {
            if (!TakeMark() && !TakeChord()) TakeUnknown();
        }
    }

private:
    std::string_view Take(std::size_t length) {
        const std::string_view taken = mRest.substr(0, length);
        mRest.remove_prefix(taken.size());
        return taken;
    }

    bool TakeMark() {
        switch (mRest.front()) {
            case '{':
                return AddBar(false, true);
            case '}':
                return AddBar(true, false);
            case '|':
            case '[':
            case ']':
            case 'Z':
                return AddBar(false, false);
            case '*':
                return TakeSection();
            case 'T':
                return TakeTime();
            case 'N':
                return TakeEnding();
            case '<':
                return TakeWords();
            case 'Q':
                mList.Add(TTokenKind::CodaSign, Take(1));
                return true;
            case 'S':
                mList.Add(TTokenKind::PlayWords, Take(1));
                return true;
            case '(':
                // A chord that could be played instead.
                return TakeUpTo(')');
            case 'n':
            case 'p':
            case 'x':
            case 'r':
                mList.AddChordText(Take(1));
                return true;
            default:
                return TakeOrnament();
        }
    }

    bool AddBar(bool endsRepeat, bool startsRepeat) {
        mList.AddBar(endsRepeat, startsRepeat);
        Take(1);
        return true;
    }

    /// `*A`; `*i` is an introduction.
    bool TakeSection() {
        const std::string_view name = Take(2).substr(1);
        mList.Add(TTokenKind::Section, name == "i" ? "Intro" : name);
        return true;
    }

    bool TakeTime() {
        const auto* const row =
            std::find_if(kTimeRows.begin(), kTimeRows.end(),
                         [&](const CTimeRow& r) { return mRest.starts_with(r.mText); });
        if (row == kTimeRows.end()) return false;
        mList.Add(TTokenKind::Time, Take(row->mText.size())).mTime = row->mTime;
        return true;
    }

    /// `N1` to `N3`; `N0` is the ending without a number.
    bool TakeEnding() {
        if (mRest.size() < 2 || !IsDigit(mRest[1])) return false;
        const int number = Take(2)[1] - '0';
        if (number > 0) mList.Add(TTokenKind::Ending).mEndings = std::uint64_t{1} << number;
        return true;
    }

    bool TakeUpTo(char end) {
        Take(std::min(mRest.find(end), mRest.size() - 1) + 1);
        return true;
    }

    /// `<D.C. al Coda>`, `<3x>`; all other words are for the eye.
    bool TakeWords() {
        std::string_view words = mRest.substr(1);
        // `<*74...>` tells how high the words stand.
        if (words.size() > 3 && words[0] == '*' && IsDigit(words[1]) && IsDigit(words[2])) {
            words.remove_prefix(3);
        }
        if (const std::size_t length = LengthOfPlayWords(words); length > 0) {
            mList.Add(TTokenKind::PlayWords, words.substr(0, length));
        }
        return TakeUpTo('>');
    }

    /// Blanks and what concerns the eye.
    bool TakeOrnament() {
        constexpr std::string_view kOrnaments = ",slYUf";
        if (!IsBlank(mRest.front()) && kOrnaments.find(mRest.front()) == kOrnaments.npos) {
            return false;
        }
        Take(1);
        return true;
    }

    bool TakeChord() {
        const bool hasRoot = IsRoot(mRest.front());
        // W stands for the chord before, with another bass.
        if (!hasRoot && mRest.front() != 'W') return false;
        std::size_t length = LengthOfPieces(1);
        const bool hasBass =
            length + 1 < mRest.size() && mRest[length] == '/' && IsRoot(mRest[length + 1]);
        const std::size_t bass = length + 1;
        if (hasBass) length = LengthOfPieces(bass + 1);
        const std::string_view chord = Take(length);
        if (hasRoot) {
            mList.AddChordText(chord);
            mChordBefore = mList.mTokens.back().mChord;
        } else if (hasBass) {
            AddChordBeforeWithBass(chord, chord.substr(bass));
        }
        return true;
    }

    [[nodiscard]] std::size_t LengthOfPieces(std::size_t pos) const {
        while (true) {
            const std::string_view rest = mRest.substr(pos);
            const auto* const piece =
                std::find_if(kChordPieces.begin(), kChordPieces.end(),
                             [&](std::string_view p) { return rest.starts_with(p); });
            if (piece == kChordPieces.end()) return pos;
            pos += piece->size();
        }
    }

    void AddChordBeforeWithBass(std::string_view text, std::string_view bass) {
        if (!mChordBefore) return mList.AddFault(text, "there is no chord before this one");
        CChordLite chord = *mChordBefore;
        const CChordTextReading reading = ReadChordText(bass, mList.Prefs().mChordTextPrefs);
        const CKeyEnh key = reading.mChord.mRootKeyEnh;
        const bool isRoot = key.mKeyNr == chord.mRootKeyEnh.mKeyNr;
        chord.mBassKeyEnh = isRoot ? CKeyEnh_Undef : key;
        mList.Add(TTokenKind::Chord, text).mChord = chord;
    }

    void TakeUnknown() {
        std::size_t length = 1;
        while (length < mRest.size() && !BeginsUtf8Character(mRest[length])) ++length;
        const std::string_view unknown = Take(length);
        mList.AddFault(unknown, "\"" + std::string(unknown) + "\" is not understood");
    }

    std::string_view mRest;
    CTokenList& mList;
    std::optional<CChordLite> mChordBefore;
};

}  // namespace

void CutChart(CTokenList& list) {
    list.mIsEven = true;
    list.mWordsStandInFront = true;
    CChart(TakeFields(list.Text(), list), list).Cut();
}

}  // namespace brindle::SongText
