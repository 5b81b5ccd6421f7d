// SPDX-License-Identifier: MIT
#include "brindle/present/ScalesText.h"

#include "brindle/present/JsonValues.h"
#include "brindle/present/ShownNames.h"
#include "brindle/theory/CScaleLite.h"

#include <fmt/format.h>

#include <nlohmann/json.hpp>
#include <sstream>

namespace brindle {
namespace {

std::string ScaleTypeName(TScaleType type) {
    std::ostringstream name;
    name << type;
    return name.str();
}

// In the language of the user; empty for a scale without a type.
std::string LocalizedScaleName(TScaleType type) {
    return CScaleHeavy::LocalizedNameForScaleType(type).value_or(std::string());
}

std::string NameWithRoot(const CScaleHeavy& scale) {
    const bool isCustom = scale.ScaleType() == st_custom;
    return fmt::format("{} {}", KeyName(scale.RootKeyEnh()),
                       isCustom ? "Custom" : scale.ScaleRow().mName);
}

Json ScaleToJson(const CScaleHeavy& scale) {
    const CSemitones semitones = CScaleLite(scale).mSemitones;
    return {{"Name", NameWithRoot(scale)},
            {"CKeyEnh", KeyEnhToJson(scale.RootKeyEnh())},
            {"Type", ScaleTypeName(scale.ScaleType())},
            {"TypeName", LocalizedScaleName(scale.ScaleType())},
            {"Semitones", semitones.Mask()},
            {"Intervals", IntervalsToJson(semitones)},
            {"Notes", KeyEnhsToJson(KeysOf(scale))},
            {"SignsCount", scale.SignsCount()}};
}

std::string ScaleText(const CScaleHeavy& scale, const CPaint& paint) {
    const CSemitones semitones = CScaleLite(scale).mSemitones;
    return fmt::format(
        "{}\n"
        "  notes      {}\n"
        "  semitones  {}\n"
        "  mask       {}\n"
        "  type       {} ({})\n"
        "  signs      {}\n",
        paint.Strong(NameWithRoot(scale)), NotesText(KeysOf(scale)), SemitonesText(semitones),
        semitones.Mask(), LocalizedScaleName(scale.ScaleType()), ScaleTypeName(scale.ScaleType()),
        SignsText(scale.SignsCount()));
}

}  // namespace

std::string ScalesText(std::span<const CScaleHeavy> scales, const CPaint& paint) {
    std::string text;
    for (const CScaleHeavy& scale : scales) {
        text += (text.empty() ? "" : "\n") + ScaleText(scale, paint);
    }
    return text;
}

std::string ScalesJson(std::span<const CScaleHeavy> scales) {
    Json list = Json::array();
    for (const CScaleHeavy& scale : scales) list.push_back(ScaleToJson(scale));
    return JsonText({{"Scales", list}});
}

}  // namespace brindle
