// SPDX-License-Identifier: MIT
#include "brindle/theory/CSignKeyLite.h"

#include "brindle/platform/PlainText.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/CHarmCenterLite.h"
#include "brindle/theory/CScaleLite.h"
#include "brindle/theory/CSignKeyHeavy.h"
#include "brindle/theory/CSignKeyNoEnh.h"
#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/KeyNames.h"
#include "brindle/theory/RelativeKeys.h"
#include "brindle/theory/SignKeySigns.h"
#include "brindle/theory/SignKeyStrings.h"
#include "brindle/theory/Spelling.h"

#include <array>
#include <ostream>

namespace brindle {

namespace {

constexpr auto kUsualEnhs = std::to_array<TEnh>({TEnh_bb, TEnh_b, TEnh_n, TEnh_s, TEnh_ss});

}  // namespace

CSignKeyLite::CSignKeyLite(const CSignKeyHeavy& signKey) : CSignKeyLite(signKey.ToSignKeyLite()) {}

CSignKeyLite::CSignKeyLite(std::string_view text) {
    SetFromString(text, *this, CurrentChordNamePrefs);
}

CSignKeyLite::CSignKeyLite(const char* text) {
    if (text != nullptr) SetFromString(text, *this, CurrentChordNamePrefs);
}

CScaleLite CSignKeyLite::Scale() const {
    return {mRootKeyEnh, Semitones()};
}

CSignKeyHeavy CSignKeyLite::ToSignKeyHeavy() const {
    if (mRootKeyEnh.IsUndef()) return CSignKeyHeavy_Undef;
    return {mRootKeyEnh, FromSignKeyTypeInCaseOfUndefReturnMajor(mSignKeyType)};
}

CSignKeyNoEnh CSignKeyLite::ToSignKeyNoEnh() const {
    return {mRootKeyEnh.mKeyNr, mSignKeyType};
}

CHarmCenterLite CSignKeyLite::ToHarmCenter() const {
    return {mRootKeyEnh, Semitones()};
}

int CSignKeyLite::DistToSignKeyRoot(int keyNr) const {
    if (IsUndef()) return -1;
    return FoldIntoOctave(std::int64_t{keyNr} - mRootKeyEnh.mKeyNr);
}

int CSignKeyLite::KeyNrToSignKeyKeyNr(int keyNr) const {
    return RelativeKeyNr(mRootKeyEnh.mKeyNr, keyNr);
}

int CSignKeyLite::SignKeyKeyNrToKeyNr(int signKeyKeyNr) const {
    return KeyNrFromRelativeKeyNr(mRootKeyEnh.mKeyNr, signKeyKeyNr);
}

int CSignKeyLite::SignsCount() const {
    return SignsCountForSignKeyWithKeyEnhAndSignKeyType(mRootKeyEnh, mSignKeyType);
}

int CSignKeyLite::SignsCountAbs() const {
    return SignsCountAbsForSignKeyWithKeyEnhAndSignKeyType(mRootKeyEnh, mSignKeyType);
}

CSignKeyLite CSignKeyLite::ParallelSignKey() const {
    if (mSignKeyType == TSignKeyType_Major) return {mRootKeyEnh - 3, TSignKeyType_Minor};
    if (mSignKeyType == TSignKeyType_Minor) return {mRootKeyEnh + 3, TSignKeyType_Major};
    return *this;
}

CSignKeyLite CSignKeyLite::IonicSignKey() const {
    return mSignKeyType == TSignKeyType_Minor ? ParallelSignKey() : *this;
}

// One step of respelling does not reach every spelling: C sharp, the neighbour of B double sharp,
// has seven sharps, and D flat only five flats. So all spellings are compared, the neighbours
// first.
void CSignKeyLite::SetRootNoteEnhWithLeastSigns() {
    if (mRootKeyEnh.IsUndef()) return;
    const int keyNr = mRootKeyEnh.mKeyNr;
    const TEnh given = MakeSensefulEnhForKeyNrAssumingCMajor(keyNr, mRootKeyEnh.mEnh);
    mRootKeyEnh.mEnh = given;
    int fewestSigns = SignsCountAbs();
    const auto consider = [&](TEnh enh) {
        const int signs =
            SignsCountAbsForSignKeyWithKeyEnhAndSignKeyType({keyNr, enh}, mSignKeyType);
        if (signs >= fewestSigns) return;
        mRootKeyEnh.mEnh = enh;
        fewestSigns = signs;
    };
    consider(EnhShiftToFlats(keyNr, given));
    consider(EnhShiftToSharps(keyNr, given));
    for (const TEnh enh : kUsualEnhs) {
        if (IsSensefulEnhForKeyNr(keyNr, enh)) consider(enh);
    }
}

std::string CSignKeyLite::NameShort(const CChordNamePrefs& prefs) const {
    if (IsUndef()) return "Undef";
    const std::string root = KeyNrAndEnhToName(mRootKeyEnh.mKeyNr, mRootKeyEnh.mEnh, prefs);
    return mSignKeyType == TSignKeyType_Minor ? root + "m" : root;
}

std::string CSignKeyLite::NameLong(const CChordNamePrefs& prefs) const {
    if (IsUndef()) return "Undef";
    const std::string root = KeyNrAndEnhToName(mRootKeyEnh.mKeyNr, mRootKeyEnh.mEnh, prefs);
    return root + (mSignKeyType == TSignKeyType_Minor ? " Minor" : " Major");
}

void CSignKeyLite::AppendJSONString(std::ostream& stream) const {
    PlainText::Write(stream, R"({"CKeyEnh":)");
    mRootKeyEnh.AppendJSONString(stream);
    stream << R"(,"Type":")" << JSONWord(mSignKeyType) << "\"}";
}

std::ostream& operator<<(std::ostream& stream, const CSignKeyLite& signKey) {
    return stream << "CSignKeyLite: RootKeyEnh " << signKey.mRootKeyEnh << ", "
                  << signKey.mSignKeyType;
}

}  // namespace brindle
