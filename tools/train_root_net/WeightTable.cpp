// SPDX-License-Identifier: MIT
#include "tools/train_root_net/WeightTable.h"

#include "brindle/platform/ReadNumber.h"

#include <fmt/format.h>

#include <algorithm>
#include <string_view>

namespace brindle::tools {

namespace {

constexpr std::size_t kValuesPerLine = 8;

constexpr std::string_view kHead = R"(// SPDX-License-Identifier: MIT
// Made by tools/train_root_net, which also tells how well the net does with it: docs/root-net.md.

#include "brindle/neural/ChordAnalysisNeuronalNet.h"

namespace brindle {

// One paragraph for each neuron.
// clang-format off
constinit const std::array<double, 765> weight_definitions = {
)";

constexpr std::string_view kTail = R"(};
// clang-format on

}  // namespace brindle
)";

struct CLayer {
    std::string_view mName;
    std::size_t mNeurons;
    std::size_t mInputs;
};

constexpr CLayer kLayers[] = {
    {"Hidden layer 0: from the notes of two octaves above the lowest.", 15, 24},
    {"Hidden layer 1.", 15, 15},
    {"Output neurons: how many semitones the root is above the lowest note.", 12, 15},
};

std::string NeuronText(std::span<const double> weights) {
    std::string text = "\n";
    for (std::size_t i = 0; i < weights.size(); ++i) {
        text += i % kValuesPerLine == 0 ? "    " : " ";
        text += fmt::format("{:>10}", fmt::format("{:g},", weights[i]));
        if (i % kValuesPerLine == kValuesPerLine - 1 || i + 1 == weights.size()) text += '\n';
    }
    return text;
}

}  // namespace

std::vector<double> RoundedToSixDigits(std::span<const double> weights) {
    std::vector<double> result;
    for (const double weight : weights) result.push_back(ReadDouble(fmt::format("{:g}", weight)));
    return result;
}

std::string WeightTableText(std::span<const double> weights) {
    std::string text(kHead);
    for (const CLayer& layer : kLayers) {
        text += fmt::format("\n    // {}\n", layer.mName);
        for (std::size_t neuron = 0; neuron < layer.mNeurons; ++neuron) {
            text += NeuronText(weights.first(layer.mInputs));
            weights = weights.subspan(layer.mInputs);
        }
    }
    return text + std::string(kTail);
}

}  // namespace brindle::tools
