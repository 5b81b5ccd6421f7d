// SPDX-License-Identifier: MIT
#include "brindle/present/FindGrids.h"

#include "brindle/guitarchords/GChChordTypes.h"
#include "brindle/guitarchords/GChFilterParameter.h"
#include "brindle/theory/KeyIntervals.h"

namespace brindle {

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

}  // namespace brindle
