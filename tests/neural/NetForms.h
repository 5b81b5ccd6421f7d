// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/neural/NeuronalNet.h"

#include <nlohmann/json.hpp>
#include <vector>

namespace brindle::test {

/// [INPUT_TYPE, ACT_TYPE, slope, threshold, OUTPUT_TYPE, output threshold]
inline TNeuronProp NeuronPropOf(const nlohmann::json& form) {
    return {static_cast<INPUT_TYPE>(form.at(0).get<int>()),
            static_cast<ACT_TYPE>(form.at(1).get<int>()),
            form.at(2).get<double>(),
            form.at(3).get<double>(),
            static_cast<OUTPUT_TYPE>(form.at(4).get<int>()),
            form.at(5).get<double>()};
}

/// [input count, hidden sizes, output count, neuron properties, weights, ...]
inline NeuronalNet NetOf(const nlohmann::json& in) {
    const auto hidden = in.at(1).get<std::vector<int>>();
    const TNeuronProp neuron = NeuronPropOf(in.at(3));
    NeuronalNet net(in.at(0).get<int>(), hidden, in.at(2).get<int>(), neuron.mInputType,
                    neuron.mActType, neuron.mActivationSlope, neuron.mActivationThreshold,
                    neuron.mOutputType, neuron.mOutputThreshold);
    const auto weights = in.at(4).get<std::vector<double>>();
    net.acquire_weights({net.get_fixed_net_prop(), net.get_dyn_net_prop(), weights});
    return net;
}

}  // namespace brindle::test
