// SPDX-License-Identifier: MIT
#include "brindle/markov/TMarkovGenerateOptions.h"

#include "brindle/markov/VariableLengthMarkovModel.h"

#include <algorithm>

namespace brindle {

bool TMarkovGenerateOptions::Validate(const VariableLengthMarkovModel& model) {
    const auto limit = [](std::uint64_t& length, std::uint64_t longest) {
        length = std::max<std::uint64_t>(std::min(length, longest), 1);
    };
    limit(mMaxHistoryLength, model.mMaxHistoryLength);
    limit(mMinHistoryLength, mMaxHistoryLength);
    limit(mEvidenceHistoryLength, mMaxHistoryLength);
    return !mTemplate.empty();
}

bool TMarkovGenerateOptions::IsValid(const VariableLengthMarkovModel& model) const {
    return mMaxHistoryLength >= 1 && mMaxHistoryLength <= model.mMaxHistoryLength &&
           mMinHistoryLength >= 1 && mMinHistoryLength <= mMaxHistoryLength && !mTemplate.empty() &&
           TMarkovSequenceLengthInBeats(mTemplate) > 0.0;
}

TMarkovGenerateOptions UsualGenerateOptions(VariableLengthMarkovModel& model,
                                            std::span<const CMarkovObject> wanted) {
    TMarkovGenerateOptions options;
    options.mTemplate = model.IteratorSequenceForObjects({wanted.begin(), wanted.end()});
    options.mMaxHistoryLength = model.mMaxHistoryLength;
    options.mMinHistoryLength = 1;
    options.mEvidenceHistoryLength = 1;
    options.mAcceptAtMinHistory = true;
    options.mAcceptExactFill = true;
    return options;
}

TMarkovGenerateOptions UsualGenerateOptions(VariableLengthMarkovModel& model, double beats) {
    CMarkovObject gap = CMarkovObject_Gap;
    gap.mChord.mLength = beats;
    return UsualGenerateOptions(model, std::span(&gap, 1));
}

}  // namespace brindle
