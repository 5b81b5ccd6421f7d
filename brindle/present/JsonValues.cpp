// SPDX-License-Identifier: MIT
#include "brindle/present/JsonValues.h"

#include "brindle/analysis/Positions.h"
#include "brindle/present/ShownNames.h"

#include <cmath>
#include <nlohmann/json.hpp>
#include <sstream>
#include <utility>

namespace brindle {
namespace {

std::string EnhWord(TEnh enh) {
    std::ostringstream word;
    word << enh;
    return word.str();
}

void Write(CJsonWriter& writer, const Json& json) {
    if (json.is_object()) {
        writer.BeginObject();
        for (const auto& [key, value] : json.items()) Write(writer.Key(key), value);
        writer.EndObject();
    } else if (json.is_array()) {
        writer.BeginArray();
        for (const Json& value : json) Write(writer, value);
        writer.EndArray();
    } else if (json.is_string()) {
        writer.String(json.get_ref<const std::string&>());
    } else if (json.is_boolean()) {
        writer.Bool(json.get<bool>());
    } else if (json.is_number_unsigned()) {
        writer.Count(json.get<std::uint64_t>());
    } else if (json.is_number_integer()) {
        writer.Integer(json.get<std::int64_t>());
    } else if (json.is_number()) {
        writer.Number(json.get<double>());
    } else {
        writer.Null();
    }
}

}  // namespace

void WriteKeyEnh(CJsonWriter& json, const CKeyEnh& keyEnh) {
    if (keyEnh.IsUndef()) {
        json.Null();
        return;
    }
    json.BeginObject().Key("Name").String(KeyName(keyEnh));
    json.Key("KeyNr").Integer(keyEnh.mKeyNr).Key("Enh").String(EnhWord(keyEnh.mEnh)).EndObject();
}

Json KeyEnhToJson(const CKeyEnh& keyEnh) {
    if (keyEnh.IsUndef()) return nullptr;
    return {{"Name", KeyName(keyEnh)}, {"KeyNr", keyEnh.mKeyNr}, {"Enh", EnhWord(keyEnh.mEnh)}};
}

Json KeyEnhsToJson(const std::vector<CKeyEnh>& keys) {
    Json list = Json::array();
    for (const CKeyEnh& key : keys) list.push_back(KeyEnhToJson(key));
    return list;
}

void WriteSignKey(CJsonWriter& json, const CSignKeyLite& key) {
    if (key.IsUndef()) {
        json.Null();
        return;
    }
    json.BeginObject().Key("Name").String(key.NameLong(NamePrefs()));
    WriteKeyEnh(json.Key("CKeyEnh"), key.mRootKeyEnh);
    json.Key("Type").String(JSONWord(key.mSignKeyType)).EndObject();
}

void WriteIntervals(CJsonWriter& json, CSemitones semitones) {
    json.BeginArray();
    for (int intvl = 0; intvl < 12; ++intvl) {
        if (semitones.HasIntvl(intvl)) json.Integer(intvl);
    }
    json.EndArray();
}

Json IntervalsToJson(CSemitones semitones) {
    Json intervals = Json::array();
    for (int intvl = 0; intvl < 12; ++intvl) {
        if (semitones.HasIntvl(intvl)) intervals.push_back(intvl);
    }
    return intervals;
}

Json NumberToJson(double number) {
    if (number == kPosUndef || !std::isfinite(number)) return nullptr;
    return number;
}

std::string JsonText(const Json& json) {
    CJsonWriter writer;
    Write(writer, json);
    return std::move(writer).Text();
}

}  // namespace brindle
