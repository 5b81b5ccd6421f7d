// SPDX-License-Identifier: MIT
#include "brindle/present/internal/GridValues.h"

#include "brindle/guitarchords/GChPitches.h"

#include <nlohmann/json.hpp>

namespace brindle {
namespace {

Json ElemToJson(const GChChordElem& elem) {
    return {{"Finger", elem.fingerNumber()},
            {"Fret", elem.absFretIndex() + 1},
            {"Strings", {elem.coveredMinStr(), elem.coveredMaxStr()}},
            {"Optional", !elem.isReal()}};
}

Json FretsToJson(const std::vector<int>& frets) {
    Json list = Json::array();
    for (const int fret : frets) list.push_back(fret < 0 ? Json(nullptr) : Json(fret));
    return list;
}

Json PitchNamesToJson(const CChordGrid& grid) {
    Json list = Json::array();
    for (std::size_t i = 0; i < grid.mPitches.size(); ++i) {
        list.push_back(grid.mPitches[i] < 0 ? Json(nullptr) : Json(NoteText(grid, i)));
    }
    return list;
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

Json GridToJson(const CChordGrid& grid) {
    return {{"Symbol", grid.mSymbol},
            {"Name", grid.mName},
            {"OtherNames", grid.mOtherNames},
            {"Omitted", grid.mOmitted},
            {"RootKeyNr", KeyNrToJson(grid.mRoot)},
            {"Frets", FretsToJson(grid.mFrets)},
            {"Pitches", FretsToJson(grid.mPitches)},
            {"PitchNames", PitchNamesToJson(grid)},
            {"Elements", ElemsToJson(grid.mElems)},
            {"OpenStrings", GChPitchArrayFromShortTuning(grid.mTuning)},
            {"Capo", grid.mCapo},
            {"Difficulty", grid.mDifficulty < 0 ? Json(nullptr) : Json(grid.mDifficulty)},
            {"Library", grid.mLibrary.empty() ? Json(nullptr) : Json(grid.mLibrary)}};
}

}  // namespace brindle
