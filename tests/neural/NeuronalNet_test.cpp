// SPDX-License-Identifier: MIT
#include "brindle/neural/NeuronalNet.h"

#include "brindle/theory/Trace.h"
#include "tests/neural/NetForms.h"
#include "tests/support/Expected.h"

#include <doctest/doctest.h>

#include <functional>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

const std::vector<double> kSixWeights = {1.0, 2.0, 3.0, 4.0, 5.0, 6.0};

/// Two inputs, two hidden neurons, one output.
TPredefinedWeights SmallRecord() {
    return {{2, 1}, {1, {2}, {}}, kSixWeights};
}

}  // namespace

TEST_CASE("A net of any type gives its outputs for its inputs") {
    CheckExpected("net_forward",
                  {{"NeuronalNet::use",
                    [](const json& in) {
                        NeuronalNet net = NetOf(in);
                        net.use(in.at(5).get<std::vector<double>>());
                        return json{{"get_outputs", net.get_outputs()}, {"winner", net.winner()}};
                    }}},
                  1e-12);
}

TEST_CASE("A net takes the weights of a record only if the whole shape is its own") {
    struct CCase {
        const char* mProperty;
        std::function<void(TPredefinedWeights&)> mChange;
        bool mIsAcquired;
    };
    const auto neuron = [](TPredefinedWeights& record) -> TNeuronProp& {
        return record.mDynNetProp.mNeuronProp;
    };
    const CCase cases[] = {
        {"none", [](auto&) {}, true},
        {"a size of no layer", [](auto& r) { r.mDynNetProp.mHiddenLayerSizes[3] = 7; }, true},
        {"inputs", [](auto& r) { r.mFixedNetProp.mInputNeuronCount = 3; }, false},
        {"outputs", [](auto& r) { r.mFixedNetProp.mOutputNeuronCount = 2; }, false},
        {"hidden layers", [](auto& r) { r.mDynNetProp.mHiddenLayerCount = 2; }, false},
        {"hidden layer size", [](auto& r) { r.mDynNetProp.mHiddenLayerSizes[0] = 3; }, false},
        {"input type", [&](auto& r) { neuron(r).mInputType = INPUT_AVG; }, false},
        {"activation", [&](auto& r) { neuron(r).mActType = ACT_LIN; }, false},
        {"slope", [&](auto& r) { neuron(r).mActivationSlope = 2.0; }, false},
        {"threshold", [&](auto& r) { neuron(r).mActivationThreshold = 1.0; }, false},
        {"output type", [&](auto& r) { neuron(r).mOutputType = OUTPUT_BIN; }, false},
        {"output threshold", [&](auto& r) { neuron(r).mOutputThreshold = 1.0; }, false},
    };
    for (const CCase& test : cases) {
        CAPTURE(test.mProperty);
        NeuronalNet net(SmallRecord().mFixedNetProp, SmallRecord().mDynNetProp);
        const std::vector<double> before = net.get_weights();
        TPredefinedWeights record = SmallRecord();
        test.mChange(record);
        CHECK(net.acquire_weights(record) == test.mIsAcquired);
        CHECK(net.get_weights() == (test.mIsAcquired ? kSixWeights : before));
    }
}

TEST_CASE("Weights come neuron by neuron, the layers from the input to the output") {
    NeuronalNet net(2, std::vector<int>{2}, 1, INPUT_SUM, ACT_IDENT, 1.0, 0.0, OUTPUT_NONE, 0.0);
    CHECK(net.acquire_weights({net.get_fixed_net_prop(), net.get_dyn_net_prop(), kSixWeights}));
    net.use({10.0, 1.0});
    // Hidden: 1 * 10 + 2 * 1 and 3 * 10 + 4 * 1; output: 5 * 12 + 6 * 34.
    CHECK(net.get_outputs() == std::vector<double>{264.0});
}

TEST_CASE("Weights that a record lacks stay") {
    NeuronalNet net(SmallRecord());
    CHECK(net.get_weights() == kSixWeights);
    const std::vector<double> two = {-1.0, -2.0};
    CHECK(net.acquire_weights({SmallRecord().mFixedNetProp, SmallRecord().mDynNetProp, two}));
    CHECK(net.get_weights() == std::vector<double>{-1.0, -2.0, 3.0, 4.0, 5.0, 6.0});
    CHECK(NeuronalNet(SmallRecord(), two).get_weights()[1] == -2.0);
}

TEST_CASE("The last net that is built decides how all nets calculate, a copy does not") {
    const std::vector<double> one = {1.0};
    const TFixedNetProp ends{1, 1};
    const auto record = [&](ACT_TYPE type) {
        return TPredefinedWeights{
            ends, {0, {}, {INPUT_SUM, type, 1.0, 0.0, OUTPUT_NONE, 0.0}}, one};
    };
    NeuronalNet identity(record(ACT_IDENT));
    identity.use({0.0});
    CHECK(identity.get_outputs()[0] == 0.0);

    NeuronalNet logistic(record(ACT_SIGM));
    NeuronalNet copy = identity;
    copy.use({0.0});
    CHECK(copy.get_outputs()[0] == 0.5);
    CHECK(identity.get_outputs()[0] == 0.0);
    CHECK(copy.get_dyn_net_prop().mNeuronProp.mActType == ACT_IDENT);
}

TEST_CASE("Impossible counts make a smaller net, and short inputs leave the others") {
    const std::vector<int> tooMany(9, 2);
    NeuronalNet deep(2, tooMany, 1, INPUT_SUM, ACT_SIGM, 1.0, 0.0, OUTPUT_NONE, 0.0);
    CHECK(deep.get_dyn_net_prop().mHiddenLayerCount == kMaxHiddenLayers);

    NeuronalNet empty({-3, -1}, {-1, {}, {}});
    empty.use({1.0, 2.0});
    CHECK(empty.get_outputs().empty());
    CHECK(empty.winner() == 0);
    CHECK(empty.get_input_neuron_count() == 0);

    NeuronalNet sum(2, {}, 1, INPUT_SUM, ACT_IDENT, 1.0, 0.0, OUTPUT_NONE, 0.0);
    const std::vector<double> ones = {1.0, 1.0};
    CHECK(sum.acquire_weights({sum.get_fixed_net_prop(), sum.get_dyn_net_prop(), ones}));
    sum.use({3.0, 4.0});
    sum.use({5.0});
    CHECK(sum.get_outputs()[0] == 9.0);
}

TEST_CASE("An output from the threshold upwards becomes 1") {
    NeuronalNet net(1, {}, 1, INPUT_SUM, ACT_SIGM, 1.0, 0.0, OUTPUT_BIN, 0.5);
    net.use({0.0});
    CHECK(net.get_outputs()[0] == 1.0);
    net.use({-0.001});
    CHECK(net.get_outputs()[0] == 0.0);
}

TEST_CASE("The trace names the shape of a net") {
    CHECK(TraceString(NeuronalNet(SmallRecord())) ==
          "Neuronal Net Trace\n"
          "Fixed Network Properties:\n"
          "input count: 2\n"
          "output count: 1\n"
          "Dynamic Network Properties: \n"
          "Hidden Layers: 1\n"
          "( 2 )\n"
          "Neuron Properties: \n"
          "Input Type: 0\n"
          "Activation Type: 0\n"
          "Activation Slope: 1\n"
          "Activation Threshold: 0\n"
          "Output Type: 0\n"
          "Output Threshold: 0\n"
          "End Neuronal Net Trace\n"
          "----------------------\n");
}
