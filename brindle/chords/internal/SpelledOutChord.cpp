// SPDX-License-Identifier: MIT
#include "brindle/chords/internal/SpelledOutChord.h"

namespace brindle {

CChordDegree CSpelledOutChord::DegreeOf(int tone) const {
    constexpr std::array<CChordDegree, 12> kTensions{{
        {1, 0},
        {9, -1},
        {9, 0},
        {9, 1},
        {3, 0},
        {11, 0},
        {11, 1},
        {5, 0},
        {13, -1},
        {13, 0},
        {7, -1},
        {7, 0},
    }};
    if (tone == mThird && tone == 3) return {3, -1};
    if (tone == mThird && tone == 5) return {4, 0};
    if (tone == mThird && tone == 2) return {2, 0};
    if (tone == mSeventh && tone == 9) return {6, 0};
    if (!mHasFifth && tone == 6) return {5, -1};
    if (!mHasFifth && tone == 8) return {5, 1};
    return kTensions[static_cast<std::size_t>(tone)];
}

std::string CSpelledOutChord::Head() const {
    std::string head = mThird == 3 ? "m" : "";
    if (mSeventh == 10) head += "7";
    if (mSeventh == 11) head += "maj7";
    if (mSeventh == 9) head += "6";
    if (mThird == 5) head += "sus4";
    if (mThird == 2) head += "sus2";
    return head;
}

}  // namespace brindle
