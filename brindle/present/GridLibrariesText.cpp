// SPDX-License-Identifier: MIT
#include "brindle/present/GridLibrariesText.h"

#include "brindle/present/CTable.h"
#include "brindle/present/JsonValues.h"
#include "brindle/present/ShownText.h"

#include <fmt/format.h>

#include <nlohmann/json.hpp>

namespace brindle {
namespace {

Json LibraryToJson(const GChLibrary& library) {
    const auto tuning = library.gchTuning();
    return {{"Name", library.libraryName()},
            {"Tuning", tuning->tuningName()},
            {"OpenStrings", GChPitchArrayFromShortTuning(tuning->shortTuning())},
            {"Chords", library.numberOfChords()},
            {"ReadOnly", library.isReadOnlyLibrary()}};
}

}  // namespace

std::string GridLibrariesText(const GChDatabase& database, const CPaint& paint) {
    CTable table({"library", "tuning", "open strings", " chords", "read-only"});
    for (const auto& library : database.allLibrariesForAnyTuning()) {
        const auto tuning = library->gchTuning();
        table.AddRow({Printable(library->libraryName()), Printable(tuning->tuningName()),
                      tuning->tuningPitchesString(), fmt::format("{}", library->numberOfChords()),
                      library->isReadOnlyLibrary() ? "yes" : "no"});
    }
    return table.Text(paint);
}

std::string GridLibrariesJson(const GChDatabase& database) {
    Json list = Json::array();
    for (const auto& library : database.allLibrariesForAnyTuning()) {
        list.push_back(LibraryToJson(*library));
    }
    return JsonText({{"Libraries", list}});
}

std::vector<CChordGrid> AllGridsOf(const GChDatabase& database) {
    std::vector<CChordGrid> grids;
    for (const auto& library : database.allLibrariesForAnyTuning()) {
        for (const auto& chord : library->basicChords()) {
            grids.push_back(GridOfChord("", *GChChord::make(chord, 0), 0));
            grids.back().mSymbol = grids.back().mName;
        }
    }
    return grids;
}

}  // namespace brindle
