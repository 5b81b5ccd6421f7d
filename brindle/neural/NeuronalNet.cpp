// SPDX-License-Identifier: MIT
#include "brindle/neural/NeuronalNet.h"

#include <algorithm>

namespace brindle {

namespace {

TDynNetProp DynNetProp(std::span<const int> hiddenSizes, const TNeuronProp& neuronProp) {
    TDynNetProp result;
    const std::size_t count = std::min<std::size_t>(hiddenSizes.size(), kMaxHiddenLayers);
    result.mHiddenLayerCount = static_cast<int>(count);
    std::copy_n(hiddenSizes.begin(), count, result.mHiddenLayerSizes.begin());
    result.mNeuronProp = neuronProp;
    return result;
}

/// The properties as the net can have them: no negative counts, not too many layers, and 0 as the
/// size of layers that are not there.
TDynNetProp Possible(TDynNetProp properties) {
    properties.mHiddenLayerCount = std::clamp(properties.mHiddenLayerCount, 0, kMaxHiddenLayers);
    for (int layer = 0; layer < kMaxHiddenLayers; ++layer) {
        int& size = properties.mHiddenLayerSizes[static_cast<std::size_t>(layer)];
        size = layer < properties.mHiddenLayerCount ? std::max(size, 0) : 0;
    }
    return properties;
}

TFixedNetProp Possible(const TFixedNetProp& properties) {
    return {std::max(properties.mInputNeuronCount, 0), std::max(properties.mOutputNeuronCount, 0)};
}

}  // namespace

NeuronalNet::NeuronalNet(int inputCount, std::span<const int> hiddenSizes, int outputCount,
                         INPUT_TYPE inputType, ACT_TYPE actType, double slope, double threshold,
                         OUTPUT_TYPE outputType, double outputThreshold)
    : NeuronalNet(TFixedNetProp{inputCount, outputCount},
                  DynNetProp(hiddenSizes,
                             {inputType, actType, slope, threshold, outputType, outputThreshold})) {
}

NeuronalNet::NeuronalNet(const TFixedNetProp& fixedNetProp, const TDynNetProp& dynNetProp) {
    BuildNet(fixedNetProp, dynNetProp);
}

NeuronalNet::NeuronalNet(const TPredefinedWeights& predefined)
    : NeuronalNet(predefined, predefined.mWeights) {}

NeuronalNet::NeuronalNet(const TPredefinedWeights& predefined, std::span<const double> weights)
    : NeuronalNet(predefined.mFixedNetProp, predefined.mDynNetProp) {
    acquire_weights({mFixedNetProp, mDynNetProp, weights});
}

void NeuronalNet::BuildNet(const TFixedNetProp& fixedNetProp, const TDynNetProp& dynNetProp) {
    mFixedNetProp = Possible(fixedNetProp);
    mDynNetProp = Possible(dynNetProp);

    std::vector<int> widths{mFixedNetProp.mInputNeuronCount};
    for (int layer = 0; layer < mDynNetProp.mHiddenLayerCount; ++layer) {
        widths.push_back(mDynNetProp.mHiddenLayerSizes[static_cast<std::size_t>(layer)]);
    }
    widths.push_back(mFixedNetProp.mOutputNeuronCount);

    mLayers.clear();
    std::size_t neuronCount = 0;
    std::size_t weightCount = 0;
    for (std::size_t i = 1; i < widths.size(); ++i) {
        const auto width = static_cast<std::size_t>(widths[i]);
        std::vector<Neuron>& layer = mLayers.emplace_back();
        layer.reserve(width);
        for (std::size_t n = 0; n < width; ++n) layer.emplace_back(widths[i - 1]);
        neuronCount += width;
        weightCount += width * static_cast<std::size_t>(widths[i - 1]);
    }

    const auto widest = static_cast<std::size_t>(*std::max_element(widths.begin(), widths.end()));
    mInput.assign(static_cast<std::size_t>(mFixedNetProp.mInputNeuronCount), 0.0);
    mReadBuffer.assign(widest, 0.0);
    mWriteBuffer.assign(widest, 0.0);
    mDeltas.assign(neuronCount, 0.0);
    mLastChanges.assign(weightCount, 0.0);
    mHasNoEarlierChange = true;

    const TNeuronProp& neuron = mDynNetProp.mNeuronProp;
    Neuron::SetCalcParams(neuron.mInputType, neuron.mActType, neuron.mOutputType,
                          neuron.mActivationSlope, neuron.mActivationThreshold,
                          neuron.mOutputThreshold);
}

void NeuronalNet::use() {
    std::copy(mInput.begin(), mInput.end(), mReadBuffer.begin());
    std::size_t width = mInput.size();
    for (std::vector<Neuron>& layer : mLayers) {
        Neuron::calcVec(layer, std::span(mReadBuffer).first(width), mWriteBuffer);
        std::swap(mReadBuffer, mWriteBuffer);
        width = layer.size();
    }
}

void NeuronalNet::use(const std::vector<double>& inputs) {
    setInput(inputs);
    use();
}

void NeuronalNet::setInput(const std::vector<double>& inputs) {
    std::copy_n(inputs.begin(), std::min(inputs.size(), mInput.size()), mInput.begin());
}

std::vector<double> NeuronalNet::get_outputs() const {
    std::vector<double> result;
    result.reserve(mLayers.back().size());
    for (const Neuron& neuron : mLayers.back()) result.push_back(neuron.mValue);
    return result;
}

std::size_t NeuronalNet::winner() const {
    const std::vector<Neuron>& outputs = mLayers.back();
    const auto best =
        std::max_element(outputs.begin(), outputs.end(),
                         [](const Neuron& a, const Neuron& b) { return a.mValue < b.mValue; });
    return static_cast<std::size_t>(best - outputs.begin());
}

int NeuronalNet::get_input_neuron_count() const {
    return mFixedNetProp.mInputNeuronCount;
}

std::vector<double> NeuronalNet::get_weights() const {
    std::vector<double> result;
    result.reserve(mLastChanges.size());
    for (const std::vector<Neuron>& layer : mLayers) {
        for (const Neuron& neuron : layer) {
            result.insert(result.end(), neuron.mWeights.begin(), neuron.mWeights.end());
        }
    }
    return result;
}

bool NeuronalNet::acquire_weights(const TPredefinedWeights& predefined) {
    if (predefined.mFixedNetProp != mFixedNetProp) return false;
    if (Possible(predefined.mDynNetProp) != mDynNetProp) return false;
    auto weights = predefined.mWeights;
    for (std::vector<Neuron>& layer : mLayers) {
        for (Neuron& neuron : layer) {
            const std::size_t count = std::min(neuron.mWeights.size(), weights.size());
            std::copy_n(weights.begin(), count, neuron.mWeights.begin());
            weights = weights.subspan(count);
        }
    }
    return true;
}

void NeuronalNet::enable_flat_spot_elimination(bool isEnabled) {
    Neuron::flat_spot_elimination = isEnabled;
}

}  // namespace brindle
