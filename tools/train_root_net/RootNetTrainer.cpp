// SPDX-License-Identifier: MIT
#include "tools/train_root_net/RootNetTrainer.h"

#include "brindle/neural/ChordAnalysisNeuronalNet.h"

#include <algorithm>
#include <cmath>
#include <utility>

namespace brindle::tools {

namespace {

constexpr std::size_t kBatchSize = 64;
constexpr double kMeanMemory = 0.9;
constexpr double kSquareMemory = 0.999;
constexpr double kSmallestRoot = 1e-8;

double Slope() {
    return ChordAnalysisNeuronalNet.mDynNetProp.mNeuronProp.mActivationSlope;
}

double ScaledThreshold() {
    return Slope() * ChordAnalysisNeuronalNet.mDynNetProp.mNeuronProp.mActivationThreshold;
}

/// exp(x) for x from -40 to 40, to ten digits and the same on every machine, which the standard one
/// is not: Taylor's series for a 1024th of x, then ten squarings.
double Exp(double x) {
    const double part = x / 1024.0;
    double result = 1.0 + part / 6.0;
    for (const double factor : {1.0 / 5.0, 1.0 / 4.0, 1.0 / 3.0, 1.0 / 2.0, 1.0}) {
        result = 1.0 + result * part * factor;
    }
    for (int squaring = 0; squaring < 10; ++squaring) result *= result;
    return result;
}

double Logistic(double x) {
    return 1.0 / (1.0 + Exp(std::clamp(-x, -40.0, 40.0)));
}

template <std::size_t inputs, std::size_t neurons>
std::array<double, neurons> Forward(const TMatrix<inputs, neurons>& weights,
                                    const std::array<double, inputs>& values, double threshold) {
    std::array<double, neurons> result{};
    for (std::size_t i = 0; i < inputs; ++i) {
        if (values[i] == 0.0) continue;
        for (std::size_t n = 0; n < neurons; ++n) result[n] += values[i] * weights[i][n];
    }
    for (double& value : result) value = Logistic(value - threshold);
    return result;
}

/// Adds what a pattern contributes: the product of each input and each delta.
template <std::size_t inputs, std::size_t neurons>
void AddGradient(TMatrix<inputs, neurons>& gradient, const std::array<double, inputs>& values,
                 const std::array<double, neurons>& deltas) {
    for (std::size_t i = 0; i < inputs; ++i) {
        if (values[i] == 0.0) continue;
        for (std::size_t n = 0; n < neurons; ++n) gradient[i][n] += values[i] * deltas[n];
    }
}

/// Deltas of a hidden layer with these values from those of the next layer.
template <std::size_t inputs, std::size_t neurons>
std::array<double, inputs> Backward(const TMatrix<inputs, neurons>& weights,
                                    const std::array<double, inputs>& values,
                                    const std::array<double, neurons>& nextDeltas) {
    std::array<double, inputs> result{};
    for (std::size_t i = 0; i < inputs; ++i) {
        double sum = 0.0;
        for (std::size_t n = 0; n < neurons; ++n) sum += weights[i][n] * nextDeltas[n];
        result[i] = sum * values[i] * (1.0 - values[i]);
    }
    return result;
}

template <std::size_t inputs, std::size_t neurons>
void Randomize(TMatrix<inputs, neurons>& weights, SeededRandom& random) {
    for (auto& row : weights) {
        for (double& weight : row) weight = random.Fraction() * 2.0 - 1.0;
    }
}

template <std::size_t inputs, std::size_t neurons>
void AppendByNeuron(const TMatrix<inputs, neurons>& weights, std::vector<double>& result) {
    for (std::size_t n = 0; n < neurons; ++n) {
        for (std::size_t i = 0; i < inputs; ++i) result.push_back(weights[i][n] / Slope());
    }
}

}  // namespace

RootNetTrainer::RootNetTrainer(std::vector<CChordRootPattern> patterns, std::uint64_t seed)
    : mPatterns(std::move(patterns)), mRandom(seed) {
    Randomize(mWeights.mFirst, mRandom);
    Randomize(mWeights.mSecond, mRandom);
    Randomize(mWeights.mOutput, mRandom);
}

std::size_t RootNetTrainer::TrainCycle(double stepSize) {
    Shuffle(mPatterns, mRandom);
    mWrongCount = 0;
    for (std::size_t begin = 0; begin < mPatterns.size(); begin += kBatchSize) {
        const std::size_t end = std::min(begin + kBatchSize, mPatterns.size());
        mGradient = {};
        for (std::size_t i = begin; i < end; ++i) _LearnFrom(mPatterns[i]);
        _Step(stepSize);
    }
    return mWrongCount;
}

void RootNetTrainer::_LearnFrom(const CChordRootPattern& pattern) {
    std::array<double, kChordRootInputCount> inputs{};
    for (std::size_t i = 0; i < inputs.size(); ++i) inputs[i] = (pattern.mInputs >> i & 1U) != 0;
    const auto first = Forward(mWeights.mFirst, inputs, ScaledThreshold());
    const auto second = Forward(mWeights.mSecond, first, ScaledThreshold());
    const auto outputs = Forward(mWeights.mOutput, second, ScaledThreshold());

    const auto root = static_cast<std::size_t>(pattern.mRootIntvl);
    const auto* winner = std::max_element(outputs.begin(), outputs.end());
    if (winner != &outputs[root]) ++mWrongCount;

    auto outputDeltas = outputs;
    for (double& delta : outputDeltas) delta = -delta;
    outputDeltas[root] += 1.0;
    const auto secondDeltas = Backward(mWeights.mOutput, second, outputDeltas);
    const auto firstDeltas = Backward(mWeights.mSecond, first, secondDeltas);
    AddGradient(mGradient.mOutput, second, outputDeltas);
    AddGradient(mGradient.mSecond, first, secondDeltas);
    AddGradient(mGradient.mFirst, inputs, firstDeltas);
}

void RootNetTrainer::_Step(double stepSize) {
    mMeanFading *= kMeanMemory;
    mSquareFading *= kSquareMemory;
    const auto step = [&]<std::size_t inputs, std::size_t neurons>(
                          TMatrix<inputs, neurons> CRootNetNumbers::*layer) {
        for (std::size_t i = 0; i < inputs; ++i) {
            for (std::size_t n = 0; n < neurons; ++n) {
                const double gradient = (mGradient.*layer)[i][n] / kBatchSize;
                double& mean = (mMeanGradient.*layer)[i][n];
                double& square = (mMeanSquare.*layer)[i][n];
                mean += (1.0 - kMeanMemory) * (gradient - mean);
                square += (1.0 - kSquareMemory) * (gradient * gradient - square);
                (mWeights.*layer)[i][n] +=
                    stepSize * (mean / (1.0 - mMeanFading)) /
                    (std::sqrt(square / (1.0 - mSquareFading)) + kSmallestRoot);
            }
        }
    };
    step(&CRootNetNumbers::mFirst);
    step(&CRootNetNumbers::mSecond);
    step(&CRootNetNumbers::mOutput);
}

std::vector<double> RootNetTrainer::Weights() const {
    std::vector<double> result;
    AppendByNeuron(mWeights.mFirst, result);
    AppendByNeuron(mWeights.mSecond, result);
    AppendByNeuron(mWeights.mOutput, result);
    return result;
}

}  // namespace brindle::tools
