// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CSemitones.h"

#include <cstdint>

namespace brindle::ChordText {

/// The degree of an altered tone: `b9` is the ninth with -1.
struct CAlteredDegree {
    int mDegree = 0;
    int mSign = 0;
};

/// The tones of a chord while its text is read from left to right. A fresh one is a major triad.
class CChordTextTones {
public:
    // Qualities.
    void MakeMinor() { mThird = 3; }
    void MakeDiminished();
    void MakeHalfDiminished();
    void MakeAugmented();

    /// The third that sounds unless the chord is suspended: 4, 3, or 0 for none.
    /// The first number that was stacked, 0 for none.
    [[nodiscard]] int FirstNumber() const { return mFirstNumber; }
    [[nodiscard]] bool IsMajorMarked() const { return mIsMajorMarked; }

    /// A word for major (`maj`) or the sign of the major seventh (`^`) with the number behind it:
    /// 7, 9, 11 or 13, 0 for none.
    void MarkMajor(bool isSeventhSign, int number, bool sixFollows);

    /// The first number of the chord with what it brings: C13 has the tones below the thirteenth.
    /// A 5 directly behind the root is a power chord.
    void Stack(int number, bool isDirectlyBehindRoot);
    /// The first number of a name printed by this library: 9, 11 and 13 bring nothing.
    void StackOfOwnName(int number, bool isDirectlyBehindRoot);
    /// A number that stands by itself: `C7(13)`, `C6 9`.
    void AddSingle(int number);
    /// The tone of a degree and nothing else: `add9`, `add#11`. Without a sign a seventh is as
    /// AddSingle has it.
    void Add(int number, int sign);
    void AddMajorSeventh() { mSevenths |= Bit(11); }
    /// False when the degree cannot be altered so.
    [[nodiscard]] bool Alter(CAlteredDegree altered);

    /// Suspended by tone 2, 5 or 6.
    void Suspend(int tone) { mSus |= Bit(tone); }
    void MakeAltered();
    void RaiseFifth();
    void EraseThird() { mThird = 0; }
    void EraseFifth() { mFifths = 0; }
    /// Leaves a degree out, 1 to 13. A third or a fifth may come back later.
    void Omit(int degree);

    [[nodiscard]] CSemitones Semitones() const;
    /// A sixth is raised, and there is no minor seventh beside it.
    [[nodiscard]] bool HasAugmentedSixth() const {
        return mSixthIsRaised && (mSevenths & Bit(10)) == 0;
    }

private:
    using TTones = std::uint32_t;  // bit n is the tone n semitones above the root

    static constexpr TTones Bit(int tone) { return TTones{1} << tone; }
    void AddMajorBehindNumber(int number);
    void StackFrom(int number, int seventh);

    int mThird = 4;
    TTones mFifths = Bit(7);
    TTones mSevenths = 0;
    /// Tones 2, 5 and 9 as ninth, eleventh and thirteenth of a stacked number.
    TTones mStack = 0;
    TTones mTones = 0;
    TTones mSus = 0;
    TTones mLeftOut = 0;
    int mFirstNumber = 0;
    bool mIsDiminished = false;
    bool mIsMajorMarked = false;
    bool mSeventhIsLeftOut = false;
    bool mSixthIsRaised = false;
};

}  // namespace brindle::ChordText
