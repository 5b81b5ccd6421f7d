// SPDX-License-Identifier: MIT
#include "brindle/present/TonalityName.h"

#include "brindle/platform/Localization.h"
#include "brindle/present/ShownNames.h"

#include <string_view>

namespace brindle {
namespace {

constexpr std::string_view kWordMajor = " major";
constexpr std::string_view kWordMinor = " minor";

bool HasAtMostOneSign(const CKeyEnh& root) {
    return root.mEnh == TEnh_b || root.mEnh == TEnh_n || root.mEnh == TEnh_s;
}

}  // namespace

std::string TonalityName(const CSignKeyLite& key) {
    if (key.IsUndef()) return {};
    CSignKeyLite named = key;
    if (!HasAtMostOneSign(named.mRootKeyEnh)) named.SetRootNoteEnhWithLeastSigns();
    std::string name = KeyName(named.mRootKeyEnh);
    name += key.mSignKeyType == TSignKeyType_Minor ? kWordMinor : kWordMajor;
    return LocalizedString(name);
}

std::vector<std::string> EnglishTonalityNames() {
    std::vector<std::string> names;
    for (const char letter : std::string_view("CDEFGAB")) {
        for (const std::string_view sign : {"b", "", "#"}) {
            for (const std::string_view type : {kWordMajor, kWordMinor}) {
                names.push_back(letter + std::string(sign) + std::string(type));
            }
        }
    }
    return names;
}

}  // namespace brindle
