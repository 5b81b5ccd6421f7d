// SPDX-License-Identifier: MIT
#include "brindle/neural/NeuronalNet.h"
#include "brindle/neural/internal/NetTexts.h"
#include "brindle/platform/Ascii.h"
#include "brindle/platform/ReadNumber.h"

#include <fmt/core.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iostream>
#include <limits>
#include <optional>

namespace brindle {

namespace {

constexpr std::size_t kLongestLine = 500;

/// The next line without its end; a longer one comes in pieces of 500 characters.
std::optional<std::string> ReadLine(std::istream& stream) {
    std::string line;
    char character = 0;
    while (stream.get(character)) {
        if (character == '\n') {
            if (line.ends_with('\r')) line.pop_back();
            return line;
        }
        if (line.size() == kLongestLine) {
            stream.unget();
            return line;
        }
        line += character;
    }
    if (line.empty()) return std::nullopt;
    return line;
}

template <class Type, std::size_t size>
void ReadType(std::string_view value, const std::array<CNetTypeWords, size>& table, Type& type) {
    for (std::size_t i = 0; i < size; ++i) {
        if (table[i].mSource == value) type = static_cast<Type>(i);
    }
}

/// The properties that a file changes.
struct CLoadedProperties {
    TFixedNetProp& mFixed;
    TDynNetProp& mDyn;
    TNeuronProp& mNeuron = mDyn.mNeuronProp;
};

/// How one label of the property form is read.
struct CLabel {
    std::string_view mLabel;
    std::string_view mMessage;  ///< without " erkannt!"
    void (*mRead)(std::string_view value, CLoadedProperties& properties);
};

template <std::size_t layer>
void ReadLayerSize(std::string_view value, CLoadedProperties& properties) {
    properties.mDyn.mHiddenLayerSizes[layer] = ReadInteger(value);
}

constexpr CLabel kLabels[] = {
    {"Number Input Neurons", "Number Input Neurons",
     [](std::string_view value, CLoadedProperties& properties) {
         properties.mFixed.mInputNeuronCount = ReadInteger(value);
     }},
    {"Number Output Neurons", "Number Output Neurons",
     [](std::string_view value, CLoadedProperties& properties) {
         properties.mFixed.mOutputNeuronCount = ReadInteger(value);
     }},
    {"Number Hidden Layers", "Number Hidden Layers",
     [](std::string_view value, CLoadedProperties& properties) {
         properties.mDyn.mHiddenLayerCount = ReadInteger(value);
     }},
    // Kept: the size of a fifth hidden layer is written but not read.
    {"Number Neurons in Hidden Layer 0", "Number Neurons Hidden Layers", ReadLayerSize<0>},
    {"Number Neurons in Hidden Layer 1", "Number Neurons Hidden Layers", ReadLayerSize<1>},
    {"Number Neurons in Hidden Layer 2", "Number Neurons Hidden Layers", ReadLayerSize<2>},
    {"Number Neurons in Hidden Layer 3", "Number Neurons Hidden Layers", ReadLayerSize<3>},
    {"Type of Input Function", "Type of Input Function",
     [](std::string_view value, CLoadedProperties& properties) {
         ReadType(value, kInputTypeWords, properties.mNeuron.mInputType);
     }},
    {"Type of Activation Function", "Type of Activation Function",
     [](std::string_view value, CLoadedProperties& properties) {
         ReadType(value, kActTypeWords, properties.mNeuron.mActType);
     }},
    {"Activation Threshold", "Activation Threshold",
     [](std::string_view value, CLoadedProperties& properties) {
         properties.mNeuron.mActivationThreshold = ReadDouble(std::string(value));
     }},
    {"Activation Slope", "Activation Slope",
     [](std::string_view value, CLoadedProperties& properties) {
         properties.mNeuron.mActivationSlope = ReadDouble(std::string(value));
     }},
    {"Type of Output Function", "Type of Output Function",
     [](std::string_view value, CLoadedProperties& properties) {
         ReadType(value, kOutputTypeWords, properties.mNeuron.mOutputType);
     }},
    {"Output Threshold", "Output Threshold",
     [](std::string_view value, CLoadedProperties& properties) {
         properties.mNeuron.mOutputThreshold = ReadDouble(std::string(value));
     }},
};

void ReadPropertyLine(std::string_view line, CLoadedProperties& properties) {
    const std::size_t split = line.find("//");
    if (split == std::string_view::npos) return;
    const std::string_view label = Ascii::Trimmed(line.substr(split + 2));
    for (const CLabel& known : kLabels) {
        if (known.mLabel != label) continue;
        known.mRead(Ascii::Trimmed(line.substr(0, split)), properties);
        std::cout << known.mMessage << " erkannt!\n";
    }
}

/// Whether the net is of a size that a file may ask for.
bool IsBuildable(const TFixedNetProp& fixedProp, const TDynNetProp& dynProp) {
    std::int64_t weightCount = 0;
    int width = fixedProp.mInputNeuronCount;
    const auto addLayer = [&](int next) {
        const bool isSmall = std::max(width, next) <= NeuronalNet::kMaxLoadedLayerSize;
        if (isSmall) weightCount += std::int64_t{std::max(width, 0)} * std::max(next, 0);
        width = next;
        return isSmall && weightCount <= NeuronalNet::kMaxLoadedWeights;
    };
    const int layerCount = std::clamp(dynProp.mHiddenLayerCount, 0, kMaxHiddenLayers);
    return std::all_of(dynProp.mHiddenLayerSizes.begin(),
                       dynProp.mHiddenLayerSizes.begin() + layerCount, addLayer) &&
           addLayer(fixedProp.mOutputNeuronCount);
}

std::ifstream OpenFile(const char* path) {
    std::error_code ignored;
    if (path == nullptr || std::filesystem::is_directory(path, ignored)) return {};
    return std::ifstream(path, std::ios::binary);
}

}  // namespace

bool NeuronalNet::load_net_properties_from_file(const char* path) {
    std::ifstream file = OpenFile(path);
    return file.is_open() && load_net_properties(file);
}

bool NeuronalNet::load_net_properties(std::istream& stream) {
    TFixedNetProp fixedProp = mFixedNetProp;
    TDynNetProp dynProp = mDynNetProp;
    CLoadedProperties properties{fixedProp, dynProp};
    while (const auto line = ReadLine(stream)) ReadPropertyLine(*line, properties);
    if (!IsBuildable(fixedProp, dynProp)) return false;
    BuildNet(fixedProp, dynProp);
    return true;
}

bool NeuronalNet::load_weights_from_file(const char* path) {
    std::ifstream file = OpenFile(path);
    if (!file.is_open()) return false;
    load_weights(file);
    return true;
}

void NeuronalNet::load_weights(std::istream& stream) {
    std::optional<std::string> line;
    do {
        line = ReadLine(stream);
    } while (line && *line != kWeightDefinitionsLine);

    std::size_t index = 0;
    for (std::vector<Neuron>& layer : mLayers) {
        for (Neuron& neuron : layer) {
            for (double& weight : neuron.mWeights) {
                line = ReadLine(stream);
                if (!line) return;
                weight = ReadDouble(*line);
                std::cout << fmt::format("weight {}, {:f}\n", index++, weight);
            }
        }
    }
}

}  // namespace brindle
