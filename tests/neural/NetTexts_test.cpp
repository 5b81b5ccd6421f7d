// SPDX-License-Identifier: MIT
#include "brindle/neural/NeuronalNet.h"

#include "tests/neural/PrintedText.h"

#include "brindle/neural/ChordAnalysisNeuronalNet.h"
#include "brindle/theory/Trace.h"

#include <doctest/doctest.h>

#include <cmath>
#include <cstdio>
#include <filesystem>
#include <fstream>
#include <sstream>

using namespace brindle;
using namespace brindle::test;

namespace {

const std::vector<double> kWeights = {0.125, -204.25, 1e-7, 12.8459, 3.0, 1234567.0};

NeuronalNet SmallNet() {
    return NeuronalNet({{2, 1}, {1, {2}, {}}, kWeights});
}

/// What a net of 2 inputs, 2 hidden neurons and 1 output becomes by a property text.
NeuronalNet WithProperties(const std::string& text, bool isBuilt = true) {
    const PrintedText printed;
    NeuronalNet net = SmallNet();
    std::istringstream stream(text);
    CHECK(net.load_net_properties(stream) == isBuilt);
    return net;
}

std::vector<double> LoadedWeights(const std::string& text) {
    const PrintedText printed;
    NeuronalNet net = SmallNet();
    std::istringstream stream(text);
    net.load_weights(stream);
    return net.get_weights();
}

}  // namespace

TEST_CASE("The report tells the shape, the failures and the weights in all three forms") {
    NeuronalNet net({{2, 1}, {1, {2}, {INPUT_AVG, ACT_LIN, 0.5, 2.0, OUTPUT_BIN, 0.25}}, kWeights});
    const std::vector<training_pattern> patterns = {{{1.0, 0.5}, {1.0}, 0, "right"}};
    CHECK(net.weights_to_text(7, 0.125, 0.01, patterns) ==
          "Network Properties\n"
          "------------------\n"
          "Number Input Neurons: 2\n"
          "Number Output Neurons: 1\n"
          "Number Hidden Layers: 1\n"
          "Number Neurons in Hidden Layer 0: 2\n"
          "Type of Input Function: Average\n"
          "Type of Activation Function: Linear, Threshold: 2, Slope: 0.5\n"
          "Type of Output Function: Binary, Threshold: 0.25\n"
          "Overall Error generated: 0.125\n"
          "Cycles: 7\n"
          "The following 0 patterns (out of 1) were not recognized correctly by the net: \n"
          "Neuron Connection Weights\n"
          "-------------------------\n"
          "Hidden Layer 0, Neuron 0: 0.125 -204.25 \n"
          "Hidden Layer 0, Neuron 1: 1e-07 12.8459 \n"
          "Output Layer Neuron 0: 3 1.23457e+06 \n"
          "static double weight_definitions[] =\n"
          "{\n"
          "\t0.125,\n\t-204.25,\n\t1e-07,\n\t12.8459,\n\t3,\n\t1.23457e+06,\n"
          "};\n"
          "\n"
          "static TPredefinedWeights weights = \n"
          "{\n"
          "\t{\n"
          "\t\t2,\t\t// Number Input Neuron \n"
          "\t\t1,\t\t// Number Output Neurons \n"
          "\t},\n"
          "\t{\n"
          "\t\t1,\t\t// Number Hidden Layers \n"
          "\t\t{ 2, 0, 0, 0, 0 },\t\t\t\t// Number Neurons per Hidden Layer\n"
          "\t\t{\n"
          "\t\t\tINPUT_AVG,\n"
          "\t\t\tACT_LIN, 0.5, 2,\t// Activation Function Parameters\n"
          "\t\t\tOUTPUT_BIN, 0.25\t\t\t// Output Funcction Parameters\n"
          "\t\t}\n"
          "\t},\n"
          "\t\t\tweight_definitions \n"
          "};\n"
          "\n"
          "2\t// Number Input Neurons\n"
          "1\t// Number Output Neurons\n"
          "1\t // Number Hidden Layers\n"
          "2\t// Number Neurons in Hidden Layer 0\n"
          "INPUT_AVG\t\t// Type of Input Function\n"
          "ACT_LIN \t\t// Type of Activation Function\n"
          "2\t// Activation Threshold\n"
          "0.5\t\t// Activation Slope\n"
          "OUTPUT_BIN\t\t// Type of Output Function\n"
          "0.25\t\t// Output Threshold\n"
          "weight definitions\n"
          "0.125\n-204.25\n1e-07\n12.8459\n3\n1.23457e+06\n");
}

TEST_CASE("The report lists the patterns that the net gets wrong") {
    NeuronalNet net(2, {}, 2, INPUT_SUM, ACT_IDENT, 1.0, 0.0, OUTPUT_NONE, 0.0);
    const std::vector<double> swapped = {0.0, 1.0, 1.0, 0.0};
    CHECK(net.acquire_weights({net.get_fixed_net_prop(), net.get_dyn_net_prop(), swapped}));
    const std::string text =
        net.weights_to_text(0, 0.0, 0.0,
                            {{{0.0, 1.0}, {1.0, 0.0}, 0, "as wanted"},
                             {{1.0, 0.5}, {1.0, 0.0}, 0, "the wrong way round"}});
    CHECK(text.find("The following 1 patterns (out of 2) were not recognized correctly by the net: "
                    "\npattern #1\nInputs: 1 0.5 \nOutputs: 1 0 \n"
                    "Telling Name: the wrong way round\nNeuron") != std::string::npos);
    CHECK(text.find("Type of Activation Function: Ident. Projection, ") != std::string::npos);
    CHECK(text.find("\t\t\tOUTPUT_NONE, 0\t\t\t\t\t\t// Output Function Parameters\n") !=
          std::string::npos);
}

TEST_CASE("A net can be rebuilt from its report to six digits") {
    const std::string path =
        (std::filesystem::temp_directory_path() / "brindle_net_report_test.txt").string();
    NeuronalNet net(
        {{2, 1}, {1, {2}, {INPUT_PROD, ACT_TANHYP, 0.5, 2.0, OUTPUT_BIN, 0.25}}, kWeights});
    std::ofstream(path) << net.weights_to_text(7, 0.125, 0.01, {});

    NeuronalNet loaded(TFixedNetProp{5, 5}, TDynNetProp{});
    const PrintedText printed;
    CHECK(loaded.load_net_properties_from_file(path.c_str()));
    CHECK(loaded.load_weights_from_file(path.c_str()));
    CHECK(loaded.get_fixed_net_prop() == net.get_fixed_net_prop());
    CHECK(loaded.get_dyn_net_prop() == net.get_dyn_net_prop());
    CHECK(Neuron::combined_type == (ACT_TANHYP + OUTPUT_BIN * 4) * 5 + INPUT_PROD);
    CHECK(loaded.get_weights() ==
          std::vector<double>{0.125, -204.25, 1e-7, 12.8459, 3.0, 1.23457e6});
    CHECK(printed.Text() ==
          "Number Output Neurons erkannt!\n"  // in the source form
          "Number Hidden Layers erkannt!\n"
          "Number Input Neurons erkannt!\n"
          "Number Output Neurons erkannt!\n"
          "Number Hidden Layers erkannt!\n"
          "Number Neurons Hidden Layers erkannt!\n"
          "Type of Input Function erkannt!\n"
          "Type of Activation Function erkannt!\n"
          "Activation Threshold erkannt!\n"
          "Activation Slope erkannt!\n"
          "Type of Output Function erkannt!\n"
          "Output Threshold erkannt!\n"
          "weight 0, 0.125000\n"
          "weight 1, -204.250000\n"
          "weight 2, 0.000000\n"
          "weight 3, 12.845900\n"
          "weight 4, 3.000000\n"
          "weight 5, 1234570.000000\n");
    std::remove(path.c_str());
}

TEST_CASE("A file that cannot be opened leaves the net as it is") {
    const std::string folder = std::filesystem::temp_directory_path().string();
    for (const char* path :
         {static_cast<const char*>(nullptr), "", "/no/such/file", folder.c_str()}) {
        NeuronalNet net = SmallNet();
        CHECK_FALSE(net.load_net_properties_from_file(path));
        CHECK_FALSE(net.load_weights_from_file(path));
        CHECK(net.get_weights() == kWeights);
    }
}

TEST_CASE("Properties that are missing or unknown stay, the last of equal ones wins") {
    const NeuronalNet net = WithProperties(
        "4 // Number Input Neurons\r\n"
        "a remark\n"
        "9 // Number of Something\n"
        "INPUT_NONE // Type of Input Function\n"
        "  ACT_LIN  //  Type of Activation Function  \n"
        "0,5 // Activation Slope\n"
        "1.5e1x // Activation Threshold\n"
        "3 // Number Neurons in Hidden Layer 0\n"
        "7 // Number Neurons in Hidden Layer 0\n"
        "8 // Number Neurons in Hidden Layer 4\n" +
        std::string(600, ' ') + "6 // Number Input Neurons");
    const TDynNetProp& properties = net.get_dyn_net_prop();
    CHECK(net.get_fixed_net_prop() == TFixedNetProp{6, 1});
    CHECK(properties.mHiddenLayerCount == 1);
    CHECK(properties.mHiddenLayerSizes[0] == 7);
    CHECK(properties.mNeuronProp == TNeuronProp{INPUT_SUM, ACT_LIN, 0.0, 15.0, OUTPUT_NONE, 0.0});
}

TEST_CASE("Files that ask for too much are refused, impossible counts are mended") {
    for (const char* text : {
             "99999999999999999999 // Number Input Neurons\n",
             "65537 // Number Output Neurons\n0 // Number Hidden Layers\n",
             "60000 // Number Neurons in Hidden Layer 0\n60000 // Number Input Neurons\n",
             "5 // Number Hidden Layers\n70000 // Number Neurons in Hidden Layer 3\n",
         }) {
        CAPTURE(text);
        CHECK(WithProperties(text, false).get_weights() == kWeights);
    }
    const NeuronalNet net = WithProperties(
        "-5 // Number Input Neurons\n-99999999999999999999 // Number Hidden Layers\n"
        "x // Number Output Neurons\n");
    CHECK(net.get_weights().empty());
    CHECK(WithProperties("70 // Number Hidden Layers\n").get_dyn_net_prop().mHiddenLayerCount ==
          kMaxHiddenLayers);
}

TEST_CASE("Weights are read behind their heading, a short file leaves the others") {
    struct CCase {
        std::string mText;
        std::vector<double> mWeights;
    };
    const CCase cases[] = {
        {"1\n2\n3\n", kWeights},
        {"weight definitions:\n1\n", kWeights},
        {"1\nweight definitions\n9\n-8.5e0 and a remark",
         {9.0, -8.5, 1e-7, 12.8459, 3.0, 1234567.0}},
        {"weight definitions\r\n1\r\n\r\n3", {1.0, 0.0, 3.0, 12.8459, 3.0, 1234567.0}},
        {"weight definitions\n1\n2\n3\n4\n5\n6\n7\n", {1.0, 2.0, 3.0, 4.0, 5.0, 6.0}},
        {"weight definitions\n" + std::string(499, ' ') + "71\n",
         {7.0, 1.0, 1e-7, 12.8459, 3.0, 1234567.0}},
    };
    for (const CCase& test : cases) {
        CAPTURE(test.mText);
        CHECK(LoadedWeights(test.mText) == test.mWeights);
    }
    CHECK(std::isinf(LoadedWeights("weight definitions\n1e999\n")[0]));
}

TEST_CASE("A net keeps what its training was told, and traces itself") {
    NeuronalNet net(ChordAnalysisNeuronalNet);
    net.set_momentum_amount(0.25);
    net.set_cycle_limit(12);
    CHECK(net.get_momentum_amount() == 0.25);
    CHECK(net.get_cycle_limit() == 12);
    const PrintedText printed;
    net.trace();
    CHECK(printed.Text() == TraceString(net));
}
