// SPDX-License-Identifier: MIT
#include "brindle/song/internal/SongLengths.h"

#include <numeric>

namespace brindle {
namespace {

constexpr int kLongestChordInBars = 4;
constexpr double kLeastWeight = 1e-6;
// What is rarer among the lengths at a place is a slip, or belongs to a rhythm of its own.
constexpr double kRareShare = 0.05;
// How much the rhythm of a song stays as it is.
constexpr double kSameRhythm = 0.7;

void Normalise(std::vector<double>& weights) {
    const double sum = std::accumulate(weights.begin(), weights.end(), 0.0);
    if (sum == 0.0) return;
    for (double& weight : weights) weight = weight / sum < kRareShare ? 0.0 : weight / sum;
}

bool IsZero(const std::vector<double>& weights) {
    return std::accumulate(weights.begin(), weights.end(), 0.0) == 0.0;
}

}  // namespace

CSongLengths::CSongLengths(const CSongModel& model, int beatsPerBar)
    : mModel(model), mBeatsPerBar(beatsPerBar) {}

std::vector<double> CSongLengths::Learned(std::size_t beatInBar, std::int32_t before) const {
    std::vector<double> weights(static_cast<std::size_t>(kLongestChordInBars * mBeatsPerBar), 0.0);
    const auto ticks = [&](std::int32_t beats) { return beats * kTicksPerBar / mBeatsPerBar; };
    const auto tick = ticks(static_cast<std::int32_t>(beatInBar));
    for (const auto& [length, count] : mModel.LengthsAt(mBeatsPerBar, tick, ticks(before))) {
        const std::int32_t beats = length * mBeatsPerBar / kTicksPerBar;
        const bool isWhole = beats * kTicksPerBar == length * mBeatsPerBar;
        if (!isWhole || beats < 1 || beats > kLongestChordInBars * mBeatsPerBar) continue;
        weights[static_cast<std::size_t>(beats) - 1] += count;
    }
    Normalise(weights);
    return weights;
}

/// In a metre that was never heard: a chord a bar, or two in one that has a middle.
std::vector<double> CSongLengths::Usual(std::size_t beatInBar) const {
    const auto bar = static_cast<std::size_t>(mBeatsPerBar);
    std::vector<double> weights(bar * kLongestChordInBars, 0.0);
    weights[bar - beatInBar - 1] += 1.0;
    if (beatInBar == 0) weights[2 * bar - 1] += 0.4;
    if (beatInBar == 0 && bar % 2 == 0) weights[bar / 2 - 1] += 0.4;
    Normalise(weights);
    return weights;
}

std::vector<double> CSongLengths::WeightsAt(std::size_t beatInBar, std::int32_t before) const {
    std::vector<double> weights = Learned(beatInBar, 0);
    if (IsZero(weights)) weights = Usual(beatInBar);
    const std::vector<double> same = before > 0 ? Learned(beatInBar, before) : weights;
    for (std::size_t ix = 0; ix < weights.size(); ++ix) {
        if (!IsZero(same)) weights[ix] += kSameRhythm * (same[ix] - weights[ix]);
        weights[ix] += kLeastWeight;
    }
    return weights;
}

}  // namespace brindle
