// SPDX-License-Identifier: MIT
#include "brindle/present/ChordTypesText.h"

#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/present/CTable.h"
#include "brindle/present/JsonValues.h"

#include <fmt/format.h>

#include <nlohmann/json.hpp>
#include <vector>

namespace brindle {
namespace {

std::string NameOnC(const CChordType& type) {
    CSemitones semitones;
    for (const int intvl : type.mIntvls) semitones.AddIntvl(intvl % 12);
    return "C" + ChordSymbolSuffix(semitones);
}

}  // namespace

std::string ChordTypesText(const CChordTypeVec& types, const CPaint& paint) {
    CTable table({" id", "name", "intervals", "on C"});
    for (const CChordType& type : types) {
        table.AddRow({fmt::format("{}", type.mId), type.mName,
                      fmt::format("{}", fmt::join(type.mIntvls, " ")), NameOnC(type)});
    }
    return table.Text(paint);
}

std::string ChordTypesJson(const CChordTypeVec& types) {
    Json list = Json::array();
    for (const CChordType& type : types) {
        list.push_back({{"Id", type.mId},
                        {"Name", type.mName},
                        {"Intervals", std::vector<int>(type.mIntvls.begin(), type.mIntvls.end())},
                        {"NameOnC", NameOnC(type)}});
    }
    return JsonText({{"ChordTypes", list}});
}

}  // namespace brindle
