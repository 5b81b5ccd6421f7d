// SPDX-License-Identifier: MIT
#include "brindle/neural/NeuronalNet.h"
#include "brindle/neural/internal/NetTexts.h"

#include <fmt/core.h>

#include <iostream>
#include <utility>

namespace brindle {

namespace {

template <std::size_t size>
CNetTypeWords WordsOf(const std::array<CNetTypeWords, size>& table, std::size_t type) {
    return type < size ? table[type] : CNetTypeWords{};
}

/// A text that grows by formatted pieces.
class CNetText {
public:
    template <class... Args>
    void Add(fmt::format_string<const Args&...> format, const Args&... args) {
        mText += fmt::format(format, args...);
    }
    /// Numbers as a stream writes them by default, a blank behind each.
    void AddNumbers(const std::vector<double>& numbers) {
        for (const double number : numbers) Add("{:g} ", number);
        mText += '\n';
    }
    std::string mText;
};

void AddProperties(CNetText& text, const TFixedNetProp& fixedProp, const TDynNetProp& dynProp) {
    text.Add("Network Properties\n------------------\n");
    text.Add("Number Input Neurons: {}\n", fixedProp.mInputNeuronCount);
    text.Add("Number Output Neurons: {}\n", fixedProp.mOutputNeuronCount);
    text.Add("Number Hidden Layers: {}\n", dynProp.mHiddenLayerCount);
    for (int layer = 0; layer < dynProp.mHiddenLayerCount; ++layer) {
        text.Add("Number Neurons in Hidden Layer {}: {}\n", layer,
                 dynProp.mHiddenLayerSizes[static_cast<std::size_t>(layer)]);
    }
    const TNeuronProp& neuron = dynProp.mNeuronProp;
    text.Add("Type of Input Function: {}\n", WordsOf(kInputTypeWords, neuron.mInputType).mReport);
    text.Add("Type of Activation Function: {}, Threshold: {:g}, Slope: {:g}\n",
             WordsOf(kActTypeWords, neuron.mActType).mReport, neuron.mActivationThreshold,
             neuron.mActivationSlope);
    text.Add("Type of Output Function: {}", WordsOf(kOutputTypeWords, neuron.mOutputType).mReport);
    if (neuron.mOutputType == OUTPUT_BIN) text.Add(", Threshold: {:g}", neuron.mOutputThreshold);
    text.Add("\n");
}

void AddFailures(CNetText& text, const std::vector<training_pattern>& patterns,
                 const std::vector<std::size_t>& failures) {
    text.Add("The following {} patterns (out of {}) were not recognized correctly by the net: \n",
             failures.size(), patterns.size());
    for (const std::size_t index : failures) {
        text.Add("pattern #{}\nInputs: ", index);
        text.AddNumbers(patterns[index].mInputs);
        text.Add("Outputs: ");
        text.AddNumbers(patterns[index].mOutputs);
        text.Add("Telling Name: {}\n", patterns[index].mTellingName);
    }
}

void AddWeights(CNetText& text, const std::vector<std::vector<Neuron>>& layers) {
    text.Add("Neuron Connection Weights\n-------------------------\n");
    for (std::size_t layer = 0; layer < layers.size(); ++layer) {
        for (std::size_t neuron = 0; neuron < layers[layer].size(); ++neuron) {
            if (layer + 1 < layers.size()) {
                text.Add("Hidden Layer {}, Neuron {}: ", layer, neuron);
            } else {
                text.Add("Output Layer Neuron {}: ", neuron);
            }
            text.AddNumbers(layers[layer][neuron].mWeights);
        }
    }
}

void AddNeuronSourceForm(CNetText& text, const TNeuronProp& neuron) {
    text.Add("\t\t{{\n\t\t\t{},\n", WordsOf(kInputTypeWords, neuron.mInputType).mSource);
    text.Add("\t\t\t{}, {:g}, {:g},\t// Activation Function Parameters\n",
             WordsOf(kActTypeWords, neuron.mActType).mSource, neuron.mActivationSlope,
             neuron.mActivationThreshold);
    if (neuron.mOutputType == OUTPUT_BIN) {
        // Kept: the label of this form is misspelled.
        text.Add("\t\t\tOUTPUT_BIN, {:g}\t\t\t// Output Funcction Parameters\n",
                 neuron.mOutputThreshold);
    } else {
        text.Add("\t\t\tOUTPUT_NONE, 0\t\t\t\t\t\t// Output Function Parameters\n");
    }
    text.Add("\t\t}}\n");
}

void AddSourceForm(CNetText& text, const TPredefinedWeights& net) {
    text.Add("static double weight_definitions[] =\n{{\n");
    for (const double weight : net.mWeights) text.Add("\t{:g},\n", weight);
    text.Add("}};\n\nstatic TPredefinedWeights weights = \n{{\n");
    text.Add("\t{{\n\t\t{},\t\t// Number Input Neuron \n", net.mFixedNetProp.mInputNeuronCount);
    text.Add("\t\t{},\t\t// Number Output Neurons \n\t}},\n", net.mFixedNetProp.mOutputNeuronCount);
    text.Add("\t{{\n\t\t{},\t\t// Number Hidden Layers \n\t\t{{",
             net.mDynNetProp.mHiddenLayerCount);
    const char* separator = " ";
    for (const int size : net.mDynNetProp.mHiddenLayerSizes) {
        text.Add("{}{}", separator, size);
        separator = ", ";
    }
    text.Add(" }},\t\t\t\t// Number Neurons per Hidden Layer\n");
    AddNeuronSourceForm(text, net.mDynNetProp.mNeuronProp);
    text.Add("\t}},\n\t\t\tweight_definitions \n}};\n\n");
}

void AddPropertyForm(CNetText& text, const TPredefinedWeights& net) {
    const TDynNetProp& dynProp = net.mDynNetProp;
    text.Add("{}\t// Number Input Neurons\n", net.mFixedNetProp.mInputNeuronCount);
    text.Add("{}\t// Number Output Neurons\n", net.mFixedNetProp.mOutputNeuronCount);
    text.Add("{}\t // Number Hidden Layers\n", dynProp.mHiddenLayerCount);
    for (int layer = 0; layer < dynProp.mHiddenLayerCount; ++layer) {
        text.Add("{}\t// Number Neurons in Hidden Layer {}\n",
                 dynProp.mHiddenLayerSizes[static_cast<std::size_t>(layer)], layer);
    }
    const TNeuronProp& neuron = dynProp.mNeuronProp;
    text.Add("{}\t\t// Type of Input Function\n",
             WordsOf(kInputTypeWords, neuron.mInputType).mSource);
    text.Add("{} \t\t// Type of Activation Function\n",
             WordsOf(kActTypeWords, neuron.mActType).mSource);
    text.Add("{:g}\t// Activation Threshold\n", neuron.mActivationThreshold);
    text.Add("{:g}\t\t// Activation Slope\n", neuron.mActivationSlope);
    text.Add("{}\t\t// Type of Output Function\n",
             WordsOf(kOutputTypeWords, neuron.mOutputType).mSource);
    text.Add("{:g}\t\t// Output Threshold\n", neuron.mOutputThreshold);
    text.Add("{}\n", kWeightDefinitionsLine);
    for (const double weight : net.mWeights) text.Add("{:g}\n", weight);
}

}  // namespace

std::string NeuronalNet::weights_to_text(int cycles, double overallError,
                                         [[maybe_unused]] double learningFactor,
                                         const std::vector<training_pattern>& patterns) {
    std::vector<std::size_t> failures;
    batch_verify(patterns, &failures);
    const std::vector<double> weights = get_weights();
    const TPredefinedWeights net{mFixedNetProp, mDynNetProp, weights};

    CNetText text;
    AddProperties(text, mFixedNetProp, mDynNetProp);
    text.Add("Overall Error generated: {:g}\nCycles: {}\n", overallError, cycles);
    AddFailures(text, patterns, failures);
    AddWeights(text, mLayers);
    AddSourceForm(text, net);
    AddPropertyForm(text, net);
    return std::move(text.mText);
}

void NeuronalNet::trace() const {
    std::cout << *this;
}

std::ostream& operator<<(std::ostream& stream, const NeuronalNet& net) {
    const TNeuronProp& neuron = net.mDynNetProp.mNeuronProp;
    CNetText text;
    text.Add("Neuronal Net Trace\nFixed Network Properties:\n");
    text.Add("input count: {}\n", net.mFixedNetProp.mInputNeuronCount);
    text.Add("output count: {}\n", net.mFixedNetProp.mOutputNeuronCount);
    text.Add("Dynamic Network Properties: \n");
    text.Add("Hidden Layers: {}\n( ", net.mDynNetProp.mHiddenLayerCount);
    for (int layer = 0; layer < net.mDynNetProp.mHiddenLayerCount; ++layer) {
        text.Add("{} ", net.mDynNetProp.mHiddenLayerSizes[static_cast<std::size_t>(layer)]);
    }
    text.Add(")\nNeuron Properties: \n");
    text.Add("Input Type: {}\n", static_cast<int>(neuron.mInputType));
    text.Add("Activation Type: {}\n", static_cast<int>(neuron.mActType));
    text.Add("Activation Slope: {:g}\n", neuron.mActivationSlope);
    text.Add("Activation Threshold: {:g}\n", neuron.mActivationThreshold);
    text.Add("Output Type: {}\n", static_cast<int>(neuron.mOutputType));
    text.Add("Output Threshold: {:g}\n", neuron.mOutputThreshold);
    text.Add("End Neuronal Net Trace\n----------------------\n");
    return stream << text.mText;
}

}  // namespace brindle
