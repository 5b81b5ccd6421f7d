// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/ShownSong.h"

#include <algorithm>
#include <cmath>
#include <string>
#include <utility>
#include <vector>

namespace brindle {

/// Bars and beats as musicians count them, from 1, for positions in beats that count from 0. Bars
/// are all as long as the first, or begin where a score tells.
class CBars {
public:
    /// `starts`, ascending, are where the bars of a score begin; without them all bars have
    /// `beatsPerBar`, which is above 0.
    explicit CBars(double beatsPerBar, std::vector<double> starts = {})
        : mBeatsPerBar(beatsPerBar), mStarts(std::move(starts)) {}

    /// The number of the bar, from 1; 0 and less before the first one.
    [[nodiscard]] long BarOf(double position) const {
        if (!mStarts.empty()) return StartsUpTo(position);
        return WholeBars(std::floor(position / mBeatsPerBar)) + 1;
    }
    /// 1 up to, not including, the length of a bar plus 1.
    [[nodiscard]] double BeatOf(double position) const {
        if (!mStarts.empty()) {
            const auto bar = static_cast<std::size_t>(std::max(1L, StartsUpTo(position)));
            return position - mStarts[bar - 1] + 1.0;
        }
        return position - std::floor(position / mBeatsPerBar) * mBeatsPerBar + 1.0;
    }
    /// The last bar of a range that ends before `end`.
    [[nodiscard]] long LastBarBefore(double end) const {
        if (!mStarts.empty()) {
            return std::lower_bound(mStarts.begin(), mStarts.end(), end) - mStarts.begin();
        }
        return WholeBars(std::ceil(end / mBeatsPerBar));
    }

private:
    // Far beyond all songs, so that numbers of bars can be added without overflow.
    static long WholeBars(double bars) {
        constexpr double most = 1e15;
        return std::lround(std::fmin(std::fmax(bars, -most), most));
    }

    [[nodiscard]] long StartsUpTo(double position) const {
        return std::upper_bound(mStarts.begin(), mStarts.end(), position) - mStarts.begin();
    }

    double mBeatsPerBar;
    std::vector<double> mStarts;  // ascending
};

/// "bar 3", "bars 1 to 4".
[[nodiscard]] std::string BarsOf(const CTimeRange& range, const CBars& bars);

}  // namespace brindle
