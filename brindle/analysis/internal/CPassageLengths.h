// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsChords.h"

#include <cstddef>
#include <cstdint>
#include <vector>

namespace brindle {

/// How long passages of a chord list are.
///
/// Lengths are added one after the other as doubles. Where that is exact (the usual lengths are
/// multiples of 1/65536 beat) it is the difference of two sums from the begin of the list, and
/// takes one step. Lengths that are not, such as 0.1, are added anew each time: a list of them
/// takes a step for each chord of each passage that is asked for, quadratic at worst.
class CPassageLengths {
public:
    explicit CPassageLengths(const CHarmAnlsChordsWithLength& chords);

    /// Of the chords from `first` to before `last`, in beats.
    [[nodiscard]] double Beats(std::size_t first, std::size_t last) const;
    /// The same cut to bars of four beats, downward; 0 below that and for no number.
    [[nodiscard]] std::uint64_t Bars(std::size_t first, std::size_t last) const;
    /// The way back in bars of four beats, toward zero: negative.
    [[nodiscard]] std::int32_t BarsBack(std::size_t first, std::size_t last) const;
    /// Replaces `sums` with the whole beats from `first` to each chord up to `last`: each length is
    /// added to a sum that is cut to whole beats at once.
    void WholeBeatsTo(std::vector<std::int32_t>& sums, std::size_t first, std::size_t last) const;

private:
    const CHarmAnlsChordsWithLength& mChords;
    // As far as they are exact.
    std::vector<double> mSums{0.0};
};

}  // namespace brindle
