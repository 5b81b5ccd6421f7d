// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/CSongModel.h"

#include <vector>

namespace brindle {

/// How long chords last in a metre, in beats, by where in the bar they begin.
class CSongLengths {
public:
    CSongLengths(const CSongModel& model, int beatsPerBar);

    /// The weight of each length from 1 beat on behind a chord of so many beats, 0 for any. None of
    /// them is 0, so that chords fit into any place.
    [[nodiscard]] std::vector<double> WeightsAt(std::size_t beatInBar, std::int32_t before) const;

private:
    [[nodiscard]] std::vector<double> Learned(std::size_t beatInBar, std::int32_t before) const;
    [[nodiscard]] std::vector<double> Usual(std::size_t beatInBar) const;

    const CSongModel& mModel;
    int mBeatsPerBar;
};

}  // namespace brindle
