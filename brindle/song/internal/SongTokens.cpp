// SPDX-License-Identifier: MIT
#include "brindle/song/internal/SongTokens.h"

#include "brindle/platform/ReadNumber.h"
#include "brindle/platform/Utf8.h"

#include <algorithm>
#include <array>
#include <utility>

namespace brindle::SongText {
namespace {

/// More faults than anybody reads.
constexpr std::size_t kMostFaults = 1000;
/// What the words "chorus" and "x3" may add.
constexpr std::size_t kMostAddedAgain = 100'000;
/// Characters of a text that a fault repeats.
constexpr int kLongestShown = 40;

struct CRepeatRow {
    std::string_view mText;
    TTokenKind mKind;
    int mCount;
};

// What ReadChordText takes for a repeat; what is not here holds for one step.
constexpr auto kRepeatRows = std::to_array<CRepeatRow>({
    {"//", TTokenKind::Hold, 2},
    {"///", TTokenKind::Hold, 3},
    {"////", TTokenKind::Hold, 4},
    {"%", TTokenKind::RepeatBars, 1},
    {"./.", TTokenKind::RepeatBars, 1},
    {"x", TTokenKind::RepeatBars, 1},
    {"simile", TTokenKind::RepeatBars, 1},
    {"sim.", TTokenKind::RepeatBars, 1},
    {"\U0001D10E", TTokenKind::RepeatBars, 1},
    {"÷", TTokenKind::RepeatBars, 1},
    {".//.", TTokenKind::RepeatBars, 2},
    {"r", TTokenKind::RepeatBars, 2},
    {"\U0001D10F", TTokenKind::RepeatBars, 2},
});

/// The byte of character `pos`, counted from 1.
std::size_t ByteOfCharacter(std::string_view text, int pos) {
    std::size_t byte = 0;
    for (int begun = 0; byte < text.size(); ++byte) {
        begun += BeginsUtf8Character(text[byte]) ? 1 : 0;
        if (begun == pos) break;
    }
    return byte;
}

}  // namespace

CToken& CTokenList::Add(TTokenKind kind, std::string_view text) {
    CToken& token = mTokens.emplace_back();
    token.mKind = kind;
    token.mText = text;
    return token;
}

void CTokenList::AddBar(bool endsRepeat, bool startsRepeat) {
    CToken& bar = Add(TTokenKind::Bar);
    bar.mEndsRepeat = endsRepeat;
    bar.mStartsRepeat = startsRepeat;
}

void CTokenList::AddChordText(std::string_view text) {
    AddReading(text, ReadChordText(text, mPrefs.mChordTextPrefs));
}

void CTokenList::AddReading(std::string_view text, const CChordTextReading& reading) {
    switch (reading.mKind) {
        case TChordText_NotUnderstood:
            AddFault(text, reading);
            Add(TTokenKind::Chord, text).mChord = CChordLite_NoChordYield;
            return;
        case TChordText_Repeat: {
            const auto* const row =
                std::find_if(kRepeatRows.begin(), kRepeatRows.end(),
                             [&](const CRepeatRow& r) { return r.mText == text; });
            const bool isHold = row == kRepeatRows.end();
            Add(isHold ? TTokenKind::Hold : row->mKind, text).mCount = isHold ? 1 : row->mCount;
            return;
        }
        case TChordText_Chord:
        case TChordText_NoChord: {
            CToken& chord = Add(TTokenKind::Chord, text);
            chord.mChord = reading.mChord;
            if (reading.mHasAugmentedSixth) chord.mSeventh = TSeventhSpelling_AugmentedSixth;
            mHasH = mHasH || reading.mHasH;
            return;
        }
    }
}

bool CTokenList::HasBarLines() const {
    return std::any_of(mTokens.begin(), mTokens.end(),
                       [](const CToken& token) { return token.mKind == TTokenKind::Bar; });
}

bool CTokenList::AddAgain(std::size_t begin, std::size_t end) {
    mAddedAgain += end - begin;
    if (mAddedAgain > kMostAddedAgain) return false;
    mTokens.reserve(mTokens.size() + end - begin);
    for (std::size_t i = begin; i < end; ++i) mTokens.push_back(mTokens[i]);
    return true;
}

void CTokenList::AddFault(std::string_view where, std::string text) {
    AddFaultOrNote(where, std::move(text), false);
}

void CTokenList::AddNote(std::string_view where, std::string text) {
    AddFaultOrNote(where, std::move(text), true);
}

void CTokenList::AddFaultOrNote(std::string_view where, std::string text, bool isNote) {
    mHasFault = mHasFault || !isNote;
    if (mFaults.size() == kMostFaults) return;
    const auto offset = static_cast<std::size_t>(where.data() - mText.data());
    mFaults.push_back({offset, std::move(text), isNote});
}

void CTokenList::AddFault(std::string_view chord, const CChordTextReading& reading) {
    AddFault(chord.substr(ByteOfCharacter(chord, reading.mFaultPos)),
             std::string(ShownOf(chord)) + ": " + reading.mFault);
}

void CTokenList::MakeGerman() {
    CChordTextOptions prefs = mPrefs.mChordTextPrefs;
    prefs.mBIsBFlat = true;
    for (CToken& token : mTokens) {
        if (token.mKind != TTokenKind::Chord) continue;
        const CChordTextReading reading = ReadChordText(token.mText, prefs);
        if (reading.mKind == TChordText_Chord) token.mChord = reading.mChord;
    }
}

std::string_view ShownOf(std::string_view text) {
    return text.substr(0, ByteOfCharacter(text, kLongestShown + 1));
}

CSongTime ReadTime(std::string_view text) {
    const std::size_t slash = std::min(text.find('/'), text.size());
    CSongTime time{ReadInteger(text.substr(0, slash)), 4};
    if (slash < text.size()) time.mDenominator = ReadInteger(text.substr(slash + 1));
    const bool isTime = time.mNumerator < 100 && time.mDenominator <= 128 && !time.IsUndef();
    return isTime ? time : CSongTime{};
}

}  // namespace brindle::SongText
