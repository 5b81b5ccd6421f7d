// SPDX-License-Identifier: MIT
#include "brindle/markov/internal/CTemplateSearch.h"

#include <algorithm>
#include <cmath>

namespace brindle {

CTemplateSearch::CTemplateSearch(VariableLengthMarkovModel& model, TMarkovSampledSequence& sequence,
                                 const TMarkovGenerateOptions& options,
                                 TMarkovSamplingInformation& info)
    : mModel(model),
      mSequence(sequence),
      mOptions(options),
      mInfo(info),
      mTemplate(options.mTemplate, model.mObjects.insertObjectIfUnique(CMarkovObject_End)),
      mLongest(std::min(options.mMaxHistoryLength, model.mMaxHistoryLength)),
      mFirstBeats(TMarkovSequenceLengthInBeats(sequence.mSymbols)) {}

bool CTemplateSearch::Run() {
    mInfo.mHasGivenUp = false;
    const std::size_t sizeBefore = mSequence.mSymbols.size();
    TOutcome outcome = Begin();
    while (outcome != TOutcome::Found) {
        if (outcome == TOutcome::Failed && mLevels.empty()) return false;
        if (mSteps >= mModel.SearchLimits().mSteps) break;
        outcome = outcome == TOutcome::Deeper ? Begin() : GoOn();
    }
    mInfo.mHasGivenUp = outcome != TOutcome::Found;
    if (outcome == TOutcome::Found) return true;
    while (mSequence.mSymbols.size() > sizeBefore) mSequence.RemoveLast();
    return false;
}

/// A new level behind the symbols that are there.
CTemplateSearch::TOutcome CTemplateSearch::Begin() {
    ++mSteps;
    CSearchLevel level;
    level.mDepth = mInfo.mDepths.empty() ? 1 : mInfo.mDepths.back() + 1;
    level.mBeats = BeatsAtEnd();
    level.mNext = mTemplate.NextAt(level.mBeats);
    mInfo.mDepths.push_back(level.mDepth);
    mInfo.mBeats.push_back(level.mBeats);
    mLevels.push_back(std::move(level));

    mModel.Subvector(mLongest, mSequence.mSymbols, mHistory);
    const CSearchLevel& here = mLevels.back();
    if (mInfo.IsBlocklisted(here.mBeats, mHistory)) return Fail();
    if (mLevels.size() > kMarkovMaxTemplateSymbols) return Fail();
    if (here.mNext.mDistance > 0.0) return FillGap();
    // Past the fixed symbol.
    if (here.mNext.mDistance != 0.0) return Fail();
    return PlaceFixedSymbol();
}

/// The last level again, after the way behind its symbol failed.
CTemplateSearch::TOutcome CTemplateSearch::GoOn() {
    return mLevels.back().mNext.mDistance > 0.0 ? TryOtherSymbol() : TakeBackFixedSymbol();
}

CTemplateSearch::TOutcome CTemplateSearch::TryOtherSymbol() {
    CSearchLevel& level = mLevels.back();
    level.mExcluded.insert(mSequence.mSymbols.back());
    mSequence.RemoveLast();
    mInfo.mBeats.push_back(level.mBeats);
    return FillGap();
}

CTemplateSearch::TOutcome CTemplateSearch::TakeBackFixedSymbol() {
    mSequence.RemoveLast();
    mModel.Subvector(mLongest, mSequence.mSymbols, mHistory);
    BlockHere(mLongest);
    mInfo.mBeats.push_back(mLevels.back().mBeats);
    return Fail();
}

CTemplateSearch::TOutcome CTemplateSearch::FillGap() {
    const CSearchLevel& level = mLevels.back();
    if (mModel.AppendNextFittingSymbol(mSequence, level.mNext.mDistance, level.mExcluded, mOptions,
                                       mInfo, kMarkovLongestHistory)) {
        return TOutcome::Deeper;
    }
    mModel.Subvector(mLongest, mSequence.mSymbols, mHistory);
    BlockHere(mOptions.mMinHistoryLength);
    return Fail();
}

CTemplateSearch::TOutcome CTemplateSearch::PlaceFixedSymbol() {
    const MarkovIterator fixed = mLevels.back().mNext.mObject;
    const std::uint64_t length = LookUpFixedSymbol();
    const auto found = mTable.find(fixed);
    if (found == mTable.end()) {
        BlockHere(mLongest);
        return Fail();
    }
    if (fixed->mType == TMarkovObjectType_End) {
        mModel.CalculateEvidenceProbability(mSequence, mOptions);
        return TOutcome::Found;
    }
    const double maxEntropy = std::log(static_cast<double>(mTable.size()));
    const double entropy = VariableLengthMarkovModel::CalculateEntropy(mTable);
    mSequence.Append({found->second, entropy / maxEntropy, maxEntropy, length, fixed});
    mInfo.mBranching.push_back(0);
    return TOutcome::Deeper;
}

/// Fills the table of the longest history behind which the fixed symbol was learned; gives its
/// length.
std::uint64_t CTemplateSearch::LookUpFixedSymbol() {
    const MarkovIterator fixed = mLevels.back().mNext.mObject;
    std::uint64_t length = mLongest;
    mModel.ProbabilitiesForNextSymbol(mHistory, mTable);
    while (mTable.find(fixed) == mTable.end() && length > mOptions.mEvidenceHistoryLength) {
        --length;
        mModel.ProbabilitiesForNextSymbol(MarkovSequenceView(mHistory).last(length), mTable);
    }
    return length;
}

CTemplateSearch::TOutcome CTemplateSearch::Fail() {
    mInfo.mDepths.push_back(mLevels.back().mDepth - 1);
    mLevels.pop_back();
    return TOutcome::Failed;
}

double CTemplateSearch::BeatsAtEnd() const {
    if (mLevels.empty()) return mFirstBeats;
    const CMarkovObject& last = *mSequence.mSymbols.back();
    return mLevels.back().mBeats + (last.HasBeats() ? last.mChord.mLength : 0.0);
}

/// Nothing fits here behind the last symbols of the history.
void CTemplateSearch::BlockHere(std::uint64_t historyLength) {
    const MarkovSequenceView history(mHistory);
    mInfo.AddToBlocklist(mLevels.back().mBeats,
                         history.last(std::min<std::uint64_t>(historyLength, history.size())));
}

bool VariableLengthMarkovModel::RecursiveGenerateSequence(TMarkovSampledSequence& sequence,
                                                          const TMarkovGenerateOptions& options,
                                                          TMarkovSamplingInformation& info) {
    return CTemplateSearch(*this, sequence, options, info).Run();
}

}  // namespace brindle
