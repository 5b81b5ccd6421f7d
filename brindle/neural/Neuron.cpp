// SPDX-License-Identifier: MIT
#include "brindle/neural/Neuron.h"

#include <algorithm>
#include <cassert>
#include <cmath>

namespace brindle {

namespace {

// Single precision, as the constants have always been.
constexpr double kFlatSpotAmount = static_cast<double>(0.1F);
constexpr double kSmallestStartWeight = static_cast<double>(0.1F);
constexpr double kGreatestStartWeight = static_cast<double>(0.99F);

double WeightedSum(std::span<const double> weights, std::span<const double> inputs) {
    const std::size_t count = std::min(weights.size(), inputs.size());
    double sum = 0.0;
    for (std::size_t i = 0; i < count; ++i) sum += weights[i] * inputs[i];
    return sum;
}

double Product(std::span<const double> weights, std::span<const double> inputs) {
    const std::size_t count = std::min(weights.size(), inputs.size());
    if (count == 0) return 0.0;
    double product = 1.0;
    for (std::size_t i = 0; i < count; ++i) product *= weights[i] * inputs[i];
    return product;
}

double NetInput(std::span<const double> weights, std::span<const double> inputs) {
    switch (Neuron::input_type) {
        case INPUT_SUM:
            return WeightedSum(weights, inputs);
        case INPUT_MIN:
            return inputs.empty() ? 0.0 : *std::min_element(inputs.begin(), inputs.end());
        case INPUT_MAX:
            return inputs.empty() ? 0.0 : *std::max_element(inputs.begin(), inputs.end());
        case INPUT_AVG:
            return WeightedSum(weights, inputs) / static_cast<double>(inputs.size());
        case INPUT_PROD:
            return Product(weights, inputs);
    }
    return 0.0;
}

double Ramp(double z) {
    return std::clamp(0.0 < z && z < 1.0 ? z * Neuron::activation_slope : z, -1.0, 1.0);
}

// Not a number where both exponentials overflow; the limits let it pass.
double HyperbolicTangent(double z) {
    const double up = std::exp(Neuron::activation_slope * z);
    const double down = std::exp(-Neuron::activation_slope * z);
    return std::clamp((up - down) / (up + down), -1.0, 1.0);
}

double Activation(double netInput) {
    const double z = netInput - Neuron::activation_threshold;
    switch (Neuron::activation_type) {
        case ACT_SIGM:
            return std::min(1.0 / (1.0 + std::exp((Neuron::activation_threshold - netInput) *
                                                  Neuron::activation_slope)),
                            1.0);
        case ACT_LIN:
            return Ramp(z);
        case ACT_TANHYP:
            return HyperbolicTangent(z);
        case ACT_IDENT:
            return netInput;
    }
    return 0.0;
}

double Output(double activation) {
    if (Neuron::output_type == OUTPUT_NONE) return activation;
    return Neuron::output_threshold <= activation ? 1.0 : 0.0;
}

/// Derivative of the logistic where its exp() term is `e`; `isInRange` false is its flat end.
double LogisticDerivative(double e, bool isInRange) {
    const double derivative = isInRange ? e / ((1.0 + e) * (1.0 + e)) : 0.0;
    return Neuron::flat_spot_elimination ? derivative + kFlatSpotAmount : derivative;
}

double HyperbolicTangentDerivative(double x) {
    const double s = Neuron::activation_slope;
    const double a = std::exp(-x);
    const double b = std::exp(x);
    return (a * s + s * b) / (a + b) + (s * b - a * s) * (a - b) / ((a + b) * (a + b));
}

/// Derivative of all activations but the logistic.
double OtherDerivative(double netInput) {
    switch (Neuron::activation_type) {
        case ACT_SIGM:
            break;
        case ACT_LIN:
            return 0.0 <= netInput && netInput <= 1.0 ? Neuron::activation_slope : 0.0;
        case ACT_TANHYP:
            return HyperbolicTangentDerivative((Neuron::activation_threshold - netInput) *
                                               Neuron::activation_slope);
        case ACT_IDENT:
            return 1.0;
    }
    return 0.0;
}

constexpr bool IsWithin50(double value) {
    return -50.0 <= value && value <= 50.0;
}

}  // namespace

Neuron::Neuron(int weightCount)
    : mWeightCount(std::max(weightCount, 0)), mWeights(static_cast<std::size_t>(mWeightCount)) {
    for (double& weight : mWeights) weight = WeightFromRandomNumber(random_source.Next());
    flat_spot_elimination = true;
}

double Neuron::WeightFromRandomNumber(std::uint32_t number) {
    const double weight = (number % 100U) * 0.01;
    if (weight == 0.0) return kSmallestStartWeight;
    if (weight == 1.0) return kGreatestStartWeight;
    return weight;
}

void Neuron::SetCalcParams(INPUT_TYPE inputType, ACT_TYPE activationType, OUTPUT_TYPE outputType,
                           double slope, double threshold, double outputThreshold) {
    input_type = inputType;
    activation_type = activationType;
    output_type = outputType;
    combined_type = (activationType + outputType * 4) * 5 + inputType;
    activation_slope = slope;
    activation_threshold = threshold;
    output_threshold = outputThreshold;
}

void Neuron::calcValue(std::span<const double> inputs, std::span<double> outputs,
                       std::size_t outputIndex) {
    mNetInput = NetInput(mWeights, inputs);
    mValue = Output(Activation(mNetInput));
    outputs[outputIndex] = mValue;
}

void Neuron::calcVec(std::span<Neuron> neurons, std::span<const double> inputs,
                     std::span<double> outputs) {
    assert(outputs.size() >= neurons.size());
    if (combined_type != 0) {
        for (std::size_t i = 0; i < neurons.size(); ++i) neurons[i].calcValue(inputs, outputs, i);
        return;
    }
    const double threshold = activation_threshold;
    const double slope = activation_slope;
    for (std::size_t i = 0; i < neurons.size(); ++i) {
        Neuron& neuron = neurons[i];
        neuron.mNetInput = WeightedSum(neuron.mWeights, inputs);
        neuron.mExpTerm = std::exp((threshold - neuron.mNetInput) * slope);
        neuron.mValue = std::min(1.0 / (neuron.mExpTerm + 1.0), 1.0);
        outputs[i] = neuron.mValue;
    }
}

double Neuron::Act_Abl() const {
    if (activation_type != ACT_SIGM) return OtherDerivative(mNetInput);
    const double x = (activation_threshold - mNetInput) * activation_slope;
    return LogisticDerivative(std::exp(x), IsWithin50(x));
}

void Neuron::Act_AblVec(std::span<const Neuron> neurons, std::span<double> outputs) {
    assert(outputs.size() >= neurons.size());
    for (std::size_t i = 0; i < neurons.size(); ++i) {
        // The exp() term itself is held against 50, not its exponent.
        const double e = neurons[i].mExpTerm;
        outputs[i] = activation_type == ACT_SIGM ? LogisticDerivative(e, IsWithin50(e))
                                                 : OtherDerivative(neurons[i].mNetInput);
    }
}

}  // namespace brindle
