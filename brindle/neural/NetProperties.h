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
    INPUT_TYPE mInputType = INPUT_SUM;      ///< how inputs and weights are joined
    ACT_TYPE mActType = ACT_SIGM;           ///< how excited the result makes it
    double mActivationSlope = 1.0;          ///< the slope s of the activation
    double mActivationThreshold = 0.0;      ///< the threshold t of the activation
    OUTPUT_TYPE mOutputType = OUTPUT_NONE;  ///< what is handed on
    double mOutputThreshold = 0.0;          ///< where OUTPUT_BIN goes over to 1.0

    friend constexpr bool operator==(const TNeuronProp&, const TNeuronProp&) = default;
};

/// The two ends of a net, which the task fixes.
struct TFixedNetProp {
    int mInputNeuronCount = 0;   ///< length of the input vector
    int mOutputNeuronCount = 0;  ///< length of the output vector

    friend constexpr bool operator==(const TFixedNetProp&, const TFixedNetProp&) = default;
};

/// What stands between the ends of a net and may be tried out.
struct TDynNetProp {
    int mHiddenLayerCount = 0;                                 ///< 0 to kMaxHiddenLayers
    std::array<int, kMaxHiddenLayers> mHiddenLayerSizes = {};  ///< neurons, from the input on
    TNeuronProp mNeuronProp;  ///< of all neurons, output neurons too

    friend constexpr bool operator==(const TDynNetProp&, const TDynNetProp&) = default;
};

/// A net as a constant: its shape and, in the order of NeuronalNet::get_weights, its weights.
/// The weights are borrowed and must live as long as the record is used.
struct TPredefinedWeights {
    TFixedNetProp mFixedNetProp;       ///< the ends of the net
    TDynNetProp mDynNetProp;           ///< what stands between them
    std::span<const double> mWeights;  ///< one a connection, no bias
};

/// An example to learn from: what goes in and what should come out.
struct training_pattern {
    std::vector<double> mInputs;   ///< one value an input neuron
    std::vector<double> mOutputs;  ///< the wanted value of each output neuron
    int mTag = 0;                  ///< for the caller's own use; training does not read it
    std::string mTellingName;      ///< for people, in reports
};

}  // namespace brindle
