// SPDX-License-Identifier: MIT
#include "brindle/theory/CSignKeyNoEnh.h"

#include "brindle/platform/DictionaryValues.h"
#include "brindle/platform/PlainText.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/CHarmCenterLite.h"
#include "brindle/theory/CScaleLite.h"
#include "brindle/theory/CSignKeyHeavy.h"
#include "brindle/theory/CSignKeyLite.h"
#include "brindle/theory/RelativeKeys.h"
#include "brindle/theory/SignKeyStrings.h"
#include "brindle/theory/Spelling.h"

#include <ostream>

namespace brindle {

CSignKeyNoEnh::CSignKeyNoEnh(const CSignKeyHeavy& signKey)
    : CSignKeyNoEnh(signKey.ToSignKeyNoEnh()) {}

CSignKeyNoEnh::CSignKeyNoEnh(std::string_view text) {
    SetFromString(text, *this, CurrentChordNamePrefs);
}

CSignKeyNoEnh::CSignKeyNoEnh(const char* text) {
    if (text != nullptr) SetFromString(text, *this, CurrentChordNamePrefs);
}

CSignKeyLite CSignKeyNoEnh::SignKey() const {
    const TEnh enh = MakeSensefulEnhForKeyNrMajorScaleRootWithLeastSigns(mRootKeyNr, TEnh_Undef);
    return {{mRootKeyNr, enh}, mSignKeyType};
}

CScaleLite CSignKeyNoEnh::Scale() const {
    return SignKey().Scale();
}

CSignKeyHeavy CSignKeyNoEnh::ToSignKeyHeavy() const {
    return SignKey().ToSignKeyHeavy();
}

CHarmCenterLite CSignKeyNoEnh::ToHarmCenter() const {
    return SignKey().ToHarmCenter();
}

int CSignKeyNoEnh::DistToSignKeyRoot(int keyNr) const {
    return SignKey().DistToSignKeyRoot(keyNr);
}

int CSignKeyNoEnh::KeyNrToSignKeyKeyNr(int keyNr) const {
    return RelativeKeyNr(mRootKeyNr, keyNr);
}

int CSignKeyNoEnh::SignKeyKeyNrToKeyNr(int signKeyKeyNr) const {
    return KeyNrFromRelativeKeyNr(mRootKeyNr, signKeyKeyNr);
}

int CSignKeyNoEnh::SignsCount() const {
    return SignKey().SignsCount();
}

int CSignKeyNoEnh::SignsCountAbs() const {
    return SignKey().SignsCountAbs();
}

CSignKeyNoEnh CSignKeyNoEnh::ParallelSignKey() const {
    return SignKey().ParallelSignKey().ToSignKeyNoEnh();
}

CSignKeyNoEnh CSignKeyNoEnh::IonicSignKey() const {
    return SignKey().IonicSignKey().ToSignKeyNoEnh();
}

std::string CSignKeyNoEnh::NameShort(const CChordNamePrefs& prefs) const {
    return SignKey().NameShort(prefs);
}

std::string CSignKeyNoEnh::NameLong(const CChordNamePrefs& prefs) const {
    return SignKey().NameLong(prefs);
}

void CSignKeyNoEnh::AppendJSONString(std::ostream& stream) const {
    PlainText::Write(stream, R"({"RootKeyNr":)");
    PlainText::WriteInteger(stream, mRootKeyNr);
    stream << R"(,"Type":")" << JSONWord(mSignKeyType) << "\"}";
}

CSignKeyNoEnh CSignKeyNoEnh::FromJSONDict(const nlohmann::json& dictionary) {
    const int keyNr = IntegerIn(dictionary, "RootKeyNr").value_or(kKeyNrUndef);
    const bool isKey = keyNr >= 0 && keyNr < 12;
    const std::string_view type = TextIn(dictionary, "Type").value_or("");
    return {isKey ? keyNr : kKeyNrUndef, SignKeyTypeFromString(type)};
}

std::ostream& operator<<(std::ostream& stream, const CSignKeyNoEnh& signKey) {
    return stream << "CSignKeyNoEnh: RootKeyNr " << signKey.mRootKeyNr << ", "
                  << signKey.mSignKeyType;
}

}  // namespace brindle
