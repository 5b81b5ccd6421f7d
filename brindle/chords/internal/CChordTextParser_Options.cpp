// SPDX-License-Identifier: MIT
// What stands behind the quality of a chord: words, signed degrees, numbers and what parts them.

#include "brindle/chords/internal/CChordTextParser.h"
#include "brindle/chords/internal/DegreesOfChordText.h"

#include <algorithm>
#include <array>

namespace brindle::ChordText {

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
