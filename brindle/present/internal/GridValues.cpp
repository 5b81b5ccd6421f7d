// SPDX-License-Identifier: MIT
#include "brindle/present/internal/GridValues.h"

#include <nlohmann/json.hpp>

namespace brindle {
namespace {

Json ElemToJson(const GChChordElem& elem) {
    return {{"Finger", elem.fingerNumber()},
            {"Fret", elem.absFretIndex() + 1},
            {"Strings", {elem.coveredMinStr(), elem.coveredMaxStr()}},
            {"Optional", !elem.isReal()}};
}

}  // namespace

Json KeyNrToJson(int keyNr) {
    return keyNr < 0 ? Json(nullptr) : Json(keyNr);
}

Json ElemsToJson(const std::vector<GChChordElem>& elems) {
    Json list = Json::array();
    for (const GChChordElem& elem : elems) list.push_back(ElemToJson(elem));
    return list;
}

}  // namespace brindle
