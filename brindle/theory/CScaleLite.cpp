// SPDX-License-Identifier: MIT
#include "brindle/theory/CScaleLite.h"

#include "brindle/platform/PlainText.h"
#include "brindle/theory/CKeyEnhUtil.h"
#include "brindle/theory/CScaleHeavy.h"
#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/ScaleStrings.h"

#include <ostream>

namespace brindle {

CScaleLite::CScaleLite(const CScaleHeavy& scale)
    : mRootKeyEnh(scale.RootKeyEnh()), mSemitones(scale.ToSemitones()) {}

CScaleLite::CScaleLite(std::string_view text, const CChordNamePrefs& prefs) {
    SetFromString(text, prefs);
}

CScaleLite::CScaleLite(const char* text, const CChordNamePrefs& prefs) {
    if (text != nullptr) SetFromString(text, prefs);
}

bool CScaleLite::HasKeyNr(int keyNr) const {
    if (IsUndef() || keyNr == kKeyNrUndef) return false;
    return mSemitones.HasIntvl(DistToRootKey(keyNr));
}

int CScaleLite::DistToRootKey(int keyNr) const {
    if (IsUndef()) return -1;
    return FoldIntoOctave(std::int64_t{keyNr} - mRootKeyEnh.mKeyNr);
}

bool CScaleLite::IsModalScale() const {
    return mSemitones.IsModalScale();
}

bool CScaleLite::IsModalScaleMajor() const {
    return mSemitones.IsModalScaleMajor();
}

bool CScaleLite::IsModalScaleMinor() const {
    return mSemitones.IsModalScaleMinor();
}

CScaleLite CScaleLite::ParallelModalScale() const {
    if (mSemitones == kSemitonesNaturalMinor) return {mRootKeyEnh + 3, kSemitonesMajor};
    if (mSemitones == kSemitonesMajor) return {mRootKeyEnh - 3, kSemitonesNaturalMinor};
    return *this;
}

CScaleLite CScaleLite::RelatedIonianModalScale() const {
    return {CKeyEnhUtil::RelatedIonianScaleRootKeyEnh(mRootKeyEnh, mSemitones), kSemitonesMajor};
}

void CScaleLite::SetFromString(std::string_view text, const CChordNamePrefs& prefs) {
    brindle::SetFromString(text, *this, prefs);
}

void CScaleLite::RotateRootToKeyEnh(CKeyEnh root) {
    mSemitones.RotateRootToIx(AbsKeyIntvlFromTo(mRootKeyEnh.mKeyNr, root.mKeyNr));
    mRootKeyEnh = root;
}

void CScaleLite::AppendJSONString(std::ostream& stream) const {
    PlainText::Write(stream, R"({"CKeyEnh":)");
    mRootKeyEnh.AppendJSONString(stream);
    stream << R"(,"Semitones":")";
    mSemitones.AppendJSONString(stream);
    stream << "\"}";
}

std::ostream& operator<<(std::ostream& stream, const CScaleLite& scale) {
    return stream << "CScaleLite: RootKeyEnh " << scale.mRootKeyEnh << ", Semitones "
                  << scale.mSemitones;
}

}  // namespace brindle
