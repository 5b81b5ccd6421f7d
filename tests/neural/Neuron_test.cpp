// SPDX-License-Identifier: MIT
#include "brindle/neural/Neuron.h"

#include "tests/neural/NetForms.h"
#include "tests/support/Expected.h"

#include <doctest/doctest.h>

#include <array>
#include <cmath>
#include <set>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

constexpr double kTolerance = 1e-12;

Neuron NeuronWith(std::vector<double> weights) {
    Neuron neuron(static_cast<int>(weights.size()));
    neuron.mWeights = std::move(weights);
    return neuron;
}

void SetActivation(const json& type, const json& slope, const json& threshold) {
    Neuron::SetCalcParams(INPUT_SUM, static_cast<ACT_TYPE>(type.get<int>()), OUTPUT_NONE,
                          slope.get<double>(), threshold.get<double>(), 0.0);
}

json StartWeights(const json& in) {
    json weights = json::array();
    for (const json& number : in.at(0)) {
        weights.push_back(Neuron::WeightFromRandomNumber(number.get<std::uint32_t>()));
    }
    return weights;
}

json CalculatedValue(const json& in) {
    Neuron neuron = NeuronWith(in.at(0).get<std::vector<double>>());
    Neuron::SetCalcParams(static_cast<INPUT_TYPE>(in.at(2).get<int>()),
                          static_cast<ACT_TYPE>(in.at(3).get<int>()),
                          static_cast<OUTPUT_TYPE>(in.at(4).get<int>()), in.at(5).get<double>(),
                          in.at(6).get<double>(), in.at(7).get<double>());
    std::array<double, 2> outputs{};
    neuron.calcValue(in.at(1).get<std::vector<double>>(), outputs, 1);
    CHECK(outputs[1] == neuron.mValue);
    return {neuron.mNetInput, neuron.mValue};
}

json DerivativeOfOne(const json& in) {
    SetActivation(in.at(1), in.at(2), in.at(3));
    Neuron neuron(0);
    Neuron::flat_spot_elimination = in.at(4).get<bool>();
    neuron.mNetInput = in.at(0).get<double>();
    return neuron.Act_Abl();
}

json DerivativeOfLayer(const json& in) {
    SetActivation(in.at(2), in.at(3), in.at(4));
    std::array<Neuron, 1> layer = {NeuronWith(in.at(0).get<std::vector<double>>())};
    Neuron::flat_spot_elimination = in.at(5).get<bool>();
    std::array<double, 1> outputs{};
    Neuron::calcVec(layer, in.at(1).get<std::vector<double>>(), outputs);
    Neuron::Act_AblVec(layer, outputs);
    return outputs[0];
}

json CombinedType(const json& in) {
    Neuron::SetCalcParams(static_cast<INPUT_TYPE>(in.at(0).get<int>()),
                          static_cast<ACT_TYPE>(in.at(1).get<int>()),
                          static_cast<OUTPUT_TYPE>(in.at(2).get<int>()), 1.0, 0.0, 0.0);
    return Neuron::combined_type;
}

/// The winner among given values, by a net that hands its inputs on.
json Winner(const json& in) {
    const auto values = in.at(0).get<std::vector<double>>();
    const int count = static_cast<int>(values.size());
    NeuronalNet net(count, {}, count, INPUT_SUM, ACT_IDENT, 1.0, 0.0, OUTPUT_NONE, 0.0);
    std::vector<double> weights(values.size() * values.size(), 0.0);
    for (std::size_t i = 0; i < values.size(); ++i) weights[i * (values.size() + 1)] = 1.0;
    CHECK(net.acquire_weights({net.get_fixed_net_prop(), net.get_dyn_net_prop(), weights}));
    net.use(values);
    return net.winner();
}

}  // namespace

TEST_CASE("A neuron sums its weighted inputs, fires, and knows the slope where it does") {
    CheckExpected("net_neurons",
                  {
                      {"Neuron::Neuron", StartWeights},
                      {"Neuron::calcValue", CalculatedValue},
                      {"Neuron::Act_Abl", DerivativeOfOne},
                      {"Neuron::Act_AblVec", DerivativeOfLayer},
                      {"Neuron::combined_type", CombinedType},
                      {"NeuronalNet::winner", Winner},
                  },
                  kTolerance);
}

TEST_CASE("A new neuron has random weights between 0.01 and 0.99 and turns flat spots off") {
    Neuron::flat_spot_elimination = false;
    const Neuron neuron(500);
    CHECK(Neuron::flat_spot_elimination);
    for (const double weight : neuron.mWeights) {
        CHECK(weight >= 0.01);
        CHECK(weight <= 0.99);
    }
    const std::set<double> different(neuron.mWeights.begin(), neuron.mWeights.end());
    CHECK(different.size() > 90);
    CHECK(Neuron(-1).mWeights.empty());
}

TEST_CASE("The start weight that would be nothing is a tenth in single precision") {
    CHECK(Neuron::WeightFromRandomNumber(300) == 0.10000000149011612);
}

TEST_CASE("A layer of the common kind gives what its neurons give one by one") {
    Neuron::SetCalcParams(INPUT_SUM, ACT_SIGM, OUTPUT_NONE, 0.2, 2.0, 0.0);
    std::vector<Neuron> layer(3, Neuron(4));
    layer[1].mWeights = {-1000.0, 20.0, 3.0, -7.5};
    layer[2].mWeights = {1000.0, 5000.0, 0.0, 1.0};
    const std::vector<double> inputs = {1.0, 0.5, -0.25, 2.0};
    std::vector<double> outputs(3);
    Neuron::calcVec(layer, inputs, outputs);
    for (std::size_t i = 0; i < layer.size(); ++i) {
        Neuron alone = layer[i];
        std::vector<double> output(1);
        alone.calcValue(inputs, output, 0);
        CHECK(alone.mValue == outputs[i]);
    }
}

TEST_CASE("Without inputs a neuron answers by its threshold alone") {
    std::vector<Neuron> layer(1, Neuron(0));
    std::vector<double> output(1);
    Neuron::SetCalcParams(INPUT_SUM, ACT_SIGM, OUTPUT_NONE, 0.2, 2.0, 0.0);
    Neuron::calcVec(layer, {}, output);
    CHECK(output[0] == doctest::Approx(1.0 / (1.0 + std::exp(0.4))));

    for (const INPUT_TYPE type : {INPUT_MIN, INPUT_MAX, INPUT_PROD}) {
        Neuron::SetCalcParams(type, ACT_IDENT, OUTPUT_NONE, 1.0, 0.0, 0.0);
        Neuron::calcVec(layer, {}, output);
        CHECK(output[0] == 0.0);
    }
    Neuron::SetCalcParams(INPUT_AVG, ACT_IDENT, OUTPUT_NONE, 1.0, 0.0, 0.0);
    Neuron::calcVec(layer, {}, output);
    CHECK(std::isnan(output[0]));
}

TEST_CASE("The exp() term of the logistic comes from the common kind of layer only") {
    Neuron::SetCalcParams(INPUT_AVG, ACT_SIGM, OUTPUT_NONE, 1.0, 0.0, 0.0);
    std::vector<Neuron> layer(1, Neuron(1));
    layer[0].mWeights = {1.0};
    std::vector<double> output(1);
    Neuron::calcVec(layer, std::vector<double>{0.5}, output);
    CHECK(layer[0].mExpTerm == 0.0);
    Neuron::Act_AblVec(layer, output);
    CHECK(output[0] == static_cast<double>(0.1F));
    CHECK(layer[0].Act_Abl() > 0.3);

    // exp() of 5 is above 50, of 3 below; held against 50 is the term, not the exponent.
    Neuron::SetCalcParams(INPUT_SUM, ACT_SIGM, OUTPUT_NONE, 1.0, 5.0, 0.0);
    Neuron::flat_spot_elimination = false;
    Neuron::calcVec(layer, std::vector<double>{0.0}, output);
    Neuron::Act_AblVec(layer, output);
    CHECK(output[0] == 0.0);
    Neuron::calcVec(layer, std::vector<double>{2.0}, output);
    Neuron::Act_AblVec(layer, output);
    CHECK(output[0] == doctest::Approx(0.0451766597));
}

TEST_CASE("The hyperbolic tangent of huge inputs is not a number and passes its limits") {
    Neuron::SetCalcParams(INPUT_SUM, ACT_TANHYP, OUTPUT_NONE, 1.0, 0.0, 0.0);
    std::vector<Neuron> layer(1, Neuron(1));
    layer[0].mWeights = {1.0};
    std::vector<double> output(1);
    Neuron::calcVec(layer, std::vector<double>{20.0}, output);
    CHECK(output[0] == 1.0);
    Neuron::calcVec(layer, std::vector<double>{-1000.0}, output);
    CHECK(std::isnan(output[0]));
}
