// SPDX-License-Identifier: MIT
#include "brindle/musicxml/CMuxmlSignKey.h"

#include "brindle/musicxml/internal/ReadMuxml.h"
#include "brindle/theory/CSignKeyHeavy.h"

namespace brindle {

namespace {

TSignKeyTypeNoUndef TypeOf(TMuxmlEnum_SignKeyMode mode) {
    switch (mode) {
        case TMuxmlEnum_SignKeyMode_Minor:
        case TMuxmlEnum_SignKeyMode_Dorian:
        case TMuxmlEnum_SignKeyMode_Phrygian:
        case TMuxmlEnum_SignKeyMode_Aeolian:
        case TMuxmlEnum_SignKeyMode_Locrian:
            return TSignKeyTypeNoUndef_Minor;
        case TMuxmlEnum_SignKeyMode_Major:
        case TMuxmlEnum_SignKeyMode_Lydian:
        case TMuxmlEnum_SignKeyMode_Mixolydian:
        case TMuxmlEnum_SignKeyMode_Ionian:
        case TMuxmlEnum_SignKeyMode_None:
            break;
    }
    return TSignKeyTypeNoUndef_Major;
}

}  // namespace

void CMuxmlSignKey::ReadFromAttributes(const CMuxmlAttributes& attributes) {
    CMuxmlXYColor::ReadFromAttributes(attributes);
    CMuxmlFont::ReadFromAttributes(attributes);
    muxml::ReadAttribute(attributes, "number", mStaffNumber);
    muxml::ReadAttribute(attributes, "print-object", mPrintObject);
}

CSignKeyHeavy CMuxmlSignKey::ConvertToCSignKeyTransposedPitch() const {
    CSignKeyHeavy signKey;
    signKey.SetFromSignsCountAndType(mFifths, TypeOf(mMode));
    return signKey;
}

CSignKeyHeavy CMuxmlSignKey::ConvertToCSignKeySoundingPitch() const {
    CSignKeyHeavy signKey = ConvertToCSignKeyTransposedPitch();
    CNote root = signKey.RootNote();
    const float moved = static_cast<float>(root.KeyNr()) + mPartTransposeAtSignKey.mChromatic;
    const std::int64_t octaveBase = root.mNoteNr / 12 * 12;
    root.SetNoteNr(octaveBase + FoldIntoOctave(muxml::TruncatedToInteger(moved)));
    if (root.mEnh == TEnh_Undef) {
        signKey.SetRootNote(root);
        return signKey;
    }
    root.SetNoteNrAndMakeSensefulEnhAssumingCMajor(root.mNoteNr);
    signKey.SetRootNote(root);
    signKey.CalcEnh();
    signKey.SetRootNoteEnhWithLeastSigns();
    return signKey;
}

}  // namespace brindle
