// SPDX-License-Identifier: MIT
// The options of a chord that are words: sus, add, no, alt, drone, aug, dim.

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

/// A number that may be 1, too; 0 for none.
int TakeOmittedDegree(CTextScan& scan) {
    if (const int degree = TakeNumber(scan)) return degree;
    return scan.Peek() == '1' && !IsDigit(scan.Peek(1)) && scan.Take('1') ? 1 : 0;
}

/// What stands between the numbers of a list, `no3,5`: only where a number follows.
bool TakeComma(CTextScan& scan) {
    CTextScan ahead = scan;
    ahead.SkipBlanks();
    if (!ahead.Take(',') && !ahead.Take('&')) return false;
    ahead.SkipBlanks();
    if (!IsDigit(ahead.Peek())) return false;
    scan = ahead;
    return true;
}

}  // namespace

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
    do {
        const int degree = TakeOmittedDegree(mScan);
        if (degree == 0) return FailNumberOr(TFault::WordWithoutDegree, pos, wordLength);
        mTones.Omit(degree);
        if (mPrefs.mOwnName) {
            if (degree == 3 && isDirectlyBehindRoot) mTones.EraseFifth();
            return true;
        }
    } while (TakeComma(mScan));
    return true;
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

}  // namespace brindle::ChordText
