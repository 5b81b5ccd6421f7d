// SPDX-License-Identifier: MIT
#include "brindle/song/ScoreSongs.h"

#include <algorithm>
#include <cmath>

namespace brindle {
namespace {

constexpr std::size_t kMostGroups = 10;

CSongScore ScoreOf(const CSongModel& model, const CTaughtSong& song, std::size_t order,
                   bool withKeys) {
    CSongScore score;
    if (song.mChords.empty()) return score;
    if (withKeys) score.mBits = std::log2(24.0);
    std::vector<std::int32_t> history = {
        CSongModel::StartId(song.mKey.mSignKeyType == TSignKeyType_Minor)};
    for (const CTaughtChord& chord : song.mChords) {
        const double probability =
            model.ProbabilityOf(chord.mChord, history, BarPlaceOf(chord.mBegin), order);
        score.mBits -= std::log2(std::max(probability, 1e-300));
        ++score.mChords;
        history.push_back(model.HistoryIdOf(chord.mChord));
    }
    return score;
}

/// The songs of a model but those that are the same as some of a list.
CSongModel Without(const std::vector<CTaughtSong>& songs,
                   const std::vector<const CTaughtSong*>& leftOut) {
    std::vector<CTaughtSong> others;
    for (const CTaughtSong& song : songs) {
        const auto isSame = [&](const CTaughtSong* other) {
            return other->mChords == song.mChords;
        };
        if (std::none_of(leftOut.begin(), leftOut.end(), isSame)) others.push_back(song);
    }
    return CSongModel(std::move(others));
}

std::vector<CTaughtSong> AllWithoutKeys(std::span<const CTaughtSong> songs) {
    std::vector<CTaughtSong> absolute;
    for (const CTaughtSong& song : songs) absolute.push_back(WithoutKeys(song));
    return absolute;
}

}  // namespace

double CSongScore::BitsPerChord() const {
    return mChords == 0 ? 0.0 : mBits / static_cast<double>(mChords);
}

std::vector<CSongScore> ScoreSongs(const CSongModel& model, std::span<const CTaughtSong> songs,
                                   std::size_t order, bool withKeys) {
    std::vector<CTaughtSong> scored(songs.begin(), songs.end());
    std::vector<CTaughtSong> learned = model.Songs();
    if (!withKeys) {
        scored = AllWithoutKeys(scored);
        learned = AllWithoutKeys(learned);
    }
    std::vector<CSongScore> scores(scored.size());
    const std::size_t groups = std::min(kMostGroups, scored.size());
    for (std::size_t group = 0; group < groups; ++group) {
        std::vector<const CTaughtSong*> leftOut;
        for (std::size_t ix = group; ix < scored.size(); ix += groups) {
            leftOut.push_back(&scored[ix]);
        }
        const CSongModel others = Without(learned, leftOut);
        for (std::size_t ix = group; ix < scored.size(); ix += groups) {
            scores[ix] = ScoreOf(others, scored[ix], order, withKeys);
        }
    }
    return scores;
}

CSongScore SumOfScores(std::span<const CSongScore> scores) {
    CSongScore sum;
    for (const CSongScore& score : scores) {
        sum.mChords += score.mChords;
        sum.mBits += score.mBits;
    }
    return sum;
}

std::vector<COrderScores> ScoresByOrder(const CSongModel& model,
                                        std::span<const CTaughtSong> songs) {
    std::vector<COrderScores> scores;
    for (std::size_t order = 1; order <= CSongModel::kLongestHistory; ++order) {
        scores.push_back({order, SumOfScores(ScoreSongs(model, songs, order)),
                          SumOfScores(ScoreSongs(model, songs, order, false))});
    }
    return scores;
}

}  // namespace brindle
