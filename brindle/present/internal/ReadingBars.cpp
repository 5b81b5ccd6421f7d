// SPDX-License-Identifier: MIT
#include "brindle/present/internal/ReadingBars.h"

#include <algorithm>

namespace brindle {
namespace {

/// More bars than this in which no chord begins are told by their number.
constexpr long kMostHeldBars = 7;

void AddHeldBars(std::vector<CReadingBar>& bars, long end, std::size_t chord) {
    long next = bars.empty() ? 1 : bars.back().mNumber + bars.back().mCount;
    if (end - next > kMostHeldBars) {
        bars.push_back({next, end - next, chord, chord});
        return;
    }
    for (; next < end; ++next) bars.push_back({next, 1, chord, chord});
}

}  // namespace

CBars BarsOfSong(const CSong& song) {
    std::vector<double> starts;
    starts.reserve(song.mBars.size());
    for (const CSongBar& bar : song.mBars) starts.push_back(bar.mPosition);
    return CBars(song.mBeatsPerBar, std::move(starts));
}

std::size_t ChordCountOf(const CSong& song) {
    return song.mChords.empty() ? 0 : song.mChords.size() - 1;
}

std::vector<CReadingBar> ReadingBarsOf(const CSong& song, const CBars& bars) {
    std::vector<CReadingBar> found;
    const std::size_t count = ChordCountOf(song);
    for (std::size_t ix = 0; ix < count; ++ix) {
        const double position = song.mChords[ix].mPosition;
        if (!(position >= 0.0)) continue;
        const long bar = bars.BarOf(position);
        const bool isBehind = found.empty() || found.back().mNumber + found.back().mCount <= bar;
        if (isBehind) {
            AddHeldBars(found, bar, ix);
            found.push_back({bar, 1, ix, ix});
        }
        found.back().mEnd = ix + 1;
    }
    if (count > 0 && !found.empty()) {
        AddHeldBars(found, bars.LastBarBefore(song.mChords.back().mPosition) + 1, count);
    }
    return found;
}

}  // namespace brindle
