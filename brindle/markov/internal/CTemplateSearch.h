// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/markov/TMarkovSamplingInformation.h"
#include "brindle/markov/VariableLengthMarkovModel.h"
#include "brindle/markov/internal/CMarkovTemplate.h"

#include <vector>

namespace brindle {

/// The depth-first search of VariableLengthMarkovModel::RecursiveGenerateSequence.
///
/// Each symbol that is appended is one level of a recursion: the search begins there, and if it
/// comes back without success, the level tries another symbol (in a gap) or fails itself (at a
/// fixed symbol). The levels stand on a stack of our own, since a template can be longer than the
/// program's stack is deep.
class CTemplateSearch {
public:
    CTemplateSearch(VariableLengthMarkovModel& model, TMarkovSampledSequence& sequence,
                    const TMarkovGenerateOptions& options, TMarkovSamplingInformation& info);

    /// Whether the sequence reached the end of the template; if not it is as it was.
    bool Run();

private:
    enum class TOutcome { Deeper, Failed, Found };

    struct CSearchLevel {
        std::int32_t mDepth = 0;
        double mBeats = 0.0;
        CMarkovTemplate::CNext mNext;
        /// Symbols that led nowhere in this gap.
        MarkovSymbolSet mExcluded;
    };

    TOutcome Begin();
    TOutcome GoOn();
    /// In a gap.
    TOutcome TryOtherSymbol();
    /// There is no other: the level fails.
    TOutcome TakeBackFixedSymbol();
    TOutcome FillGap();
    TOutcome PlaceFixedSymbol();
    TOutcome Fail();
    [[nodiscard]] double BeatsAtEnd() const;
    void BlockHere(std::uint64_t historyLength);
    std::uint64_t LookUpFixedSymbol();

    VariableLengthMarkovModel& mModel;
    TMarkovSampledSequence& mSequence;
    const TMarkovGenerateOptions& mOptions;
    TMarkovSamplingInformation& mInfo;
    CMarkovTemplate mTemplate;
    std::uint64_t mLongest;
    double mFirstBeats;
    std::uint64_t mSteps = 0;
    std::vector<CSearchLevel> mLevels;
    MarkovSequence mHistory;
    MarkovProbabilities mTable;
};

}  // namespace brindle
