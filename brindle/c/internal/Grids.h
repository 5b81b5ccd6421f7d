// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/c/internal/Border.h"

#include "brindle/chords/CChordLite.h"
#include "brindle/guitarchords/GChShortTuning.h"
#include "brindle/present/ChordGrid.h"

#include <vector>

struct brindle_grids {
    std::vector<brindle::CChordGrid> mGrids;
};

/// What the functions for fingerings share.
namespace brindle::border {

/// Checks a tuning and a capo as they were handed in, and reads the tuning; null is the standard
/// guitar.
brindle_status ReadStrings(const char* tuning, int capo, GChShortTuning& strings);

/// The chord of a symbol; a symbol that is no chord, as N.C., is an error, too.
brindle_status ReadSoundingChord(const char* symbol, CChordLite& chord);

void Give(std::vector<CChordGrid> found, brindle_grids** grids);

}  // namespace brindle::border
