// SPDX-License-Identifier: MIT
#include "brindle/present/FunctionsText.h"

#include "brindle/chords/CChordHeavy.h"
#include "brindle/chords/CChordLite.h"
#include "brindle/chords/HarmFuncNames.h"
#include "brindle/present/CTable.h"
#include "brindle/present/JsonValues.h"
#include "brindle/present/ShownNames.h"
#include "brindle/present/ShownText.h"
#include "brindle/theory/CSignKeyHeavy.h"

#include <fmt/format.h>

#include <nlohmann/json.hpp>

namespace brindle {

namespace {

Json NumberOrNull(int number) {
    return number < 0 ? Json(nullptr) : Json(number);
}

Json TextOrNull(const std::string& text) {
    return text.empty() ? Json(nullptr) : Json(text);
}

// Degrees are counted from 1 here, as people do.
std::string DegreeText(int degree) {
    return degree < 0 ? "-" : fmt::format("{}", degree + 1);
}

std::string OrDash(const std::string& text) {
    return text.empty() ? "-" : text;
}

}  // namespace

CChordFunction FunctionOf(const std::string& symbol, const CChordLite& chord,
                          const CSignKeyHeavy& key) {
    const CChordHeavy heavy = chord.ToChordHeavy(CChordHeavy::DefaultWrapIntvl);
    CChordFunction function;
    function.mSymbol = Printable(symbol);
    function.mFunction = heavy.HarmFuncIn(key);
    CChordNamePrefs letters = NamePrefs();
    letters.mChordPrefF = 1;
    if (function.mFunction >= 0) {
        function.mNumeral = heavy.HarmFuncName(key, NamePrefs());
        function.mLetters = heavy.HarmFuncName(key, letters);
    }
    function.mRootDegree = heavy.RootNoteDegreeNrInSignKey(key);
    function.mBassDegree = heavy.BassNoteDegreeNrInSignKey(key);
    return function;
}

std::string FunctionsJson(const CSignKeyLite& key, const std::vector<CChordFunction>& functions) {
    Json list = Json::array();
    for (const CChordFunction& function : functions) {
        list.push_back({{"Symbol", function.mSymbol},
                        {"HarmFunc", NumberOrNull(function.mFunction)},
                        {"Numeral", TextOrNull(function.mNumeral)},
                        {"Letters", TextOrNull(function.mLetters)},
                        {"RootDegree", NumberOrNull(function.mRootDegree)},
                        {"BassDegree", NumberOrNull(function.mBassDegree)}});
    }
    return JsonText({{"Key", key.NameLong(NamePrefs())}, {"Chords", list}});
}

std::string FunctionsText(const std::vector<CChordFunction>& functions, const CPaint& paint) {
    CTable table({"chord", "numeral", "letters", " root degree", " bass degree"});
    for (const CChordFunction& function : functions) {
        table.AddRow({function.mSymbol, OrDash(function.mNumeral), OrDash(function.mLetters),
                      DegreeText(function.mRootDegree), DegreeText(function.mBassDegree)});
    }
    return table.Text(paint);
}

}  // namespace brindle
