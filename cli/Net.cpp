// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"
#include "cli/Json.h"

#include "brindle/neural/ChordAnalysisNeuronalNet.h"
#include "brindle/neural/ChordRootPatterns.h"
#include "brindle/neural/NeuronalNet.h"

#include <fmt/format.h>

#include <memory>
#include <sstream>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kNetHelp{
    "net",
    "Show the neural net that hears the roots of chords",
    "  brindle net trace\n"
    "  brindle net weights >net.txt\n"
    "  brindle net weights --json\n",
};

constexpr CCommandHelp kTraceHelp{
    "trace",
    "Its shape and the properties of its neurons",
    "  brindle net trace\n",
};

constexpr CCommandHelp kWeightsHelp{
    "weights",
    "A report: the patterns that it gets wrong, its weights, and a form that can be loaded",
    "  brindle net weights >net.txt\n",
};

constexpr int kOutputCount = 12;

training_pattern TrainingPattern(const CChordRootPattern& pattern, std::size_t inputCount) {
    training_pattern training;
    for (std::size_t i = 0; i < inputCount; ++i) {
        training.mInputs.push_back((pattern.mInputs >> i & 1) != 0 ? 1.0 : 0.0);
    }
    for (int i = 0; i < kOutputCount; ++i) {
        training.mOutputs.push_back(i == pattern.mRootIntvl ? 1.0 : 0.0);
    }
    training.mTellingName = ChordShapes()[pattern.mShape].mName;
    return training;
}

// Every input that a voicing of the usual chords can give.
std::vector<training_pattern> AllPatterns(const NeuronalNet& net) {
    std::vector<training_pattern> patterns;
    for (const CChordRootPattern& pattern : ChordRootPatterns()) {
        patterns.push_back(
            TrainingPattern(pattern, static_cast<std::size_t>(net.get_input_neuron_count())));
    }
    return patterns;
}

// The sum of squared differences over all patterns.
double OverallError(NeuronalNet& net, const std::vector<training_pattern>& patterns) {
    double error = 0.0;
    for (const training_pattern& pattern : patterns) {
        net.use(pattern.mInputs);
        const double root = net.getRMS(pattern.mOutputs);
        error += root * root;
    }
    return error;
}

Json PropertiesToJson(const NeuronalNet& net) {
    const TDynNetProp& dynProp = net.get_dyn_net_prop();
    const TNeuronProp& neuron = dynProp.mNeuronProp;
    Json layers = Json::array();
    for (int layer = 0; layer < dynProp.mHiddenLayerCount; ++layer) {
        layers.push_back(dynProp.mHiddenLayerSizes[static_cast<std::size_t>(layer)]);
    }
    return {{"InputNeuronCount", net.get_fixed_net_prop().mInputNeuronCount},
            {"OutputNeuronCount", net.get_fixed_net_prop().mOutputNeuronCount},
            {"HiddenLayerSizes", layers},
            {"InputType", static_cast<int>(neuron.mInputType)},
            {"ActivationType", static_cast<int>(neuron.mActType)},
            {"ActivationSlope", neuron.mActivationSlope},
            {"ActivationThreshold", neuron.mActivationThreshold},
            {"OutputType", static_cast<int>(neuron.mOutputType)},
            {"OutputThreshold", neuron.mOutputThreshold}};
}

TStatus PrintTrace(const CFormatOptions& format) {
    const NeuronalNet net(ChordAnalysisNeuronalNet);
    if (format.Format() == TFormat::Json) return Print(JsonText(PropertiesToJson(net)));
    std::ostringstream trace;
    trace << net;
    return Print(trace.str());
}

TStatus PrintWeights(const CFormatOptions& format) {
    NeuronalNet net(ChordAnalysisNeuronalNet);
    const std::vector<training_pattern> patterns = AllPatterns(net);
    if (format.Format() != TFormat::Json) {
        const double error = OverallError(net, patterns);
        return Print(net.weights_to_text(0, error, net.get_learning_factor(), patterns));
    }
    return Print(JsonText({{"Properties", PropertiesToJson(net)},
                           {"PatternCount", patterns.size()},
                           {"FailureCount", net.batch_verify(patterns)},
                           {"Weights", net.get_weights()}}));
}

using TPrinter = TStatus (*)(const CFormatOptions& format);

void AddPrinter(CCommand& net, const CCommandHelp& help, TPrinter print) {
    CCommand& command = net.AddCommand(help);
    const auto format = std::make_shared<CFormatOptions>();
    format->AddTo(command, {"text", "json"});
    command.OnCall([format, print] { return print(*format); });
}

}  // namespace

void AddNet(CCommand& program) {
    CCommand& command = program.AddCommand(kNetHelp);
    AddPrinter(command, kTraceHelp, PrintTrace);
    AddPrinter(command, kWeightsHelp, PrintWeights);
}

}  // namespace brindle::cli
