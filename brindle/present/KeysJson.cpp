// SPDX-License-Identifier: MIT
#include "brindle/present/KeysJson.h"

#include "brindle/present/JsonValues.h"
#include "brindle/present/ShownNames.h"

#include <utility>

namespace brindle {
namespace {

// The object is left open for the points.
void BeginKeyOfSong(CJsonWriter& json, const CShownKeys& keys) {
    json.Key("KeyOfSong").BeginObject();
    WriteSignKey(json.Key("SignKey"), keys.mKey);
    json.Key("Confidence").Number(keys.mConfidence);
}

void WriteScores(CJsonWriter& json, const CShownKeys& keys) {
    json.Key("Scores").BeginObject();
    for (std::size_t i = 0; i < keys.mScores.size(); ++i) {
        CSignKeyLite key({static_cast<int>(i % 12), TEnh_Undef},
                         i < 12 ? TSignKeyType_Major : TSignKeyType_Minor);
        key.SetRootNoteEnhWithLeastSigns();
        json.Key(key.NameLong(NamePrefs())).Number(keys.mScores[i]);
    }
    json.EndObject();
}

void WriteRegion(CJsonWriter& json, const CShownKeyRegion& region) {
    json.BeginObject();
    WriteSignKey(json.Key("SignKey"), region.mKey);
    json.Key("Position").Number(region.mRange.mBegin);
    json.Key("EndPosition").Number(region.mRange.mEnd);
    json.Key("Chords").BeginArray();
    for (const CShownNumeral& chord : region.mChords) {
        json.BeginObject().Key("Position").Number(chord.mRange.mBegin);
        json.Key("Symbol").StringOrNull(chord.mSymbol);
        json.Key("Numeral").StringOrNull(chord.mNumeral).EndObject();
    }
    json.EndArray().EndObject();
}

void WriteRegions(CJsonWriter& json, const CShownKeys& keys) {
    json.Key("KeyRegions").BeginArray();
    for (const CShownKeyRegion& region : keys.mRegions) WriteRegion(json, region);
    json.EndArray();
}

}  // namespace

std::string KeysJson(const CShownKeys& keys, const CReadSong* song) {
    CJsonWriter json;
    json.BeginObject();
    BeginKeyOfSong(json, keys);
    WriteScores(json, keys);
    json.EndObject();
    WriteRegions(json, keys);
    if (song != nullptr) WriteReading(json, *song);
    json.EndObject();
    return std::move(json).Text();
}

void WriteKeys(CJsonWriter& json, const CShownKeys& keys) {
    BeginKeyOfSong(json, keys);
    json.EndObject();
    WriteRegions(json, keys);
}

}  // namespace brindle
