// SPDX-License-Identifier: MIT
#include "brindle/chords/internal/CChordTextTones.h"

#include <algorithm>
#include <array>

namespace brindle::ChordText {
namespace {

struct CAlterationRow {
    int mDegree;
    int mSign;
    int mTone;
    /// The stacked tone that it takes the place of, 0 for none.
    int mReplaces;
};

// Fifths, thirds and sevenths have rules of their own. A flat thirteen is a tension and leaves the
// fifth alone.
constexpr auto kAlterationRows = std::to_array<CAlterationRow>({
    {9, -1, 1, 2},
    {2, -1, 1, 2},
    {9, +1, 3, 2},
    {2, +1, 3, 2},
    {10, -1, 3, 2},
    {11, +1, 6, 5},
    {4, +1, 6, 5},
    {11, -1, 4, 5},
    {4, -1, 4, 5},
    {13, -1, 8, 9},
    {6, -1, 8, 9},
    {13, +1, 10, 9},
    {6, +1, 10, 9},
});

// The tone of a degree in the major scale; that of 7 is the minor seventh.
constexpr int ToneOfDegree(int degree) {
    constexpr std::array<int, 14> kTones{0, 0, 2, 4, 5, 7, 9, 10, 0, 2, 4, 5, 7, 9};
    return kTones[static_cast<std::size_t>(degree)];
}

}  // namespace

void CChordTextTones::MakeDiminished() {
    mThird = 3;
    mFifths = Bit(6);
    mIsDiminished = true;
}

void CChordTextTones::MakeHalfDiminished() {
    mThird = 3;
    mFifths = Bit(6);
    mSevenths = Bit(10);
}

void CChordTextTones::MakeAugmented() {
    mFifths = Bit(8);
}

void CChordTextTones::MarkMajor(bool isSeventhSign, int number, bool sixFollows) {
    mIsMajorMarked = true;
    if (number > 0 && mFirstNumber == 0) {
        mFirstNumber = number;
        StackFrom(number, 11);
    } else if (number > 0) {
        AddMajorBehindNumber(number);
    } else if ((mSevenths & Bit(10)) != 0) {
        mSevenths = (mSevenths & ~Bit(10)) | Bit(11);
    } else if (isSeventhSign) {
        if (sixFollows) return;
        mSevenths |= Bit(11);
        if (mFirstNumber == 0) mFirstNumber = 7;
    } else if (mThird == 3) {
        mSevenths |= Bit(11);
    }
}

void CChordTextTones::AddMajorBehindNumber(int number) {
    // C9maj7 has one seventh, C7/ma7 both.
    const bool replaces = mFirstNumber > 7 || (mFirstNumber == 7 && number > 7);
    if (replaces) mSevenths &= ~Bit(10);
    mSevenths |= Bit(11);
    if (number > 7) mTones |= Bit(ToneOfDegree(number));
}

void CChordTextTones::StackFrom(int number, int seventh) {
    mSevenths |= Bit(seventh);
    if (number >= 9) mStack |= Bit(2);
    if (number >= 11) mStack |= Bit(5);
    if (number >= 13) mStack |= Bit(9);
}

void CChordTextTones::Stack(int number, bool isDirectlyBehindRoot) {
    mFirstNumber = number;
    switch (number) {
        case 2:
            mTones |= Bit(2);
            return;
        case 4:
            if (mThird == 3 || mIsMajorMarked) {
                mTones |= Bit(5);
            } else {
                Suspend(5);
            }
            return;
        case 5:
            if (isDirectlyBehindRoot) {
                EraseThird();
            } else {
                mTones |= Bit(7);
            }
            return;
        case 6:
            mTones |= Bit(9);
            return;
        default:
            if (mIsMajorMarked) return StackFrom(number, 11);
            return StackFrom(number, mIsDiminished ? 9 : 10);
    }
}

void CChordTextTones::StackOfOwnName(int number, bool isDirectlyBehindRoot) {
    if (number < 9) return Stack(number, isDirectlyBehindRoot);
    mFirstNumber = number;
    AddSingle(number);
}

void CChordTextTones::AddSingle(int number) {
    if (number == 4 && mThird == 4) {
        Suspend(5);
    } else if (number != 7) {
        mTones |= Bit(ToneOfDegree(number));
    } else if (mIsDiminished) {
        mSevenths |= (mSevenths & Bit(9)) == 0 ? Bit(9) : Bit(10);
    } else {
        mSevenths |= mIsMajorMarked ? Bit(11) : Bit(10);
    }
}

void CChordTextTones::Add(int number, int sign) {
    if (number == 7 && sign == 0) return AddSingle(7);
    // `add b7` is the minor seventh, as is `add 7`.
    const int seventh = sign > 0 ? 11 : 10;
    mSixthIsRaised = mSixthIsRaised || (number == 6 && sign == 1);
    mTones |= Bit(number == 7 ? seventh : ToneOfDegree(number) + sign);
}

bool CChordTextTones::Alter(CAlteredDegree altered) {
    const auto [degree, sign] = altered;
    if (degree == 5) {
        mFifths = (mFifths & ~Bit(7)) | Bit(7 + sign);
        return true;
    }
    if (degree == 7) {
        if (sign > 0) {
            AddMajorBehindNumber(7);
        } else {
            mSevenths |= Bit(10);
        }
        return true;
    }
    if (degree == 3 && sign < 0) {
        if (mThird == 4) EraseThird();
        mTones |= Bit(3);
        return true;
    }
    const auto* const row = std::find_if(kAlterationRows.begin(), kAlterationRows.end(),
                                         [degree = degree, sign = sign](const CAlterationRow& r) {
                                             return r.mDegree == degree && r.mSign == sign;
                                         });
    if (row == kAlterationRows.end()) return false;
    mSixthIsRaised = mSixthIsRaised || (degree == 6 && sign == 1);
    mStack &= ~Bit(row->mReplaces);
    mTones |= Bit(row->mTone);
    return true;
}

// The altered dominant of jazz: 7#9#5, all tones of the minor key a fifth below.
void CChordTextTones::MakeAltered() {
    mSevenths = Bit(10);
    mFifths = Bit(8);
    mStack = 0;
    mTones |= Bit(3);
}

void CChordTextTones::RaiseFifth() {
    mFifths = (mFifths & ~Bit(7)) | Bit(8);
}

void CChordTextTones::Omit(int degree) {
    switch (degree) {
        case 3:
        case 10:
            return EraseThird();
        case 5:
            return EraseFifth();
        case 7:
            mSeventhIsLeftOut = true;
            return;
        default:
            mLeftOut |= Bit(ToneOfDegree(degree));
    }
}

CSemitones CChordTextTones::Semitones() const {
    TTones tones = Bit(0) | mStack | mTones;
    tones &= ~mLeftOut;
    tones |= mFifths | mSus;
    if (!mSeventhIsLeftOut) tones |= mSevenths;
    if (mThird != 0 && mSus == 0) tones |= Bit(mThird);
    return CSemitones(tones);
}

}  // namespace brindle::ChordText
