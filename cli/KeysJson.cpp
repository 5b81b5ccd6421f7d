// SPDX-License-Identifier: MIT
#include "cli/KeysJson.h"

#include "cli/Names.h"

namespace brindle::cli {
namespace {

Json TextToJson(const std::string& text) {
    return text.empty() ? Json(nullptr) : Json(text);
}

Json SignKeyToJson(const CSignKeyLite& key) {
    if (key.IsUndef()) return nullptr;
    return {{"Name", key.NameLong(NamePrefs())},
            {"CKeyEnh", KeyEnhToJson(key.mRootKeyEnh)},
            {"Type", JSONWord(key.mSignKeyType)}};
}

Json RegionToJson(const TShownKeyRegion& region) {
    Json chords = Json::array();
    for (const TShownNumeral& chord : region.mChords) {
        chords.push_back({{"Position", NumberToJson(chord.mRange.mBegin)},
                          {"Symbol", TextToJson(chord.mSymbol)},
                          {"Numeral", TextToJson(chord.mNumeral)}});
    }
    return {{"SignKey", SignKeyToJson(region.mKey)},
            {"Position", NumberToJson(region.mRange.mBegin)},
            {"EndPosition", NumberToJson(region.mRange.mEnd)},
            {"Chords", std::move(chords)}};
}

}  // namespace

void AppendKeysJson(Json& json, const TSongKeys& keys) {
    json["KeyOfSong"] = {{"SignKey", SignKeyToJson(keys.mKey)},
                         {"Confidence", NumberToJson(keys.mConfidence)}};
    Json regions = Json::array();
    for (const TShownKeyRegion& region : keys.mRegions) regions.push_back(RegionToJson(region));
    json["KeyRegions"] = std::move(regions);
}

Json KeyScoresJson(const TSongKeys& keys) {
    Json scores = Json::object();
    for (std::size_t i = 0; i < keys.mScores.size(); ++i) {
        CSignKeyLite key({static_cast<int>(i % 12), TEnh_Undef},
                         i < 12 ? TSignKeyType_Major : TSignKeyType_Minor);
        key.SetRootNoteEnhWithLeastSigns();
        scores[key.NameLong(NamePrefs())] = keys.mScores[i];
    }
    return scores;
}

}  // namespace brindle::cli
