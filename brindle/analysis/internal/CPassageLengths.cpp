// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/CPassageLengths.h"

#include <cmath>
#include <limits>

namespace brindle {

namespace {

constexpr double kBeatsPerBar = 4.0;
constexpr double kSmallestPartsOfBeat = 65536.0;
// Multiples of 1/65536 up to here have at most 53 bits.
constexpr double kGreatestExactSum = 137438953472.0;

/// Toward zero; the nearest limit for what does not fit, 0 for no number.
std::int32_t CutToInteger(double value) {
    using TLimits = std::numeric_limits<std::int32_t>;
    if (std::isnan(value)) return 0;
    if (value >= double{TLimits::max()}) return TLimits::max();
    return value <= double{TLimits::min()} ? TLimits::min() : static_cast<std::int32_t>(value);
}

}  // namespace

CPassageLengths::CPassageLengths(const CHarmAnlsChordsWithLength& chords) : mChords(chords) {
    double magnitude = 0.0;
    for (const CHarmAnlsChordWithLength& chord : chords) {
        magnitude += std::abs(chord.mLength);
        const double parts = chord.mLength * kSmallestPartsOfBeat;
        if (!(magnitude <= kGreatestExactSum) || parts != std::trunc(parts)) return;
        mSums.push_back(mSums.back() + chord.mLength);
    }
}

double CPassageLengths::Beats(std::size_t first, std::size_t last) const {
    if (last < mSums.size()) return mSums[last] - mSums[first];
    double sum = 0.0;
    for (std::size_t ix = first; ix < last; ++ix) sum += mChords[ix].mLength;
    return sum;
}

std::uint64_t CPassageLengths::Bars(std::size_t first, std::size_t last) const {
    const double bars = std::floor(Beats(first, last) / kBeatsPerBar);
    constexpr double kEnd = 18446744073709551616.0;
    if (!(bars > 0.0)) return 0;
    return bars >= kEnd ? std::numeric_limits<std::uint64_t>::max()
                        : static_cast<std::uint64_t>(bars);
}

std::int32_t CPassageLengths::BarsBack(std::size_t first, std::size_t last) const {
    return CutToInteger(-Beats(first, last) / kBeatsPerBar);
}

void CPassageLengths::WholeBeatsTo(std::vector<std::int32_t>& sums, std::size_t first,
                                   std::size_t last) const {
    sums.assign(1, 0);
    for (std::size_t ix = first; ix < last; ++ix) {
        sums.push_back(CutToInteger(sums.back() + mChords[ix].mLength));
    }
}

}  // namespace brindle
