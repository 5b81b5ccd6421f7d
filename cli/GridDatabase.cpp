// SPDX-License-Identifier: MIT
#include "cli/GridDatabase.h"

#include "cli/Input.h"

#include "brindle/guitarchords/GChChordTypes.h"
#include "brindle/guitarchords/GChFilterParameter.h"
#include "brindle/platform/FileTree.h"
#include "brindle/platform/Resources.h"
#include "brindle/present/ShownNames.h"
#include "brindle/theory/KeyIntervals.h"

#include <fmt/format.h>

#include <algorithm>

namespace brindle::cli {

std::unique_ptr<GChDatabase> ReadGrids(const std::string& packagePath) {
    auto database = std::make_unique<GChDatabase>();
    const std::string path =
        packagePath.empty() ? (ResourceFolder() / kGChFactoryPackagePath).string() : packagePath;
    if (!database->readFromDbPackageAtPath(path)) {
        Fail(TStatus::BadInput, fmt::format("{} is no package of chord grids", Printable(path)));
        return nullptr;
    }
    if (packagePath.empty()) database->readFromDbPackageAtPath(kGChUserPackagePath);
    return database;
}

std::vector<CChordGrid> FindGrids(const GChDatabase& database, std::string_view symbol,
                                  const CChordLite& chord, const GChShortTuning& tuning, int capo) {
    const CChordTypeId type = GChChordTypeIdForSemitones(chord.mSemitones);
    if (chord.IsUndef() || type == 0) return {};
    GChFilterParameter filter;
    filter.setChordTypeToFilter(type);
    filter.setRootNoteToFilter(FoldIntoOctave(chord.mRootKeyEnh.mKeyNr - capo), 0);
    if (chord.HasBassNote()) {
        filter.setBassNoteToFilter(FoldIntoOctave(chord.mBassKeyEnh.mKeyNr - capo), 0);
    }
    std::vector<CChordGrid> grids;
    for (const auto& library : database.allLibrariesForAnyTuning()) {
        if (!GChIsEqualShortTuning(library->gchTuning()->shortTuning(), tuning)) continue;
        for (const auto& basicChord : library->basicChords()) {
            if (!filter.Accepts(*basicChord)) continue;
            grids.push_back(GridOfChord(symbol, *GChChord::make(basicChord, 0), capo));
        }
    }
    return grids;
}

TChordGrids GridsOfSong(const GChDatabase& database, const CShownSong& song) {
    const auto highestFret = [](const CChordGrid& grid) {
        return *std::max_element(grid.mFrets.begin(), grid.mFrets.end());
    };
    TChordGrids gridOfSymbol;
    ForEachChord(song, [&](const CShownChord& shown) {
        if (gridOfSymbol.count(shown.mSymbol) > 0) return;
        const CChordLite chord(FoldAccidentals(shown.mSymbol), NamePrefs());
        auto grids = FindGrids(database, shown.mSymbol, chord, kGChStandardGuitar, 0);
        const auto lowest = std::min_element(grids.begin(), grids.end(),
                                             [&](const CChordGrid& a, const CChordGrid& b) {
                                                 return highestFret(a) < highestFret(b);
                                             });
        if (lowest != grids.end()) gridOfSymbol.emplace(shown.mSymbol, std::move(*lowest));
    });
    return gridOfSymbol;
}

}  // namespace brindle::cli
