// SPDX-License-Identifier: MIT
#include "brindle/song/internal/WriteStretch.h"

#include "brindle/song/internal/QuotedRow.h"
#include "brindle/song/internal/SongLattice.h"

#include <algorithm>
#include <numeric>

namespace brindle {
namespace {

constexpr std::size_t kMostStretchSteps = 5000;
// A step that no song has made: the probabilities of a model are generous to them.
constexpr double kNewStepFactor = 1e-3;
constexpr double kNewChordWeight = 1e-7;

/// Weights of choices; what was tried weighs nothing.
class CChoices {
public:
    explicit CChoices(std::size_t count) : mWeights(count, 0.0) {}

    double& operator[](std::size_t choice) { return mWeights[choice]; }
    /// The count of choices if none is left.
    [[nodiscard]] std::size_t Draw(SeededRandom& random) const {
        const double sum = std::accumulate(mWeights.begin(), mWeights.end(), 0.0);
        if (!(sum > 0.0)) return mWeights.size();
        double left = random.Fraction() * sum;
        std::size_t last = mWeights.size();
        for (std::size_t choice = 0; choice < mWeights.size(); ++choice) {
            if (mWeights[choice] <= 0.0) continue;
            last = choice;
            left -= mWeights[choice];
            if (left < 0.0) break;
        }
        return last;
    }
    [[nodiscard]] std::size_t size() const { return mWeights.size(); }

private:
    std::vector<double> mWeights;
};

class CStretchWriter {
public:
    CStretchWriter(const CSongModel& model, const CSongStretch& stretch, SeededRandom& random)
        : mModel(model), mStretch(stretch), mRandom(random), mLattice(model, stretch) {
        const bool isMinor = stretch.mHome.mSignKeyType == TSignKeyType_Minor;
        mHistory = {CSongModel::StartId(isMinor)};
        for (const CWrittenChord& chord : stretch.mBefore) {
            mHistory.push_back(model.HistoryIdOf(chord.mChord));
            mBeatsBefore += static_cast<std::size_t>(chord.mBeats);
        }
        mQuotes.emplace_back(model);
        for (const CQuotedChord& chord : QuotedRowOf(stretch.mBefore, 0, stretch.mBeatsPerBar)) {
            mQuotes.back().Add(chord);
        }
    }

    [[nodiscard]] TStretchEnd Write(std::vector<CWrittenChord>& chords) {
        if (!mLattice.IsPossible()) return TStretch_Impossible;
        if (!WriteChord(0, 0)) return TStretch_Quoted;
        chords = std::move(mWritten);
        return TStretch_Written;
    }

private:
    [[nodiscard]] std::size_t TonicNow() const {
        return mWritten.empty() ? mLattice.TonicBefore()
                                : static_cast<std::size_t>(mWritten.back().mTonic);
    }

    // The two functions call each other once for each chord of the stretch.

    /// Writes a chord that begins on a beat, and all behind it.
    bool WriteChord(std::size_t beat, std::size_t progress) {
        CChoices choices = ChordChoices(beat, progress);
        while (mSteps < kMostStretchSteps) {
            const std::size_t choice = choices.Draw(mRandom);
            if (choice == choices.size()) return false;
            ++mSteps;
            const CSongCandidates::CCandidate& candidate = mLattice.Candidates()[choice];
            const std::size_t tonic = CSongCandidates::TonicAfter(TonicNow(), candidate.mChord);
            mWritten.push_back(
                {candidate.mChord, candidate.mId, static_cast<std::int32_t>(tonic), 0, false});
            mHistory.push_back(mModel.HistoryIdOf(candidate.mChord));
            const std::size_t slot = choice * kTonicCount + tonic;
            if (WriteLength(beat, slot, mLattice.ProgressWith(progress, slot))) return true;
            mWritten.pop_back();
            mHistory.pop_back();
            choices[choice] = 0.0;
        }
        return false;
    }

    /// Chooses how long the last chord is, and writes all behind it.
    bool WriteLength(std::size_t beat, std::size_t slot, std::size_t progress) {
        CChoices choices = LengthChoices(beat, slot, progress);
        while (mSteps < kMostStretchSteps) {
            const std::size_t choice = choices.Draw(mRandom);
            if (choice == choices.size()) return false;
            const std::size_t end = beat + choice + 1;
            mWritten.back().mBeats = static_cast<std::int32_t>(choice) + 1;
            mWritten.back().mIsWished = IsWished(beat, end);
            mQuotes.push_back(mQuotes.back());
            mQuotes.back().Add(
                QuotedChordOf(mWritten.back(), mBeatsBefore + beat, mStretch.mBeatsPerBar));
            if (!QuotesTooMuch(end) && (end == mStretch.mBeats || WriteChord(end, progress))) {
                return true;
            }
            mQuotes.pop_back();
            choices[choice] = 0.0;
        }
        return false;
    }

    [[nodiscard]] CChoices ChordChoices(std::size_t beat, std::size_t progress) {
        const CSongCandidates& candidates = mLattice.Candidates();
        const std::size_t historyLength = std::min(mHistory.size(), mStretch.mOrder);
        mModel.Predict(std::span(mHistory).last(historyLength), mLattice.PlaceAt(beat),
                       mStretch.mOrder, mProbabilities);
        std::vector<bool> isKnownStep(candidates.size(), false);
        for (const CSongModel::CSuccessor& successor : mModel.SuccessorsOf(mHistory.back())) {
            const std::ptrdiff_t index = candidates.IndexOf(successor.mId);
            if (index >= 0) isKnownStep[static_cast<std::size_t>(index)] = true;
        }
        CChoices choices(candidates.size());
        const std::size_t tonic = TonicNow();
        for (std::size_t index = 0; index < candidates.size(); ++index) {
            const CSongCandidates::CCandidate& candidate = candidates[index];
            const std::size_t slot =
                index * kTonicCount + CSongCandidates::TonicAfter(tonic, candidate.mChord);
            const double rest = mLattice.From(beat, slot, mLattice.ProgressWith(progress, slot));
            if (rest == 0.0 || IsSameAsLast(candidate.mChord)) continue;
            const double weight = candidate.mId < 0
                                      ? kNewChordWeight
                                      : mProbabilities[static_cast<std::size_t>(candidate.mId)];
            choices[index] = weight * rest * (isKnownStep[index] ? 1.0 : kNewStepFactor);
        }
        return choices;
    }

    /// In whichever key: a chord that is written twice is one chord.
    [[nodiscard]] bool IsSameAsLast(const CRelativeChord& chord) const {
        const CWrittenChord* last = nullptr;
        if (!mStretch.mBefore.empty()) last = &mStretch.mBefore.back();
        if (!mWritten.empty()) last = &mWritten.back();
        return last != nullptr && last->mChord.mMask == chord.mMask &&
               last->mChord.mBass == chord.mBass &&
               last->mChord.mRoot == (chord.mShift + chord.mRoot) % 12;
    }

    [[nodiscard]] CChoices LengthChoices(std::size_t beat, std::size_t slot,
                                         std::size_t progress) const {
        const std::int32_t before = mWritten.size() > 1 ? mWritten[mWritten.size() - 2].mBeats
                                    : mStretch.mBefore.empty() ? 0
                                                               : mStretch.mBefore.back().mBeats;
        const std::vector<double> weights =
            mLattice.Lengths().WeightsAt(mLattice.BeatInBar(beat), before);
        CChoices choices(weights.size());
        for (std::size_t length = 1; length <= weights.size(); ++length) {
            choices[length - 1] =
                weights[length - 1] * mLattice.FromWithLength(beat, slot, progress, length);
        }
        return choices;
    }

    /// Whether somebody wished for just the chords on these beats.
    [[nodiscard]] bool IsWished(std::size_t beat, std::size_t end) const {
        for (std::size_t at = beat; at < end; ++at) {
            const bool isWished = at < mStretch.mWishes.size() && !mStretch.mWishes[at].empty() &&
                                  !mStretch.mWishes[at].front().mIsKind;
            if (!isWished) return false;
        }
        return true;
    }

    [[nodiscard]] bool QuotesTooMuch(std::size_t end) const {
        if (mStretch.mMostQuoted <= 0) return false;
        if (mQuotes.back().Length() > mStretch.mMostQuoted) return true;
        if (end < mStretch.mBeats) return false;
        CSongQuotes quotes = mQuotes.back();
        for (const CQuotedChord& chord :
             QuotedRowOf(mStretch.mBehind, mBeatsBefore + end, mStretch.mBeatsPerBar)) {
            quotes.Add(chord);
            if (quotes.Length() == 0) return false;
            if (quotes.Length() > mStretch.mMostQuoted) return true;
        }
        return false;
    }

    const CSongModel& mModel;
    const CSongStretch& mStretch;
    SeededRandom& mRandom;
    CSongLattice mLattice;
    std::vector<std::int32_t> mHistory;
    std::size_t mBeatsBefore = 0;
    std::vector<CWrittenChord> mWritten;
    /// Before each chord, and behind the last.
    std::vector<CSongQuotes> mQuotes;
    std::vector<double> mProbabilities;
    std::size_t mSteps = 0;
};

}  // namespace

TStretchEnd WriteStretch(const CSongModel& model, const CSongStretch& stretch, SeededRandom& random,
                         std::vector<CWrittenChord>& chords) {
    return CStretchWriter(model, stretch, random).Write(chords);
}

bool IsStretchPossible(const CSongModel& model, const CSongStretch& stretch) {
    return CSongLattice(model, stretch).IsPossible();
}

}  // namespace brindle
