// SPDX-License-Identifier: MIT
#include "brindle/present/GridsJson.h"

#include "brindle/guitarchords/GChPitches.h"
#include "brindle/present/JsonValues.h"
#include "brindle/present/internal/GridValues.h"

#include <nlohmann/json.hpp>

namespace brindle {
namespace {

Json FretsToJson(const std::vector<int>& frets) {
    Json list = Json::array();
    for (const int fret : frets) list.push_back(fret < 0 ? Json(nullptr) : Json(fret));
    return list;
}

Json PitchNamesToJson(const std::vector<int>& pitches) {
    Json list = Json::array();
    for (const int pitch : pitches) {
        list.push_back(pitch < 0 ? Json(nullptr) : Json(GChMidiPitchDefaultName(pitch)));
    }
    return list;
}

}  // namespace

std::string GridsJson(const std::vector<CChordGrid>& grids) {
    Json list = Json::array();
    for (const CChordGrid& grid : grids) {
        list.push_back({{"Symbol", grid.mSymbol},
                        {"Name", grid.mName},
                        {"OtherNames", grid.mOtherNames},
                        {"RootKeyNr", KeyNrToJson(grid.mRoot)},
                        {"Frets", FretsToJson(grid.mFrets)},
                        {"Pitches", FretsToJson(grid.mPitches)},
                        {"PitchNames", PitchNamesToJson(grid.mPitches)},
                        {"Elements", ElemsToJson(grid.mElems)},
                        {"OpenStrings", GChPitchArrayFromShortTuning(grid.mTuning)},
                        {"Capo", grid.mCapo},
                        {"Library", grid.mLibrary.empty() ? Json(nullptr) : Json(grid.mLibrary)}});
    }
    return JsonText({{"Grids", list}});
}

}  // namespace brindle
