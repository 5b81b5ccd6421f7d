// SPDX-License-Identifier: MIT
#include "brindle/neural/NeuronalNet.h"

#include <fmt/core.h>

#include <algorithm>
#include <cmath>
#include <iostream>
#include <numeric>

namespace brindle {

namespace {

std::size_t Winner(const std::vector<double>& values) {
    return static_cast<std::size_t>(std::max_element(values.begin(), values.end()) -
                                    values.begin());
}

/// Sum over the next layer of its deltas, weighted by the connections from `neuron`.
double DeltaComingBack(std::span<const Neuron> nextLayer, std::span<const double> nextDeltas,
                       std::size_t neuron) {
    double sum = 0.0;
    for (std::size_t i = 0; i < nextLayer.size(); ++i) {
        sum += nextDeltas[i] * nextLayer[i].mWeights[neuron];
    }
    return sum;
}

}  // namespace

double NeuronalNet::train(const training_pattern& pattern) {
    use(pattern.mInputs);
    _CalculateDeltas(pattern.mOutputs);
    _ChangeWeights();
    use();
    return _SquaredError(pattern.mOutputs);
}

void NeuronalNet::_CalculateDeltas(const std::vector<double>& wanted) {
    const std::span<double> allDeltas(mDeltas);
    std::size_t begin = mDeltas.size() - mLayers.back().size();
    std::span<double> deltas = allDeltas.subspan(begin);
    Neuron::Act_AblVec(mLayers.back(), deltas);
    for (std::size_t i = 0; i < deltas.size(); ++i) {
        deltas[i] *= i < wanted.size() ? wanted[i] - mLayers.back()[i].mValue : 0.0;
    }
    for (std::size_t layer = mLayers.size() - 1; layer > 0; --layer) {
        const std::vector<Neuron>& hidden = mLayers[layer - 1];
        const std::span<const double> nextDeltas = deltas;
        begin -= hidden.size();
        deltas = allDeltas.subspan(begin, hidden.size());
        Neuron::Act_AblVec(hidden, deltas);
        for (std::size_t i = 0; i < deltas.size(); ++i) {
            deltas[i] *= DeltaComingBack(mLayers[layer], nextDeltas, i);
        }
    }
}

void NeuronalNet::_ChangeWeights() {
    std::size_t neuronIndex = 0;
    std::size_t weightIndex = 0;
    for (std::size_t layer = 0; layer < mLayers.size(); ++layer) {
        const std::span<const double> inputs = _InputsOfLayer(layer);
        for (Neuron& neuron : mLayers[layer]) {
            const double delta = mDeltas[neuronIndex++];
            for (std::size_t i = 0; i < inputs.size(); ++i) {
                double& lastChange = mLastChanges[weightIndex++];
                double change = delta * inputs[i] * mLearningFactor;
                if (!mHasNoEarlierChange) change += mMomentumAmount * lastChange;
                neuron.mWeights[i] += change;
                lastChange = change;
            }
        }
    }
    mHasNoEarlierChange = false;
}

std::span<const double> NeuronalNet::_InputsOfLayer(std::size_t layer) {
    if (layer == 0) return mInput;
    const std::vector<Neuron>& before = mLayers[layer - 1];
    std::transform(before.begin(), before.end(), mReadBuffer.begin(),
                   [](const Neuron& neuron) { return neuron.mValue; });
    return std::span(mReadBuffer).first(before.size());
}

double NeuronalNet::_SquaredError(const std::vector<double>& wanted) const {
    const std::vector<Neuron>& outputs = mLayers.back();
    double sum = 0.0;
    for (std::size_t i = 0; i < std::min(wanted.size(), outputs.size()); ++i) {
        const double difference = wanted[i] - outputs[i].mValue;
        sum += difference * difference;
    }
    return sum;
}

double NeuronalNet::getRMS(const std::vector<double>& wanted) const {
    return std::sqrt(_SquaredError(wanted));
}

int NeuronalNet::batch_train(const std::vector<training_pattern>& patterns, double learningFactor,
                             double errorTarget) {
    mLearningFactor = learningFactor;
    std::vector<std::size_t> order(patterns.size());
    std::iota(order.begin(), order.end(), std::size_t{0});
    double error = std::numeric_limits<double>::infinity();
    double bestError = error;
    int cycle = 0;
    while (cycle < mCycleLimit && error > errorTarget) {
        ++cycle;
        Shuffle(order, Neuron::random_source);
        error = 0.0;
        for (const std::size_t index : order) error += train(patterns[index]);
        if (error < bestError) {
            bestError = error;
            std::cout << fmt::format("Abgespeichert bei Cycle: {}\n", cycle);
        }
    }
    std::cout << fmt::format("Abbruch bei Cycle {}\nFehler: {:f}\n", cycle, error);
    return cycle;
}

int NeuronalNet::batch_verify(const std::vector<training_pattern>& patterns,
                              std::vector<std::size_t>* failures) {
    int count = 0;
    for (std::size_t i = 0; i < patterns.size(); ++i) {
        use(patterns[i].mInputs);
        if (winner() == Winner(patterns[i].mOutputs)) continue;
        ++count;
        if (failures != nullptr) failures->push_back(i);
    }
    return count;
}

}  // namespace brindle
