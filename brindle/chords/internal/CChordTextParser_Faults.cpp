// SPDX-License-Identifier: MIT
#include "brindle/chords/internal/CChordTextParser.h"

namespace brindle::ChordText {

/// At a digit that begins no degree, that digit is the fault; otherwise the word before it is.
bool CChordTextParser::FailNumberOr(TFault fault, std::size_t pos, std::size_t length) {
    return IsDigit(mScan.Peek()) ? Fail(TFault::NoDegree) : Fail(fault, pos, length);
}

bool CChordTextParser::FailAtOption() {
    if (mScan.LastNonBlank() == '/') return FailBehindSlash();
    const bool isApart = std::string_view(" (,").find(mScan.Last()) != std::string_view::npos;
    if (isApart && IsCapitalNote(mScan.Peek())) return Fail(TFault::SecondChord);
    return Fail(TFault::NotUnderstood);
}

bool CChordTextParser::FailBehindSlash() {
    const std::size_t pos = mScan.mPos;
    if (!IsLetter(mScan.Peek())) return Fail(TFault::NotUnderstood);
    CTextScan scan = mScan;
    if (!TakeNote(scan, mPrefs)) return Fail(TFault::NoBassNote);
    const bool isApart = scan.Peek() == ' ';
    scan.SkipBlanks();
    if (scan.AtEnd() || scan.Peek() == '/') return Fail(TFault::TwoBassNotes, pos);
    if (!isApart) return Fail(TFault::NoBassNote, pos);
    // A whole bass, and then something else: `C/E G`.
    return Fail(IsCapitalNote(scan.Peek()) ? TFault::SecondChord : TFault::NotUnderstood,
                scan.mPos);
}

}  // namespace brindle::ChordText
