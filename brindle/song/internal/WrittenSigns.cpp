// SPDX-License-Identifier: MIT
#include "brindle/song/internal/WrittenSigns.h"

#include "brindle/musicxml/internal/PlayMarks.h"

namespace brindle {
namespace {

std::string JumpWords(const CPlayMarks& marks) {
    std::string words = marks.mDaCapo ? "D.C." : "D.S.";
    if (marks.mAlFine) words += " al Fine";
    if (marks.mAlCoda) words += " al Coda";
    return words;
}

void AddWords(std::string_view more, std::string& words) {
    if (!words.empty()) words += ", ";
    words += more;
}

}  // namespace

void SetWritten(std::size_t written, const CPlayMarks& marks, CSongBar& bar) {
    bar.mWritten = written;
    if (marks.mSegno.mIsSet) bar.mSign = TSongSign_Segno;
    if (marks.mCoda.mIsSet) bar.mSign = TSongSign_Coda;
    bar.mEndsEnding = marks.mEndingStops;
    if (marks.mToCoda.mIsSet) AddWords("To Coda", bar.mWords);
    if (marks.mFine) AddWords("Fine", bar.mWords);
    if (marks.Jumps()) AddWords(JumpWords(marks), bar.mWords);
}

}  // namespace brindle
