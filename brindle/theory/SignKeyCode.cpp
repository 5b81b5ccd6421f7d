// SPDX-License-Identifier: MIT
#include "brindle/theory/SignKeyCode.h"

#include "brindle/theory/Spelling.h"

#include <algorithm>
#include <array>
#include <cstddef>

namespace brindle {

namespace {

// The sign key of each code from 0 on, each a fifth above the one before.
// clang-format off
constexpr auto kSignKeyOfCode = std::to_array<CSignKeyLite>({
    // code - 7 is the number of sharps
    {CKeyEnh_Cb,  TSignKeyType_Major},
    {CKeyEnh_Gb,  TSignKeyType_Major},
    {CKeyEnh_Db,  TSignKeyType_Major},
    {CKeyEnh_Ab,  TSignKeyType_Major},
    {CKeyEnh_Eb,  TSignKeyType_Major},
    {CKeyEnh_Bb,  TSignKeyType_Major},
    {CKeyEnh_F,   TSignKeyType_Major},
    {CKeyEnh_C,   TSignKeyType_Major},
    {CKeyEnh_G,   TSignKeyType_Major},
    {CKeyEnh_D,   TSignKeyType_Major},
    {CKeyEnh_A,   TSignKeyType_Major},
    {CKeyEnh_E,   TSignKeyType_Major},
    {CKeyEnh_B,   TSignKeyType_Major},
    {CKeyEnh_Fis, TSignKeyType_Major},
    {CKeyEnh_Cis, TSignKeyType_Major},

    {CKeyEnh_Undef, TSignKeyType_Undef},

    // code - 23 is the number of sharps
    {CKeyEnh_Ab,  TSignKeyType_Minor},
    {CKeyEnh_Eb,  TSignKeyType_Minor},
    {CKeyEnh_Bb,  TSignKeyType_Minor},
    {CKeyEnh_F,   TSignKeyType_Minor},
    {CKeyEnh_C,   TSignKeyType_Minor},
    {CKeyEnh_G,   TSignKeyType_Minor},
    {CKeyEnh_D,   TSignKeyType_Minor},
    {CKeyEnh_A,   TSignKeyType_Minor},
    {CKeyEnh_E,   TSignKeyType_Minor},
    {CKeyEnh_B,   TSignKeyType_Minor},
    {CKeyEnh_Fis, TSignKeyType_Minor},
    {CKeyEnh_Cis, TSignKeyType_Minor},
    {CKeyEnh_Gis, TSignKeyType_Minor},
    {CKeyEnh_Dis, TSignKeyType_Minor},
    {CKeyEnh_Ais, TSignKeyType_Minor},
});
// clang-format on

static_assert(kSignKeyOfCode.size() == 31);
static_assert(kSignKeyOfCode[kSignKeyCodeUndef] == CSignKeyLite_Undef);

/// The code of exactly this sign key, spelling included; 15 if it has none.
unsigned char CodeOf(const CSignKeyLite& signKey) {
    const auto row = std::find(kSignKeyOfCode.begin(), kSignKeyOfCode.end(), signKey);
    if (row == kSignKeyOfCode.end()) return kSignKeyCodeUndef;
    return static_cast<unsigned char>(row - kSignKeyOfCode.begin());
}

CSignKeyLite WithLeastSigns(CSignKeyLite signKey) {
    signKey.SetRootNoteEnhWithLeastSigns();
    return signKey;
}

/// Respells a key that has no code, such as G sharp major.
CSignKeyLite _ToSignKeyInEvDeprecated_TryToCorrectMissingEnh(const CSignKeyLite& signKey) {
    return WithLeastSigns(signKey);
}

}  // namespace

TSignKeyType ToSignKeyType(unsigned char code) {
    constexpr unsigned char kMinorBit = 0x10;
    if (code == kSignKeyCodeUndef) return TSignKeyType_Undef;
    return (code & kMinorBit) != 0 ? TSignKeyType_Minor : TSignKeyType_Major;
}

CSemitones ToSemitones(unsigned char code) {
    return SemitonesFromSignKeyType(ToSignKeyType(code));
}

std::pair<CKeyEnh, TSignKeyType> ToRootKeyEnhAndSignKeyType(unsigned char code) {
    if (code >= kSignKeyOfCode.size()) return {CKeyEnh_Undef, TSignKeyType_Undef};
    return {kSignKeyOfCode[code].mRootKeyEnh, kSignKeyOfCode[code].mSignKeyType};
}

std::pair<CKeyEnh, CSemitones> ToRootKeyEnhAndSemitones(unsigned char code) {
    const auto [root, type] = ToRootKeyEnhAndSignKeyType(code);
    return {root, SemitonesFromSignKeyType(type)};
}

unsigned char ToSignKeyInEv(CKeyEnh root, TSignKeyType type) {
    CSignKeyLite signKey(root, type);
    if (root.mEnh == TEnh_Undef) signKey.SetRootNoteEnhWithLeastSigns();
    if (!signKey.mRootKeyEnh.HasSensefulEnh()) signKey.SetRootNoteEnhWithLeastSigns();
    return CodeOf(signKey);
}

unsigned char ToSignKeyInEv(CKeyEnh root, CSemitones semitones) {
    return ToSignKeyInEv(root, SignKeyTypeFromSemitones(semitones));
}

unsigned char _ToSignKeyInEv_GuessEnhWithLeastSignes(CKeyEnh root, TSignKeyType type) {
    return CodeOf(WithLeastSigns({root, type}));
}

unsigned char ToSignKeyInEvDeprecated(const CSignKeyLite& signKey) {
    constexpr unsigned char kUndef = 255;
    if (signKey.IsUndef()) return kUndef;
    const unsigned char code = ToSignKeyInEv(signKey.mRootKeyEnh, signKey.mSignKeyType);
    if (code != kSignKeyCodeUndef) return code;
    return CodeOf(_ToSignKeyInEvDeprecated_TryToCorrectMissingEnh(signKey));
}

const std::vector<CSignKeyLite>& CSignKeyLite_AllSignKeysPossibleInThornbank() {
    static const std::vector<CSignKeyLite> signKeys = [] {
        std::vector<CSignKeyLite> defined;
        std::copy_if(kSignKeyOfCode.begin(), kSignKeyOfCode.end(), std::back_inserter(defined),
                     [](const CSignKeyLite& signKey) { return !signKey.IsUndef(); });
        return defined;
    }();
    return signKeys;
}

}  // namespace brindle
