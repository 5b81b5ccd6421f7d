// SPDX-License-Identifier: MIT
#pragma once

#include <cmath>

namespace brindle::cli {

/// Bars and beats as musicians count them, from 1, for positions in beats that count from 0.
class CBars {
public:
    explicit CBars(double beatsPerBar) : mBeatsPerBar(beatsPerBar) {}

    [[nodiscard]] long BarOf(double position) const {
        return std::lround(std::floor(position / mBeatsPerBar)) + 1;
    }
    /// 1 up to, not including, the length of a bar plus 1.
    [[nodiscard]] double BeatOf(double position) const {
        return position - std::floor(position / mBeatsPerBar) * mBeatsPerBar + 1.0;
    }
    /// The last bar of a range that ends before `end`.
    [[nodiscard]] long LastBarBefore(double end) const {
        return std::lround(std::ceil(end / mBeatsPerBar));
    }

private:
    double mBeatsPerBar;
};

}  // namespace brindle::cli
