// SPDX-License-Identifier: MIT
#include "brindle/song/internal/SongPlan.h"

#include "brindle/song/internal/WriteStretch.h"

#include <algorithm>
#include <numeric>

namespace brindle {
namespace {

/// The stretch of bars [first, last) of a part.
CSongStretch StretchOf(const CWriteSongOptions& options, const CFormPart& part, std::size_t first,
                       bool isLastPart) {
    CSongStretch stretch;
    const auto beatsPerBar = static_cast<std::size_t>(options.mBeatsPerBar);
    stretch.mHome = options.mKey;
    stretch.mBeatsPerBar = options.mBeatsPerBar;
    stretch.mBeats = (part.mBars - first) * beatsPerBar;
    stretch.mFirstBeat = first * beatsPerBar;
    stretch.mWishes.resize(stretch.mBeats);
    stretch.mEndsOnTonic = part.mIsClosed && (!isLastPart || options.mEndsOnTonic);
    stretch.mEndsSection = true;
    stretch.mOrder = options.mOrder;
    stretch.mStaysOpen = part.mStaysOpen;
    stretch.mMostQuoted = MostQuotedTicks(options);
    return stretch;
}

class CSongPlanner {
public:
    CSongPlanner(const CSongModel& model, const CWriteSongOptions& options,
                 const std::vector<std::size_t>& wishes)
        : mModel(model), mOptions(options) {
        mPlan.mParts = PartsOfForm(options.mForm, options.mBars);
        AddStretches();
        for (const std::size_t index : wishes) AddWish(options.mWishes[index]);
        for (const std::size_t index : wishes) AddRow(options.mWishes[index]);
    }

    [[nodiscard]] CSongPlan Take() { return std::move(mPlan); }

private:
    void AddStretches() {
        for (std::size_t ix = 0; ix < mPlan.mParts.size(); ++ix) {
            const CFormPart& part = mPlan.mParts[ix];
            if (part.mIsLike >= 0) continue;
            const std::size_t first = part.IsNew() ? 0 : part.EndingBar();
            const bool isLast = IsLast(part);
            mPlan.mStretches.push_back({ix, StretchOf(mOptions, part, first, isLast)});
        }
    }
    /// Whether the part, or one that is like it, ends the song.
    [[nodiscard]] bool IsLast(const CFormPart& part) const {
        return part.mIsClosed && mPlan.mParts.back().mLetter == part.mLetter;
    }

    void AddWish(const CSongWish& wish) {
        switch (wish.mKind) {
            case TSongWish_Bars:
                for (std::size_t ix = 0; ix < wish.mBeats.size(); ++ix) {
                    if (wish.mBeats[ix] < 0) continue;
                    WishAt(wish.mFirstBeat + ix,
                           wish.mChords[static_cast<std::size_t>(wish.mBeats[ix])]);
                }
                break;
            case TSongWish_Begin:
                WishAt(0, wish.mChords.front());
                break;
            case TSongWish_End:
                WishAt(mOptions.mBars * static_cast<std::size_t>(mOptions.mBeatsPerBar) - 1,
                       wish.mChords.back());
                for (CPlannedStretch& planned : mPlan.mStretches) {
                    if (IsLast(mPlan.mParts[planned.mPart])) planned.mStretch.mEndsOnTonic = false;
                }
                break;
            case TSongWish_Never:
                for (CPlannedStretch& planned : mPlan.mStretches) {
                    auto& never = planned.mStretch.mNever;
                    never.insert(never.end(), wish.mChords.begin(), wish.mChords.end());
                }
                break;
            case TSongWish_Contains:
                break;
        }
    }

    /// A beat of the song is one of the stretch that its part takes it from.
    void WishAt(std::size_t beat, const CWishedChord& chord) {
        const std::size_t beatsPerPart =
            mPlan.mParts.front().mBars * static_cast<std::size_t>(mOptions.mBeatsPerBar);
        const std::size_t part = beat / beatsPerPart;
        if (part >= mPlan.mParts.size()) return;
        const std::size_t within = beat % beatsPerPart;
        for (CPlannedStretch& planned : mPlan.mStretches) {
            if (!IsSource(planned, part, within)) continue;
            planned.mStretch.mWishes[within - planned.mStretch.mFirstBeat].push_back(chord);
        }
    }
    [[nodiscard]] bool IsSource(const CPlannedStretch& planned, std::size_t part,
                                std::size_t beat) const {
        const CFormPart& wished = mPlan.mParts[part];
        const CFormPart& source = mPlan.mParts[planned.mPart];
        if (source.mLetter != wished.mLetter || beat < planned.mStretch.mFirstBeat) return false;
        const bool isEnding =
            beat >= wished.EndingBar() * static_cast<std::size_t>(mOptions.mBeatsPerBar);
        return !isEnding || source.mIsClosed == wished.mIsClosed;
    }

    /// Into the last stretch with room for it: a bridge sooner than the first part.
    void AddRow(const CSongWish& wish) {
        if (wish.mKind != TSongWish_Contains) return;
        for (std::size_t ix = mPlan.mStretches.size(); ix-- > 0;) {
            auto& rows = mPlan.mStretches[ix].mStretch.mContains;
            rows.push_back(wish.mChords);
            if (IsSmall(rows) && IsStretchPossible(mModel, mPlan.mStretches[ix].mStretch)) return;
            rows.pop_back();
        }
        mPlan.mHasRoomForRows = false;
    }
    [[nodiscard]] static bool IsSmall(const std::vector<std::vector<CWishedChord>>& rows) {
        constexpr std::size_t most = 64;
        std::size_t size = 1;
        for (const auto& row : rows) size = std::min(size * (row.size() + 1), most + 1);
        return size <= most;
    }

    const CSongModel& mModel;
    const CWriteSongOptions& mOptions;
    CSongPlan mPlan;
};

bool ArePossible(const CSongModel& model, const CWriteSongOptions& options,
                 const std::vector<std::size_t>& wishes) {
    const CSongPlan plan = PlanSong(model, options, wishes);
    return plan.mHasRoomForRows &&
           std::all_of(plan.mStretches.begin(), plan.mStretches.end(),
                       [&](const CPlannedStretch& planned) {
                           return IsStretchPossible(model, planned.mStretch);
                       });
}

}  // namespace

std::int32_t MostQuotedTicks(const CWriteSongOptions& options) {
    const double bars = options.mMostQuotedBars;
    if (!(bars > 0.0)) return 0;
    // No song is longer.
    return std::max(1, static_cast<std::int32_t>(std::min(bars, 1000.0) * kTicksPerBar + 0.5));
}

CSongPlan PlanSong(const CSongModel& model, const CWriteSongOptions& options,
                   const std::vector<std::size_t>& wishes) {
    return CSongPlanner(model, options, wishes).Take();
}

std::vector<std::size_t> ContradictingWishes(const CSongModel& model,
                                             const CWriteSongOptions& options) {
    std::vector<std::size_t> wishes(options.mWishes.size());
    std::iota(wishes.begin(), wishes.end(), std::size_t{0});
    if (ArePossible(model, options, wishes)) return {};
    for (const std::size_t wish : wishes) {
        if (!ArePossible(model, options, {wish})) return {wish};
    }
    // Whatever can be left out without making the rest possible is not to blame.
    for (std::size_t ix = wishes.size(); ix-- > 0;) {
        std::vector<std::size_t> others = wishes;
        others.erase(others.begin() + static_cast<std::ptrdiff_t>(ix));
        if (!ArePossible(model, options, others)) wishes = std::move(others);
    }
    return wishes;
}

}  // namespace brindle
