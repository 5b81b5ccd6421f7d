// SPDX-License-Identifier: MIT
#include "brindle/present/MakeSongCopies.h"

#include "brindle/analysis/CopiedPassages.h"
#include "brindle/present/CChordSymbols.h"

#include <algorithm>

namespace brindle {
namespace {

// `count` chords from number `first` on; the last chord of the list ends where it begins.
CTimeRange RangeOf(const CHarmAnlsChords& chords, std::uint64_t first, std::uint64_t count) {
    const std::uint64_t end = std::min<std::uint64_t>(first + count, chords.size() - 1);
    return {chords[first].mPosition, chords[end].mPosition};
}

}  // namespace

std::vector<CShownCopy> MakeSongCopies(const CHarmonicAnalyse& analyse,
                                       const CChordSymbols& symbols) {
    const CHarmAnlsChords& chords = analyse.mChords;
    std::vector<CShownCopy> copies;
    for (const CCopiedPassage& passage : FindCopiedPassages(analyse)) {
        CShownCopy& shown = copies.emplace_back();
        shown.mCopy = passage.mCopy;
        shown.mSource = RangeOf(chords, passage.mSource, passage.mCount);
        shown.mTarget = RangeOf(chords, passage.mTarget, passage.mCount);
        for (std::uint64_t n = 0; n < passage.mCount; ++n) {
            shown.mSymbols.push_back(symbols.SymbolOf(chords[passage.mTarget + n]));
        }
    }
    return copies;
}

}  // namespace brindle
