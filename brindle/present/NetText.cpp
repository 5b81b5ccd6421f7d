// SPDX-License-Identifier: MIT
#include "brindle/present/NetText.h"

#include "brindle/neural/ChordRootPatterns.h"
#include "brindle/present/JsonValues.h"

#include <nlohmann/json.hpp>
#include <sstream>
#include <vector>

namespace brindle {
namespace {

constexpr int kRootOutputCount = 12;

training_pattern TrainingPattern(const CChordRootPattern& pattern) {
    training_pattern training;
    for (int i = 0; i < kChordRootInputCount; ++i) {
        training.mInputs.push_back((pattern.mInputs >> i & 1) != 0 ? 1.0 : 0.0);
    }
    for (int i = 0; i < kRootOutputCount; ++i) {
        training.mOutputs.push_back(i == pattern.mRootIntvl ? 1.0 : 0.0);
    }
    training.mTellingName = ChordShapes()[pattern.mShape].mName;
    return training;
}

// Every input that a voicing of the usual chords can give.
std::vector<training_pattern> AllPatterns() {
    std::vector<training_pattern> patterns;
    for (const CChordRootPattern& pattern : ChordRootPatterns()) {
        patterns.push_back(TrainingPattern(pattern));
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

}  // namespace

std::string NetText(const NeuronalNet& net) {
    std::ostringstream text;
    text << net;
    return text.str();
}

std::string NetJson(const NeuronalNet& net) {
    return JsonText(PropertiesToJson(net));
}

std::string NetWeightsText(NeuronalNet net) {
    const std::vector<training_pattern> patterns = AllPatterns();
    const double error = OverallError(net, patterns);
    return net.weights_to_text(0, error, net.get_learning_factor(), patterns);
}

std::string NetWeightsJson(NeuronalNet net) {
    const std::vector<training_pattern> patterns = AllPatterns();
    return JsonText({{"Properties", PropertiesToJson(net)},
                     {"PatternCount", patterns.size()},
                     {"FailureCount", net.batch_verify(patterns)},
                     {"Weights", net.get_weights()}});
}

}  // namespace brindle
