// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmAnlsChord.h"

#include "brindle/analysis/CSemitonesMatch.h"
#include "brindle/platform/PlainText.h"

#include <ostream>

namespace brindle {

namespace {

template <class CChord>
void WriteInBraces(std::ostream& stream, const CChord& chord) {
    PlainText::Write(stream, "{");
    chord.AppendJSONClassSubstring(stream);
    PlainText::Write(stream, "}");
}

}  // namespace

bool CHarmAnlsChord::EqualWithoutEnh(const CHarmAnlsChord& other) const {
    return mRootKeyEnh.mKeyNr == other.mRootKeyEnh.mKeyNr &&
           mBassKeyEnh.mKeyNr == other.mBassKeyEnh.mKeyNr && EqualExceptRootAndBass(other);
}

bool CHarmAnlsChord::EqualExceptRootAndBass(const CHarmAnlsChord& other) const {
    return mRootDistToHarmCenter == other.mRootDistToHarmCenter &&
           mBassDistToHarmCenter == other.mBassDistToHarmCenter && mSemitones == other.mSemitones;
}

void CHarmAnlsChord::AppendJSONClassSubstring(std::ostream& stream) const {
    CChordLite::AppendJSONClassSubstring(stream);
    PlainText::Write(stream, R"(, "RootDistToHarmCenter":)");
    PlainText::WriteInteger(stream, mRootDistToHarmCenter, 2);
    PlainText::Write(stream, R"(, "BassDistToHarmCenter":)");
    PlainText::WriteInteger(stream, mBassDistToHarmCenter, 2);
}

void CHarmAnlsChord::AppendJSONString(std::ostream& stream) const {
    WriteInBraces(stream, *this);
}

void CHarmAnlsChordWithPos::AppendJSONClassSubstring(std::ostream& stream) const {
    PlainText::Write(stream, R"("Position":)");
    PlainText::WriteFixed(stream, mPosition);
    PlainText::Write(stream, ", ");
    CHarmAnlsChord::AppendJSONClassSubstring(stream);
}

void CHarmAnlsChordWithPos::AppendJSONString(std::ostream& stream) const {
    WriteInBraces(stream, *this);
}

void CHarmAnlsChordWithLength::SimplifyChord() {
    // The two patterns exclude each other. Kept: a chord without a fifth becomes major.
    mSemitones =
        ChordPattern::Minor.Matches(mSemitones) ? CSemitones{0, 3, 7} : CSemitones{0, 4, 7};
    mBassDistToHarmCenter = -1;
    mBassKeyEnh = CKeyEnh_Undef;
    mLength = 4.0;
}

void CHarmAnlsChordWithLength::AppendJSONClassSubstring(std::ostream& stream) const {
    PlainText::Write(stream, R"("Length":)");
    PlainText::WriteFixed(stream, mLength);
    PlainText::Write(stream, ", ");
    CHarmAnlsChord::AppendJSONClassSubstring(stream);
}

void CHarmAnlsChordWithLength::AppendJSONString(std::ostream& stream) const {
    WriteInBraces(stream, *this);
}

}  // namespace brindle
