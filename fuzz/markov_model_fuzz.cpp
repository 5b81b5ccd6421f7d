// SPDX-License-Identifier: MIT
// Any text as a model file: the model that comes out can be asked, can make sequences, and is saved
// as a text that reads as a model again.

#include "brindle/markov/VariableLengthMarkovModel.h"
#include "brindle/platform/SeededRandom.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <sstream>
#include <string>

namespace {

using namespace brindle;
using Helper = VariableLengthMarkovModel::JSONDeserialization_Helper;

void MakeSequences(VariableLengthMarkovModel& model) {
    model.SetRandomSource([random = SeededRandom(1)]() mutable { return random.Next(); });
    model.SetSearchLimits({3, 2000});
    CMarkovObject gap = CMarkovObject_Gap;
    gap.mChord.mLength = 8.0;
    TMarkovGenerateOptions options;
    options.mTemplate = model.IteratorSequenceForObjects({gap});
    options.mMaxHistoryLength = 4;
    options.mAcceptAtMinHistory = true;
    options.Validate(model);
    TMarkovSampledSequence chosen;
    std::vector<TMarkovSampledSequence> sequences;
    model.SampleSequenceWithLength(chosen, sequences, false, options);
    model.SampleSequenceWithLength(chosen, sequences, true, options);
    (void)model.FillGapInSequence(options.mTemplate);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    VariableLengthMarkovModel model;
    Helper::VariableLengthMarkovModelFromJSONString(
        std::string(reinterpret_cast<const char*>(data), size), model);
    std::ostringstream saved;
    model.AppendJSONString(saved);
    VariableLengthMarkovModel again;
    Helper::VariableLengthMarkovModelFromJSONString(saved.str(), again);
    // Indexed symbols are written with a comma too many, which is no JSON.
    const bool isStrict = std::none_of(
        model.mObjects.begin(), model.mObjects.end(),
        [](const CMarkovObject& object) { return object.mType == TMarkovObjectType_Indexed; });
    if (isStrict && again.mMaxHistoryLength != model.mMaxHistoryLength) __builtin_trap();
    std::vector<std::pair<double, double>> entropies;
    model.CalculateAllEntropies(entropies);
    // Each draw fills windows of this length.
    if (model.mMaxHistoryLength <= 16) MakeSequences(model);
    return 0;
}
