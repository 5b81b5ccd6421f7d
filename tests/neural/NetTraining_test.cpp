// SPDX-License-Identifier: MIT
#include "tests/neural/NetForms.h"
#include "tests/neural/PrintedText.h"
#include "tests/support/Expected.h"

#include <doctest/doctest.h>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

json Trained(const json& in) {
    NeuronalNet net = NetOf(in);
    net.set_learning_factor(in.at(5).get<double>());
    net.set_momentum_amount(in.at(6).get<double>());
    NeuronalNet::enable_flat_spot_elimination(in.at(7).get<bool>());
    json errors = json::array();
    training_pattern pattern;
    for (const json& form : in.at(8)) {
        pattern.mInputs = form.at(0).get<std::vector<double>>();
        pattern.mOutputs = form.at(1).get<std::vector<double>>();
        errors.push_back(net.train(pattern));
    }
    return {{"train", errors},
            {"get_weights", net.get_weights()},
            {"getRMS", net.getRMS(pattern.mOutputs)}};
}

/// "Both or neither": no net without a hidden layer can learn it.
const std::vector<training_pattern> kBothOrNeither = {
    {{1.0, 0.0, 0.0}, {1.0, 0.0}, 0, "neither"},
    {{1.0, 0.0, 1.0}, {0.0, 1.0}, 0, "second"},
    {{1.0, 1.0, 0.0}, {0.0, 1.0}, 0, "first"},
    {{1.0, 1.0, 1.0}, {1.0, 0.0}, 0, "both"},
};

NeuronalNet NewNet(std::vector<int> hidden) {
    Neuron::random_source = SeededRandom{1};
    return {3, hidden, 2, INPUT_SUM, ACT_SIGM, 1.0, 0.0, OUTPUT_NONE, 0.0};
}

}  // namespace

TEST_CASE("A step of training moves the weights against the error") {
    CheckExpected("net_training", {{"NeuronalNet::train", Trained}}, 1e-12);
}

TEST_CASE("A net with a hidden layer learns what one without cannot, the same way each time") {
    NeuronalNet flat = NewNet({});
    NeuronalNet deep = NewNet({5});
    flat.set_cycle_limit(2000);
    deep.set_cycle_limit(2000);
    const PrintedText printed;
    CHECK(flat.batch_train(kBothOrNeither, 0.5, 0.02) == 2000);
    CHECK(flat.batch_verify(kBothOrNeither) > 0);

    Neuron::random_source = SeededRandom{2};
    const int cycles = deep.batch_train(kBothOrNeither, 0.5, 0.02);
    CHECK(cycles < 2000);
    CHECK(deep.batch_verify(kBothOrNeither) == 0);
    CHECK(deep.getRMS({1.0, 0.0}) < 0.2);

    NeuronalNet again = NewNet({5});
    Neuron::random_source = SeededRandom{2};
    CHECK(again.batch_train(kBothOrNeither, 0.5, 0.02) == cycles);
    CHECK(again.get_weights() == deep.get_weights());
}

TEST_CASE("Training reports each best cycle and how it ended") {
    NeuronalNet net = NewNet({});
    net.set_cycle_limit(1);
    const PrintedText printed;
    CHECK(net.batch_train({}, 0.5, -1.0) == 1);
    CHECK(net.batch_train({}, 0.5, 0.0) == 1);
    net.set_cycle_limit(0);
    CHECK(net.batch_train(kBothOrNeither, 0.25, 0.0) == 0);
    CHECK(net.get_learning_factor() == 0.25);
    CHECK(printed.Text() ==
          "Abgespeichert bei Cycle: 1\nAbbruch bei Cycle 1\nFehler: 0.000000\n"
          "Abgespeichert bei Cycle: 1\nAbbruch bei Cycle 1\nFehler: 0.000000\n"
          "Abbruch bei Cycle 0\nFehler: inf\n");
}

TEST_CASE("Patterns of the wrong length train what is there") {
    NeuronalNet net = NewNet({2});
    const std::vector<double> before = net.get_weights();
    CHECK(net.train({{1.0}, {}, 0, ""}) == 0.0);
    CHECK(net.get_weights() == before);
    CHECK(net.train({{1.0, 1.0, 1.0, 1.0}, {1.0, 1.0, 1.0}, 0, ""}) > 0.0);
    CHECK(net.getRMS({}) == 0.0);
}

TEST_CASE("Equal inputs with different outputs are reported, each pair once") {
    const std::vector<training_pattern> patterns = {
        {{1.0, 0.5}, {1.0}, 0, "C"},     {{0.0, 0.5}, {1.0}, 0, "D"},
        {{1.0, 0.5}, {1.0}, 0, "C too"}, {{0.0, 0.5}, {1.0, 0.0}, 0, "D long"},
        {{1.0, 0.5}, {0.0}, 0, "not C"}, {{1.0}, {0.0}, 0, "short"},
    };
    const PrintedText printed;
    NeuronalNet::check_learn_data_for_duplicates(patterns);
    CHECK(printed.Text() ==
          "Warning: input-pattern 0 (C) and 4 (not C) seem to contain inconsistencies.\n"
          "0 C: \nInput: 1.000000 0.500000 \nOutput: 1.000000 "
          "4 not C: \nInput: 1.000000 0.500000 \nOutput: 0.000000 "
          "Warning: input-pattern 1 (D) and 3 (D long) seem to contain inconsistencies.\n"
          "1 D: \nInput: 0.000000 0.500000 \nOutput: 1.000000 "
          "3 D long: \nInput: 0.000000 0.500000 \nOutput: 1.000000 0.000000 "
          "Warning: input-pattern 2 (C too) and 4 (not C) seem to contain inconsistencies.\n"
          "2 C too: \nInput: 1.000000 0.500000 \nOutput: 1.000000 "
          "4 not C: \nInput: 1.000000 0.500000 \nOutput: 0.000000 ");
}
