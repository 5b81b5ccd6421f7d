// SPDX-License-Identifier: MIT
#include "brindle/theory/CSignKeyHeavy.h"

#include "brindle/platform/DictionaryValues.h"
#include "brindle/platform/PlainText.h"
#include "brindle/theory/CHarmCenterLite.h"
#include "brindle/theory/CSignKeyLite.h"
#include "brindle/theory/CSignKeyNoEnh.h"
#include "brindle/theory/SignKeyStrings.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <nlohmann/json.hpp>
#include <ostream>

namespace brindle {

namespace {

constexpr TScaleType ScaleTypeOf(TSignKeyTypeNoUndef type) {
    return type == TSignKeyTypeNoUndef_Minor ? st_min : st_maj;
}

/// The key that lies `fifths` fifths up from `key`, down if negative, each step spelled by adding
/// to the one before. The walk soon runs in a circle, so any count ends.
CKeyEnh WalkFifths(CKeyEnh key, int fifths) {
    constexpr std::size_t kSpelledKeys = 12 * 8;
    std::array<CKeyEnh, kSpelledKeys + 1> visited;
    const int fifth = fifths < 0 ? -7 : 7;
    const auto steps = static_cast<std::size_t>(fifths < 0 ? -std::int64_t{fifths} : fifths);
    for (std::size_t step = 0;; ++step, key.AddToThis(fifth)) {
        if (step == steps) return key;
        const auto end = visited.begin() + static_cast<std::ptrdiff_t>(step);
        const auto before = std::find(visited.begin(), end, key);
        if (before != end) {
            const auto circle = static_cast<std::size_t>(end - before);
            return *(before + static_cast<std::ptrdiff_t>((steps - step) % circle));
        }
        *end = key;
    }
}

}  // namespace

CSignKeyHeavy::CSignKeyHeavy(const CKeyEnh& root, TSignKeyTypeNoUndef type)
    : CScaleHeavy(root, ScaleTypeOf(type)) {}

CSignKeyHeavy::CSignKeyHeavy(int rootKeyNr, TSignKeyTypeNoUndef type)
    : CScaleHeavy(rootKeyNr, ScaleTypeOf(type)) {}

CSignKeyHeavy::CSignKeyHeavy(const CSignKeyNoEnh& signKey)
    : CSignKeyHeavy(signKey.ToSignKeyHeavy()) {}

CSignKeyHeavy::CSignKeyHeavy(std::string_view text, const CChordNamePrefs& prefs) {
    SetFromString(text, prefs);
}

TSignKeyType CSignKeyHeavy::SignKeyType() const {
    return ScaleType() == st_Undef ? TSignKeyType_Undef : SignKeyTypeFromScaleType(ScaleType());
}

bool CSignKeyHeavy::IsUndef() const {
    return ToSignKeyLite().IsUndef();
}

CSignKeyLite CSignKeyHeavy::ToSignKeyLite() const {
    return {RootKeyEnh(), SignKeyType()};
}

CSignKeyNoEnh CSignKeyHeavy::ToSignKeyNoEnh() const {
    return ToSignKeyLite().ToSignKeyNoEnh();
}

CHarmCenterLite CSignKeyHeavy::ToHarmCenter() const {
    return ToSignKeyLite().ToHarmCenter();
}

int CSignKeyHeavy::DistToSignKeyRoot(int keyNr) const {
    return ToSignKeyLite().DistToSignKeyRoot(keyNr);
}

int CSignKeyHeavy::KeyNrToSignKeyKeyNr(int keyNr) const {
    return ToSignKeyLite().KeyNrToSignKeyKeyNr(keyNr);
}

int CSignKeyHeavy::SignKeyKeyNrToKeyNr(int signKeyKeyNr) const {
    return ToSignKeyLite().SignKeyKeyNrToKeyNr(signKeyKeyNr);
}

CSignKeyHeavy CSignKeyHeavy::ParallelSignKey() const {
    return ToSignKeyLite().ParallelSignKey().ToSignKeyHeavy();
}

CSignKeyHeavy CSignKeyHeavy::IonicSignKey() const {
    return ToSignKeyLite().IonicSignKey().ToSignKeyHeavy();
}

void CSignKeyHeavy::SetRootKeyEnhAndSignKeyType(const CKeyEnh& root, TSignKeyTypeNoUndef type) {
    *this = CSignKeyHeavy(root, type);
}

void CSignKeyHeavy::SetSignKeyType(TSignKeyTypeNoUndef type) {
    SetScaleType(ScaleTypeOf(type));
}

void CSignKeyHeavy::SetRootNoteEnhWithLeastSigns() {
    CSignKeyLite signKey = ToSignKeyLite();
    signKey.SetRootNoteEnhWithLeastSigns();
    CNote root = RootNote();
    root.mEnh = signKey.mRootKeyEnh.mEnh;
    SetRootNote(root);
}

void CSignKeyHeavy::SetFromSignsCountAndType(int signs, TSignKeyTypeNoUndef type) {
    const CKeyEnh withoutSigns = type == TSignKeyTypeNoUndef_Minor ? CKeyEnh_A : CKeyEnh_C;
    SetRootKeyEnhAndSignKeyType(WalkFifths(withoutSigns, signs), type);
}

void CSignKeyHeavy::SetFromString(std::string_view text, const CChordNamePrefs& prefs) {
    brindle::SetFromString(text, *this, prefs);
}

std::string CSignKeyHeavy::NameShort(const CChordNamePrefs& prefs) const {
    return ToSignKeyLite().NameShort(prefs);
}

std::string CSignKeyHeavy::NameLong(const CChordNamePrefs& prefs) const {
    return ToSignKeyLite().NameLong(prefs);
}

void CSignKeyHeavy::AppendJSONString(std::ostream& stream) const {
    PlainText::Write(stream, R"({"root":)");
    RootNote().AppendJSONString(stream);
    stream << R"(,"type":")" << JSONWord(SignKeyType()) << "\"}";
}

CSignKeyHeavy CSignKeyHeavy::FromJSONDict(const nlohmann::json& dictionary) {
    const auto type = TextIn(dictionary, "type").value_or("");
    CSignKeyHeavy signKey(CKeyEnh_Undef, SignKeyTypeNoUndefFromString(type));
    const auto root = dictionary.is_object() ? dictionary.find("root") : dictionary.end();
    if (root == dictionary.end()) return signKey;
    const auto noteNr = IntegerIn(*root, "nr").value_or(kNoteNrUndef);
    const TEnh enh = EnhFromStdString(TextIn(*root, "enh").value_or(""));
    signKey.SetRootNote(CNote(noteNr, enh));
    return signKey;
}

std::ostream& operator<<(std::ostream& stream, const CSignKeyHeavy& signKey) {
    const CSignKeyLite lite = signKey.ToSignKeyLite();
    return stream << "CSignKeyHeavy: RootKeyEnh " << lite.mRootKeyEnh << ", " << lite.mSignKeyType;
}

}  // namespace brindle
