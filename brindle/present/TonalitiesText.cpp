// SPDX-License-Identifier: MIT
#include "brindle/present/TonalitiesText.h"

#include "brindle/present/JsonValues.h"
#include "brindle/present/ShownNames.h"
#include "brindle/theory/CScaleHeavy.h"
#include "brindle/theory/CSignKeyHeavy.h"
#include "brindle/theory/SignKeyCode.h"

#include <fmt/format.h>

#include <nlohmann/json.hpp>

namespace brindle {
namespace {

// 15 stands for a key that has no code, G# major for instance.
bool HasSignKeyCode(unsigned char code) {
    return code != kSignKeyCodeUndef;
}

std::vector<CKeyEnh> NotesOfTonality(const CSignKeyLite& key) {
    return KeysOf(CScaleHeavy(key.mRootKeyEnh, key.Semitones()));
}

Json TonalityToJson(const CSignKeyLite& key) {
    const CSignKeyLite relative = key.ParallelSignKey();
    const unsigned char code = ToSignKeyInEv(key.mRootKeyEnh, key.mSignKeyType);
    return {{"Name", key.NameLong(NamePrefs())},
            {"CKeyEnh", KeyEnhToJson(key.mRootKeyEnh)},
            {"Type", JSONWord(key.mSignKeyType)},
            {"SignsCount", key.SignsCount()},
            {"Notes", KeyEnhsToJson(NotesOfTonality(key))},
            {"Relative",
             {{"Name", relative.NameLong(NamePrefs())},
              {"CKeyEnh", KeyEnhToJson(relative.mRootKeyEnh)},
              {"Type", JSONWord(relative.mSignKeyType)}}},
            {"Code", HasSignKeyCode(code) ? Json(code) : Json(nullptr)}};
}

std::string TonalityText(const CSignKeyLite& key, const CPaint& paint) {
    const unsigned char code = ToSignKeyInEv(key.mRootKeyEnh, key.mSignKeyType);
    return fmt::format(
        "{}\n"
        "  signs     {}\n"
        "  notes     {}\n"
        "  relative  {}\n"
        "  code      {}\n",
        paint.Strong(KeyInWords(key)), SignsText(key.SignsCount()), NotesText(NotesOfTonality(key)),
        KeyInWords(key.ParallelSignKey()), HasSignKeyCode(code) ? fmt::format("{}", code) : "none");
}

}  // namespace

std::string TonalitiesText(std::span<const CSignKeyLite> keys, const CPaint& paint) {
    std::string text;
    for (const CSignKeyLite& key : keys) {
        text += (text.empty() ? "" : "\n") + TonalityText(key, paint);
    }
    return text;
}

std::string TonalitiesJson(std::span<const CSignKeyLite> keys) {
    Json list = Json::array();
    for (const CSignKeyLite& key : keys) list.push_back(TonalityToJson(key));
    return JsonText({{"Keys", list}});
}

}  // namespace brindle
