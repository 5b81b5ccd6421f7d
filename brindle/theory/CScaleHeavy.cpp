// SPDX-License-Identifier: MIT
#include "brindle/theory/CScaleHeavy.h"

#include "brindle/platform/PlainText.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/CKeyEnhUtil.h"
#include "brindle/theory/Spelling.h"

#include <algorithm>
#include <ostream>

namespace brindle {

CScaleHeavy::CScaleHeavy(const CKeyEnh& root, TScaleType type) {
    SetFromRootKeyEnhAndScaleType_ResetCustomScaleData(root, type);
}

CScaleHeavy::CScaleHeavy(const CNote& root, TScaleType type) : CScaleHeavy(root.KeyEnh(), type) {}

CScaleHeavy::CScaleHeavy(int rootKeyNr, TScaleType type)
    : CScaleHeavy(CKeyEnh{rootKeyNr, MakeSensefulEnhForKeyNrMajorScaleRootWithLeastSigns(
                                         rootKeyNr, TEnh_Undef)},
                  type) {}

CScaleHeavy::CScaleHeavy(const CKeyEnh& root, CSemitones semitones) {
    SetFromRootKeyEnhAndCustomScaleSemitones_ResetCustomScaleData(root, semitones);
}

CScaleHeavy::CScaleHeavy(const CKeyEnh& root, const CIntvlSet& intvls) {
    SetFromRootKeyEnhAndCustomScaleIntvlSet_ResetCustomScaleData(root, intvls);
}

CScaleHeavy::CScaleHeavy(const CNote& root, const CIntvlSet& intvls)
    : CScaleHeavy(root.KeyEnh(), intvls) {}

CScaleHeavy::CScaleHeavy(const CKeyEnh& root, const CMySet<int>& keyNrs) {
    SetFromRootKeyEnhAndCustomScaleKeyNrSet_ResetCustomScaleData(root, keyNrs);
}

CScaleHeavy::CScaleHeavy(const CNote& root, const CMySet<int>& keyNrs)
    : CScaleHeavy(root.KeyEnh(), keyNrs) {}

void CScaleHeavy::SetFromRootKeyEnhAndScaleType_ResetCustomScaleData(const CKeyEnh& root,
                                                                     TScaleType type) {
    InitCustomScaleData();
    SetFromRootKeyEnhAndScaleType_DontResetCustomScaleData(root, type);
}

void CScaleHeavy::SetFromRootKeyEnhAndScaleType_DontResetCustomScaleData(const CKeyEnh& root,
                                                                         TScaleType type) {
    SetScaleTypeWithoutCalcEnh(type);
    SetRootKeyEnh(root);
}

void CScaleHeavy::SetFromRootKeyEnhAndCustomScaleSemitones_ResetCustomScaleData(
    const CKeyEnh& root, CSemitones semitones) {
    SetFromRootKeyEnhAndCustomScaleIntvlSet_ResetCustomScaleData(root, semitones.IntvlSet());
}

void CScaleHeavy::SetFromRootKeyEnhAndCustomScaleIntvlSet_ResetCustomScaleData(
    const CKeyEnh& root, const CIntvlSet& intvls) {
    SetRootKeyEnhWithoutCalcEnh(root);
    SetCustomScaleRootOffsetIntvlSet_ResetCustomScaleData(intvls);
    SetScaleType(FindScaleTypeForCustomScale());
}

void CScaleHeavy::SetFromRootKeyEnhAndCustomScaleKeyNrSet_ResetCustomScaleData(
    const CKeyEnh& root, const CMySet<int>& keyNrs) {
    SetFromRootKeyEnhAndCustomScaleIntvlSet_ResetCustomScaleData(
        root, ConvertKeyNrSetToIntvlSet(keyNrs, root.mKeyNr));
}

void CScaleHeavy::SetRootKeyEnh(const CKeyEnh& root) {
    SetRootKeyEnhWithoutCalcEnh(root);
    CalcEnh();
}

void CScaleHeavy::SetRootKeyEnhWithoutCalcEnh(const CKeyEnh& root) {
    mRootNote.SetEnhAndDontMakeSenseful(root.mEnh);
    mRootNote.SetNoteNrAndMakeSensefulEnhAssumingCMajor(root.IsUndef() ? kNoteNrUndef
                                                                       : root.mKeyNr);
}

void CScaleHeavy::SetRootNote(const CNote& root) {
    mRootNote = root;
    CalcEnh();
}

void CScaleHeavy::SetScaleType(TScaleType type) {
    SetScaleTypeWithoutCalcEnh(type);
    CalcEnh();
}

void CScaleHeavy::SetScaleTypeWithoutCalcEnh(TScaleType type) {
    mScaleType = type;
    mScaleRow = type == st_custom ? kOwnRow : static_cast<std::int8_t>(ScaleIndexFromType(type));
}

void CScaleHeavy::SetCustomScaleRootOffsetIntvlSet_ResetCustomScaleData(const CIntvlSet& intvls) {
    InitCustomScaleData();
    SetCustomScaleRootOffsetIntvlSet_DontResetCustomScaleData(intvls);
}

void CScaleHeavy::SetCustomScaleRootOffsetIntvlSet_DontResetCustomScaleData(
    const CIntvlSet& intvls) {
    auto& offsets = mCustomScaleData.mDegreeToRootOffsetIntvl;
    offsets.fill(0);
    std::copy_n(intvls.begin(), std::min(intvls.size(), offsets.size()), offsets.begin());
    mCustomScaleData.mDegreesPerOctave = static_cast<int>(intvls.size());
}

CKeyEnh CScaleHeavy::RelatedIonianScaleRootKeyEnh() const {
    return CKeyEnhUtil::RelatedIonianScaleRootKeyEnh(RootKeyEnh(), mScaleType);
}

CScaleHeavy CScaleHeavy::RelatedIonianScale() const {
    return {RelatedIonianScaleRootKeyEnh(), st_maj};
}

std::string CScaleHeavy::FullName(const CChordNamePrefs& prefs) const {
    std::string name = mRootNote.KeyName(prefs);
    name += ' ';
    name += ScaleRow().mName;
    return name;
}

void CScaleHeavy::AppendJSONString(std::ostream& stream) const {
    PlainText::Write(stream, R"({"root":)");
    mRootNote.AppendJSONString(stream);
    stream << R"(,"type":")" << ToJSONString(mScaleType) << "\"}";
}

bool operator==(const CScaleHeavy& a, const CScaleHeavy& b) {
    if (a.mRootNote != b.mRootNote || a.mScaleType != b.mScaleType) return false;
    if (a.mScaleType != st_custom) return true;
    const CScaleRow& rowA = a.ScaleRow();
    const CScaleRow& rowB = b.ScaleRow();
    return rowA.mDegreesPerOctave == rowB.mDegreesPerOctave &&
           rowA.mDegreeToRootOffsetIntvl == rowB.mDegreeToRootOffsetIntvl;
}

std::ostream& operator<<(std::ostream& stream, const CScaleHeavy& scale) {
    return stream << "CScaleHeavy: RootNote " << scale.RootNote() << ", ScaleType "
                  << scale.ScaleType();
}

}  // namespace brindle
