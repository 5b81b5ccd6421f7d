// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/neural/NetProperties.h"
#include "brindle/platform/SeededRandom.h"

#include <cstddef>
#include <cstdint>
#include <span>
#include <vector>

namespace brindle {

/// One cell of a feed-forward net: it weighs its inputs, is excited by their sum and hands on a
/// value.
///
/// How it calculates is not its own: the static members below hold for every neuron of every net
/// in the process, and each NeuronalNet that is built sets them.
///
/// Threads: nothing here is protected. The static members are plain variables; whoever builds or
/// trains a net, or sets them, must be the only thread that uses any net at that time.
class Neuron {
public:
    /// A neuron with `weightCount` random weights (a negative count is 0). Also sets
    /// `flat_spot_elimination` to true, for all neurons.
    explicit Neuron(int weightCount);

    /// Sets how all neurons calculate.
    static void SetCalcParams(INPUT_TYPE inputType, ACT_TYPE activationType, OUTPUT_TYPE outputType,
                              double slope, double threshold, double outputThreshold);

    /// Calculates this neuron and writes its value to `outputs[outputIndex]`.
    void calcValue(std::span<const double> inputs, std::span<double> outputs,
                   std::size_t outputIndex);
    /// Calculates a whole layer: neuron i writes `outputs[i]`, all read the same `inputs`.
    static void calcVec(std::span<Neuron> neurons, std::span<const double> inputs,
                        std::span<double> outputs);

    /// First derivative of the activation at the last net input, for training.
    [[nodiscard]] double Act_Abl() const;
    /// The same for a whole layer. The logistic reads `mExpTerm`, which only the common
    /// configuration (`combined_type` 0) writes in calcVec.
    static void Act_AblVec(std::span<const Neuron> neurons, std::span<double> outputs);

    /// The start weight that a random integer stands for: 0.01 to 0.99, or 0.1.
    [[nodiscard]] static double WeightFromRandomNumber(std::uint32_t number);

    std::int32_t mWeightCount = 0;  ///< how many inputs it reads
    double mValue = 0.0;            ///< output of the last calculation
    double mExpTerm = 0.0;          ///< exp() term of the logistic, from calcVec's fast path only
    double mNetInput = 0.0;         ///< net input of the last calculation
    std::vector<double> mWeights;   ///< one an input, of any sign and size

    static inline INPUT_TYPE input_type = INPUT_SUM;      ///< how x and w are joined
    static inline ACT_TYPE activation_type = ACT_SIGM;    ///< how excited the result makes it
    static inline OUTPUT_TYPE output_type = OUTPUT_NONE;  ///< what is handed on
    /// (`activation_type` + `output_type` * 4) * 5 + `input_type`; 0 is the fast path.
    static inline int combined_type = 0;
    static inline double activation_slope = 1.0;      ///< the slope s, see ACT_TYPE
    static inline double activation_threshold = 0.0;  ///< the threshold t, see ACT_TYPE
    static inline double output_threshold = 0.0;      ///< where OUTPUT_BIN goes over to 1.0
    /// Adds 0.1 to the logistic's derivative, so that a neuron at its limits still learns.
    static inline bool flat_spot_elimination = true;
    /// Gives the start weights and the order of training patterns. Set it to repeat a run.
    static inline SeededRandom random_source{20};
};

}  // namespace brindle
