// SPDX-License-Identifier: MIT
#include "brindle/neural/ChordAnalysisNeuronalNet.h"

namespace brindle {

constinit const TPredefinedWeights ChordAnalysisNeuronalNet = {
    .mFixedNetProp = {.mInputNeuronCount = 24, .mOutputNeuronCount = 12},
    .mDynNetProp = {.mHiddenLayerCount = 2,
                    .mHiddenLayerSizes = {15, 15},
                    .mNeuronProp = {.mInputType = INPUT_SUM,
                                    .mActType = ACT_SIGM,
                                    .mActivationSlope = 0.2,
                                    .mActivationThreshold = 2.0,
                                    .mOutputType = OUTPUT_NONE,
                                    .mOutputThreshold = 0.0}},
    .mWeights = weight_definitions,
};

}  // namespace brindle
