// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/MakeSong.h"

#include "brindle/chords/CChordLite.h"
#include "brindle/guitarchords/GChDatabase.h"
#include "brindle/present/ChordGrid.h"

#include <functional>
#include <map>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace brindle::cli {

/// The package at a path, or for an empty path the one that comes with the program and the user's.
/// Null when it is not there; then the error has been printed.
[[nodiscard]] std::unique_ptr<GChDatabase> ReadGrids(const std::string& packagePath);

/// The fingerings that sound a chord under a capodaster, in the order of the database. A bass
/// behind a slash is only found where a library tells it.
[[nodiscard]] std::vector<CChordGrid> FindGrids(const GChDatabase& database,
                                                std::string_view symbol, const CChordLite& chord,
                                                const GChShortTuning& tuning, int capo);

/// The fingering of each chord symbol of a song that lies lowest on the neck of a standard guitar;
/// chords that have none are left out.
[[nodiscard]] TChordGrids GridsOfSong(const GChDatabase& database, const CShownSong& song);

}  // namespace brindle::cli
