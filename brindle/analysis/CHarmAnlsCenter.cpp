// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmAnlsCenter.h"

#include "brindle/analysis/CHarmAnlsSignKey.h"
#include "brindle/analysis/internal/NativeText.h"
#include "brindle/theory/KeyIntervals.h"

namespace brindle {

namespace {

/// Semitones from one key up to another, 0 to 11.
std::int32_t DistanceUp(int fromKeyNr, int toKeyNr) {
    return FoldIntoOctave(std::int64_t{toKeyNr} - fromKeyNr);
}

/// A chord without a root has no function, even if it has a bass.
void SetHarmFunction(CHarmAnlsChord& chord, int centerKeyNr) {
    chord.mRootDistToHarmCenter = -1;
    chord.mBassDistToHarmCenter = -1;
    if (chord.IsUndef()) return;
    chord.mRootDistToHarmCenter = DistanceUp(centerKeyNr, chord.mRootKeyEnh.mKeyNr);
    if (chord.mBassKeyEnh.IsUndef()) return;
    chord.mBassDistToHarmCenter = DistanceUp(centerKeyNr, chord.mBassKeyEnh.mKeyNr);
}

}  // namespace

void CHarmAnlsCenter::IfUndefFillWithHarmSignKey(const CHarmAnlsSignKey& signKey) {
    if (!IsUndef()) return;
    mHarmCenter = {signKey.mSignKey.mRootKeyEnh,
                   SemitonesFromSignKeyType(signKey.mSignKey.mSignKeyType)};
    if (mPosition == kPosUndef) mPosition = signKey.mPosition;
}

void CHarmAnlsCenter::AnalyseHarmFunctionsOfChords() {
    if (IsUndef()) return;
    for (CHarmAnlsChord& chord : mChords) SetHarmFunction(chord, mHarmCenter.mRootKeyEnh.mKeyNr);
}

void CHarmAnlsCenter::AppendJSONString(std::ostream& stream) const {
    PlainText::Write(stream, R"({"Probability":)");
    NativeText::WriteProbability(stream, mProbability);
    PlainText::Write(stream, R"(, "Position":)");
    PlainText::WriteFixed(stream, mPosition);
    PlainText::Write(stream, R"(, "HarmCenter":)");
    mHarmCenter.ToScaleLite().AppendJSONString(stream);
    PlainText::Write(stream, R"(, "HarmChords":)");
    PlainText::EndLine(stream);
    mChords.AppendJSONString(stream);
    PlainText::Write(stream, "}");
}

}  // namespace brindle
