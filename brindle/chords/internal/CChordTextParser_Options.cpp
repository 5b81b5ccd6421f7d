// SPDX-License-Identifier: MIT
#include "brindle/chords/internal/CChordTextParser.h"
#include "brindle/chords/internal/DegreesOfChordText.h"

#include <algorithm>
#include <array>

namespace brindle::ChordText {
namespace {

// The longer first.
constexpr auto kSuspendedWords = std::to_array<std::string_view>({"suspended", "susp", "sus"});

struct CSuspensionRow {
    std::string_view mText;
    bool mHasSecond;
    bool mHasFourth;
};

// What may stand behind a word for suspended; without it the fourth is meant.
constexpr auto kSuspensionRows = std::to_array<CSuspensionRow>({
    {"2sus4", true, true},
    {"2/4", true, true},
    {"24", true, true},
    {"42", true, true},
    {"2", true, false},
    {"4", false, true},
    {"second", true, false},
    {"fourth", false, true},
});

template <class CWords>
std::size_t LengthOfWord(const CTextScan& scan, const CWords& words) {
    const auto* const found = std::find_if(
        words.begin(), words.end(), [&](std::string_view word) { return scan.SeesWord(word); });
    return found == words.end() ? 0 : found->size();
}

}  // namespace

bool CChordTextParser::ReadOptions() {
    if (mPrefs.mOwnName) {
        // The comma behind a printed root parts it from the rest and means nothing else.
        while (mScan.Peek() == ' ' || mScan.Peek() == ',') ++mScan.mPos;
    }
    while (!mScan.AtEnd()) {
        if (!ReadOption()) return false;
    }
    return true;
}

struct CChordTextParser::COptionRow {
    std::string_view mWord;
    bool (CChordTextParser::*mRead)(std::size_t wordLength);
};

/// The row of the word that the text goes on with; null without one.
const CChordTextParser::COptionRow* CChordTextParser::FindOptionRow(const CTextScan& scan) {
    using Parser = CChordTextParser;
    // A longer word before one that it begins with.
    static constexpr auto kRows = std::to_array<COptionRow>({
        {"add", &Parser::ReadAddition},
        {"altered", &Parser::ReadAltered},
        {"alt", &Parser::ReadAltered},
        {"drone", &Parser::ReadDrone},
        {"no", &Parser::ReadOmission},
        {"omit", &Parser::ReadOmission},
        {"without", &Parser::ReadOmission},
    });
    const auto* const row = std::find_if(kRows.begin(), kRows.end(), [&](const COptionRow& option) {
        return scan.SeesWord(option.mWord);
    });
    return row == kRows.end() ? nullptr : row;
}

bool CChordTextParser::ReadOption() {
    const char c = mScan.Peek();
    if (c == ' ' || c == '.') {
        ++mScan.mPos;
        return true;
    }
    if (c == '(' || c == ')' || c == ',' || c == '/') return ReadPunctuation(c);
    if (const COptionRow* row = FindOptionRow(mScan)) return (this->*row->mRead)(row->mWord.size());
    if (mScan.SeesWord("s") && ReadSuspension()) return true;
    return ReadDegreeOption();
}

/// `b9`, `11`; whatever else is no word.
bool CChordTextParser::ReadDegreeOption() {
    CTextScan scan = mScan;
    if (const int sign = TakeSign(scan)) {
        const std::size_t length = scan.mPos - mScan.mPos;
        if (IsDigit(scan.Peek()) || TakeNumber(scan) != 0) return ReadSignedDegree(sign, length);
    }
    scan = mScan;
    if (const int number = TakeNumber(scan)) {
        mScan = scan;
        return ReadNumber(number);
    }
    return ReadOtherOption();
}

bool CChordTextParser::ReadDrone(std::size_t wordLength) {
    mScan.mPos += wordLength;
    mTones.EraseThird();
    ++mPartCount;
    return true;
}

bool CChordTextParser::ReadAltered(std::size_t wordLength) {
    mScan.mPos += wordLength;
    mTones.MakeAltered();
    ++mPartCount;
    return true;
}

/// Without a degree behind it, which would make it a sign.
bool CChordTextParser::ReadAugmented(std::size_t wordLength) {
    mScan.mPos += wordLength;
    mTones.RaiseFifth();
    ++mPartCount;
    return true;
}

bool CChordTextParser::ReadPunctuation(char c) {
    const std::size_t pos = mScan.mPos++;
    if (c == '(') {
        ++mDepth;
    } else if (c == ')') {
        if (mDepth == 0) return Fail(TFault::BracketTooMany, pos, 1);
        --mDepth;
    } else {
        mNumbersAreSingle = true;
    }
    if (c != '/') return true;
    const std::size_t behind = mScan.Rest().find_first_not_of(" )");
    return behind != std::string_view::npos || Fail(TFault::SlashWithoutBass, pos, 1);
}

bool CChordTextParser::ReadOmission(std::size_t wordLength) {
    const std::size_t pos = mScan.mPos;
    const bool isDirectlyBehindRoot = mPartCount == 0;
    mScan.mPos += wordLength;
    mScan.SkipBlanks();
    ++mPartCount;
    if (mScan.TakeWord("root")) {
        mTones.Omit(1);
        return true;
    }
    while (true) {
        int degree = TakeNumber(mScan);
        if (degree == 0 && mScan.Peek() == '1' && !IsDigit(mScan.Peek(1)) && mScan.Take('1')) {
            degree = 1;
        }
        if (degree == 0) return FailNumberOr(TFault::WordWithoutDegree, pos, wordLength);
        mTones.Omit(degree);
        if (mPrefs.mOwnName) {
            if (degree == 3 && isDirectlyBehindRoot) mTones.EraseFifth();
            return true;
        }
        // A list, `no3,5`, goes on with a number.
        CTextScan ahead = mScan;
        ahead.SkipBlanks();
        if (!ahead.Take(',') && !ahead.Take('&')) return true;
        ahead.SkipBlanks();
        if (!IsDigit(ahead.Peek())) return true;
        mScan = ahead;
    }
}

/// Directly behind a word for suspended, `#4` or `(+4` is the tone that suspends.
bool CChordTextParser::ReadRaisedFourth() {
    CTextScan scan = mScan;
    scan.SkipBlanks();
    const bool isInBracket = scan.Take('(');
    if (TakeSign(scan) != 1 || TakeNumber(scan) != 4) return false;
    mScan = scan;
    mTones.Suspend(6);
    if (isInBracket) ++mDepth;
    return true;
}

/// False when it is no suspension after all.
bool CChordTextParser::ReadSuspension() {
    CTextScan scan = mScan;
    const std::size_t wordLength = LengthOfWord(scan, kSuspendedWords);
    scan.mPos += wordLength > 0 ? wordLength : 1;
    const CTextScan behindWord = scan;
    scan.SkipBlanks();
    // Of the short form there are `s2` and `s4`.
    const auto fits = [&](const CSuspensionRow& row) {
        return scan.SeesWord(row.mText) && (wordLength > 0 || row.mText.size() == 1);
    };
    const auto* const row = std::find_if(kSuspensionRows.begin(), kSuspensionRows.end(), fits);
    if (row == kSuspensionRows.end()) {
        if (wordLength == 0) return false;
        mScan = behindWord;
        if (!ReadRaisedFourth()) mTones.Suspend(5);
    } else {
        scan.mPos += row->mText.size();
        mScan = scan;
        if (row->mHasSecond) mTones.Suspend(2);
        if (row->mHasFourth) mTones.Suspend(5);
    }
    ++mPartCount;
    return true;
}

bool CChordTextParser::ReadAddition(std::size_t wordLength) {
    const std::size_t pos = mScan.mPos;
    mScan.mPos += wordLength;
    mScan.SkipBlanks();
    if (mScan.Take('(')) ++mDepth;
    mScan.SkipBlanks();
    ++mPartCount;
    CTextScan scan = mScan;
    if (TakeMajorMark(scan)) {
        scan.SkipBlanks();
        if (const int number = TakeNumber(scan)) {
            mScan = scan;
            if (number == 7) {
                mTones.AddMajorSeventh();
            } else {
                mTones.Add(number, 0);
            }
            return true;
        }
    }
    const int sign = TakeSign(mScan);
    const int number = TakeNumber(mScan);
    if (number == 0) return FailNumberOr(TFault::WordWithoutDegree, pos, wordLength);
    mTones.Add(number, sign);
    return true;
}

bool CChordTextParser::ReadSignedDegree(int sign, std::size_t signLength) {
    const std::size_t pos = mScan.mPos;
    mScan.mPos += signLength;
    const int number = TakeNumber(mScan);
    if (number == 0) return Fail(TFault::NoDegree);
    ++mPartCount;
    return mTones.Alter({number, sign}) || Fail(TFault::NotUnderstood, pos);
}

bool CChordTextParser::ReadNumber(int number) {
    const bool isDirectlyBehindRoot = mPartCount == 0;
    ++mPartCount;
    const bool isStacked = mTones.FirstNumber() == 0 && mDepth == 0 && !mNumbersAreSingle &&
                           number != 3 && number != 10;
    const int sign = SignBehindNumber(number);
    if (sign != 0) ++mScan.mPos;
    // C9- is C7b9: the ninth is stacked before it is altered.
    if (isStacked && !(number == 5 && sign != 0)) {
        if (mPrefs.mOwnName) {
            mTones.StackOfOwnName(number, isDirectlyBehindRoot);
        } else {
            mTones.Stack(number, isDirectlyBehindRoot);
        }
    }
    if (sign != 0) return mTones.Alter({number, sign}) || Fail(TFault::NotUnderstood);
    if (!isStacked) mTones.AddSingle(number);
    return true;
}

int CChordTextParser::SignBehindNumber(int number) const {
    const char c = mScan.Peek();
    const bool isFlat = c == 'b' || c == '-';
    if (!isFlat && c != '#' && c != '+') return 0;
    if (IsDigit(mScan.Peek(1))) return 0;
    const bool standsByItself = mDepth > 0 || mNumbersAreSingle || c == '-';
    const bool alters = number == 5 || (number >= 9 && number != 10 && standsByItself);
    if (!alters) return 0;
    return isFlat ? -1 : 1;
}

bool CChordTextParser::ReadOtherOption() {
    const std::size_t pos = mScan.mPos;
    if (mScan.Peek() == '+') return ReadAugmented(1);
    if (mScan.SeesWord("aug")) return ReadAugmented(3);
    if (ReadLoneDim()) return true;
    // `C/j7` is a way to write Cj7, `C/J` has a bass that is none.
    if (mScan.LastNonBlank() == '/' && mScan.SeesWord("j") && !IsDigit(mScan.Peek(1))) {
        return Fail(TFault::NoBassNote);
    }
    if (const auto major = TakeMajorMark(mScan)) {
        ReadMajorMark(*major == TMajorMark::Seventh);
        ++mPartCount;
        return true;
    }
    if (IsDigit(mScan.Peek())) return Fail(TFault::NoDegree);
    // `C/b/G` has two basses.
    if (mScan.LastNonBlank() == '/' && mScan.Peek() == 'b') return FailBehindSlash();
    if (TakeSign(mScan) != 0) {
        return Fail(TFault::SignWithoutNumber, pos, mScan.mPos - pos);
    }
    return FailAtOption();
}

// `C7dim` is a diminished seventh chord.
bool CChordTextParser::ReadLoneDim() {
    if (mPartCount != 1 || mTones.FirstNumber() != 7 || mTones.IsMajorMarked()) return false;
    if (!mScan.TakeWord("dim")) return false;
    mTones = {};
    mTones.MakeDiminished();
    mTones.Stack(7, false);
    ++mPartCount;
    return true;
}

void CChordTextParser::ReadMajorMark(bool isSeventhSign) {
    CTextScan scan = mScan;
    scan.SkipBlanks();
    const bool sixFollows = scan.Peek() == '6';
    const int number = TakeNumber(scan);
    const bool isStacked = number == 7 || number == 9 || number == 11 || number == 13;
    if (isStacked) mScan = scan;
    mTones.MarkMajor(isSeventhSign, isStacked ? number : 0, sixFollows);
}

}  // namespace brindle::ChordText
