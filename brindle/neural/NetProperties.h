// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstdint>
#include <span>
#include <string>
#include <vector>

namespace brindle {

/// How a neuron joins its inputs x and weights w into its net input.
enum INPUT_TYPE : std::uint8_t {
    INPUT_SUM = 0,   ///< sum of w[i] * x[i]
    INPUT_MIN = 1,   ///< the least x[i]; weights are not used
    INPUT_MAX = 2,   ///< the greatest x[i]; weights are not used
    INPUT_AVG = 3,   ///< sum of w[i] * x[i], divided by the number of inputs
    INPUT_PROD = 4,  ///< product of all w[i] * x[i]
};

/// How excited a neuron gets by a net input y, with threshold t and slope s.
enum ACT_TYPE : std::uint8_t {
    ACT_SIGM = 0,    ///< logistic, 0 to 1: 1 / (1 + exp((t - y) * s))
    ACT_LIN = 1,     ///< ramp, -1 to 1: y - t, between 0 and 1 times s
    ACT_TANHYP = 2,  ///< hyperbolic tangent of (y - t) * s, -1 to 1
    ACT_IDENT = 3,   ///< y itself, no threshold, no limit
};

/// What a neuron hands on.
enum OUTPUT_TYPE : std::uint8_t {
    OUTPUT_NONE = 0,  ///< the activation itself
    OUTPUT_BIN = 1,   ///< 1.0 from the output threshold upwards, else 0.0
};

/// No net has more hidden layers than this.
inline constexpr int kMaxHiddenLayers = 5;

/// What all neurons of a net have in common.
struct TNeuronProp {
    INPUT_TYPE mInputType = INPUT_SUM;
    ACT_TYPE mActType = ACT_SIGM;
    double mActivationSlope = 1.0;
    double mActivationThreshold = 0.0;
    OUTPUT_TYPE mOutputType = OUTPUT_NONE;
    double mOutputThreshold = 0.0;

    friend constexpr bool operator==(const TNeuronProp&, const TNeuronProp&) = default;
};

/// The two ends of a net, which the task fixes.
struct TFixedNetProp {
    int mInputNeuronCount = 0;
    int mOutputNeuronCount = 0;

    friend constexpr bool operator==(const TFixedNetProp&, const TFixedNetProp&) = default;
};

/// What stands between the ends of a net and may be tried out.
struct TDynNetProp {
    int mHiddenLayerCount = 0;                                 ///< 0 to kMaxHiddenLayers
    std::array<int, kMaxHiddenLayers> mHiddenLayerSizes = {};  ///< neurons, from the input on
    TNeuronProp mNeuronProp;

    friend constexpr bool operator==(const TDynNetProp&, const TDynNetProp&) = default;
};

/// A net as a constant: its shape and, in the order of NeuronalNet::get_weights, its weights.
/// The weights are borrowed and must live as long as the record is used.
struct TPredefinedWeights {
    TFixedNetProp mFixedNetProp;
    TDynNetProp mDynNetProp;
    std::span<const double> mWeights;
};

/// An example to learn from: what goes in and what should come out.
struct training_pattern {
    std::vector<double> mInputs;
    std::vector<double> mOutputs;
    int mTag = 0;  ///< for the caller's own use; training does not read it
    std::string mTellingName;
};

}  // namespace brindle
