// SPDX-License-Identifier: MIT
#include "brindle/song/internal/SongCandidates.h"

#include "brindle/theory/KeyIntervals.h"

#include <algorithm>
#include <numeric>

namespace brindle {
namespace {

// More chords make a lattice slow, and a song does not need them.
constexpr std::size_t kMostNextChords = 400;
// The chance that a step no song has made is taken all the same, which wishes may need.
constexpr double kNewStep = 1e-4;
constexpr double kNewChord = 1e-3;

}  // namespace

CSongCandidates::CSongCandidates(const CSongModel& model, const CSongStretch& stretch)
    : mModel(model), mHomeTonic(stretch.mHome.mRootKeyEnh.mKeyNr) {
    AddCommon(model);
    AddWished(stretch);
    AddSteps(model, CSongModel::StartId(stretch.mHome.mSignKeyType == TSignKeyType_Minor));
}

std::ptrdiff_t CSongCandidates::IndexOf(std::int32_t id) const {
    return id < 0 ? -1 : mIndexOfId[static_cast<std::size_t>(id)];
}

void CSongCandidates::AddCommon(const CSongModel& model) {
    std::vector<std::int32_t> ids(model.VocabularySize());
    std::iota(ids.begin(), ids.end(), 0);
    const auto isMoreCommon = [&](std::int32_t a, std::int32_t b) {
        return std::pair(model.CountOf(b), a) < std::pair(model.CountOf(a), b);
    };
    std::sort(ids.begin(), ids.end(), isMoreCommon);
    ids.resize(std::min(ids.size(), kMostNextChords));
    mIndexOfId.assign(model.VocabularySize(), -1);
    for (const std::int32_t id : ids) {
        mIndexOfId[static_cast<std::size_t>(id)] = static_cast<std::int32_t>(mCandidates.size());
        mCandidates.push_back({model.Chord(id), id});
    }
}

void CSongCandidates::AddWished(const CSongStretch& stretch) {
    for (const auto& beat : stretch.mWishes) {
        for (const CWishedChord& wish : beat) AddWish(stretch, wish);
    }
    for (const auto& row : stretch.mContains) {
        for (const CWishedChord& wish : row) AddWish(stretch, wish);
    }
}

/// A wished chord in the key of the song, unless it is there.
void CSongCandidates::AddWish(const CSongStretch& stretch, const CWishedChord& wish) {
    const CRelativeChord chord = RelativeChordOf(wish.mChord, stretch.mHome, mHomeTonic);
    const auto isThere = [&](const CCandidate& candidate) { return candidate.mChord == chord; };
    if (std::any_of(mCandidates.begin(), mCandidates.end(), isThere)) return;
    const std::int32_t id = mModel.IdOf(chord);
    if (id >= 0) {
        mIndexOfId[static_cast<std::size_t>(id)] = static_cast<std::int32_t>(mCandidates.size());
    }
    mCandidates.push_back({chord, id});
}

void CSongCandidates::AddSteps(const CSongModel& model, std::int32_t start) {
    mSteps.resize(size());
    std::vector<double> alone;
    mAlone.resize(size());
    for (std::size_t place = 0; place < kBarPlaceCount; ++place) {
        model.Predict(std::array{start}, static_cast<TBarPlace>(place), 0, alone);
        for (std::size_t index = 0; index < size(); ++index) {
            const std::int32_t id = mCandidates[index].mId;
            mAlone[index][place] =
                kNewStep * (id < 0 ? kNewChord : alone[static_cast<std::size_t>(id)]);
        }
    }
    for (std::size_t index = 0; index < size(); ++index) {
        if (mCandidates[index].mId < 0) continue;
        const auto successors = model.SuccessorsOf(mCandidates[index].mId);
        double total = 0.0;
        std::array<double, kBarPlaceCount> totals{};
        for (const CSongModel::CSuccessor& successor : successors) {
            total += successor.mShares.mAll;
            for (std::size_t place = 0; place < kBarPlaceCount; ++place) {
                totals[place] += successor.mShares.mAt[place];
            }
        }
        for (const CSongModel::CSuccessor& successor : successors) {
            const std::ptrdiff_t to = IndexOf(successor.mId);
            if (to < 0) continue;
            CStep step{static_cast<std::size_t>(to), {}};
            for (std::size_t place = 0; place < kBarPlaceCount; ++place) {
                const double atPlace =
                    totals[place] > 0.0 ? successor.mShares.mAt[place] / totals[place] : 0.0;
                step.mWeights[place] =
                    static_cast<float>(0.5 * successor.mShares.mAll / total + 0.5 * atPlace);
            }
            mSteps[index].push_back(step);
        }
    }
}

bool CSongCandidates::HasStep(std::size_t from, std::size_t to) const {
    const auto& steps = mSteps[from];
    return std::any_of(steps.begin(), steps.end(),
                       [&](const CStep& step) { return step.mTo == to; });
}

bool CSongCandidates::Fits(std::size_t slot, const CWishedChord& wish) const {
    const CRelativeChord& chord = mCandidates[slot / kTonicCount].mChord;
    const int root =
        FoldIntoOctave(mHomeTonic + static_cast<int>(slot % kTonicCount) + chord.mRoot);
    return wish.Fits(root, FoldIntoOctave(root + chord.mBass), chord.mMask);
}

}  // namespace brindle
