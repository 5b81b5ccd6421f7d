// SPDX-License-Identifier: MIT
// Any text as a tuning, a chord and frets, one a line: what is read can be searched and drawn.

#include "brindle/chords/ReadChordText.h"
#include "brindle/present/ChordGrid.h"
#include "brindle/present/GridsSvg.h"
#include "brindle/present/GridsText.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string_view>

namespace {

using namespace brindle;

// Some hundreds of steps of the search: as far up the neck as six strings allow, and on more of
// them what two frets under a hand that mutes nothing have. What bounds the search is tested
// elsewhere.
CFingeringOptions FewSteps(const GChShortTuning& tuning) {
    constexpr int kUsualStrings = 6;
    CFingeringOptions options;
    options.mLimit = 5;
    options.mHighestFret = 5;
    options.mSpan = 3;
    if (GChNumberOfStringsInShortTuning(tuning) > kUsualStrings) {
        options.mHighestFret = options.mSpan = 2;
        options.mMutable = 0;
    }
    return options;
}

std::string_view TakeLine(std::string_view& text) {
    const std::string_view line = text.substr(0, text.find('\n'));
    text.remove_prefix(std::min(line.size() + 1, text.size()));
    return line;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    std::string_view text(reinterpret_cast<const char*>(data), size);
    const auto tuning = ReadTuning(TakeLine(text));
    if (!tuning) return 0;
    const CChordLite chord = ReadChordText(TakeLine(text)).mChord;
    auto grids = FoundGrids("chord", chord, *tuning, FewSteps(*tuning));
    for (const CChordGrid& grid : grids) {
        const auto frets = ReadFrets(FretsText(grid));
        if (!frets || *frets != grid.mFrets) std::abort();
    }
    const auto frets = ReadFrets(TakeLine(text));
    const auto strings = static_cast<std::size_t>(GChNumberOfStringsInShortTuning(*tuning));
    if (frets && frets->size() == strings) {
        auto grid = GridOfFrets("frets", *frets, *tuning, 0);
        if (grid) grids.push_back(std::move(*grid));
    }
    if (GridsSvg(grids, "", {TGridDots::Notes, true}).empty()) std::abort();
    (void)GridsText(grids, CPaint(false), {TGridDots::Intervals, false});
    return 0;
}
