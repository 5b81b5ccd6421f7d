// SPDX-License-Identifier: MIT
#include "brindle/musicxml/internal/JumpPlan.h"

#include "brindle/musicxml/internal/ScoreWords.h"

#include <algorithm>
#include <map>
#include <string>
#include <utility>

namespace brindle {

namespace {

/// The measures with a sign of one kind, by the names that some of them have.
class CPlaces {
public:
    /// To be called in ascending order.
    void Add(std::size_t ix, const std::string& name) {
        mAll.push_back(ix);
        if (!name.empty()) mOfName[name].push_back(ix);
    }
    [[nodiscard]] std::size_t First() const { return mAll.empty() ? kNoMeasure : mAll.front(); }

    /// The first place behind `ix`, of that name if there is one.
    [[nodiscard]] std::optional<std::size_t> Behind(std::size_t ix, const std::string& name) const {
        if (const auto it = mOfName.find(name); it != mOfName.end()) {
            if (const auto found = FirstBehind(ix, it->second)) return found;
        }
        return FirstBehind(ix, mAll);
    }
    /// The last place up to `ix`, of that name if there is one.
    [[nodiscard]] std::optional<std::size_t> UpTo(std::size_t ix, const std::string& name) const {
        if (const auto it = mOfName.find(name); it != mOfName.end()) {
            if (const auto found = LastUpTo(ix, it->second)) return found;
        }
        return LastUpTo(ix, mAll);
    }

private:
    using TPlaces = std::vector<std::size_t>;

    static std::optional<std::size_t> FirstBehind(std::size_t ix, const TPlaces& places) {
        const auto it = std::upper_bound(places.begin(), places.end(), ix);
        return it == places.end() ? std::nullopt : std::optional(*it);
    }
    static std::optional<std::size_t> LastUpTo(std::size_t ix, const TPlaces& places) {
        const auto it = std::upper_bound(places.begin(), places.end(), ix);
        return it == places.begin() ? std::nullopt : std::optional(*(it - 1));
    }

    TPlaces mAll;
    std::map<std::string, TPlaces, std::less<>> mOfName;
};

class CPlanner {
public:
    explicit CPlanner(const TScoreMeasures& measures) : mMeasures(measures) {
        mPlan.mMeasures.resize(measures.size());
    }

    [[nodiscard]] TJumpPlan Make() {
        FindEndings();
        ReachForRepeatSigns();
        GroupEndings();
        FindRepeatStarts();
        FindRepeatEnds();
        FindCodas();
        FindJumpTargets();
        return std::move(mPlan);
    }

private:
    [[nodiscard]] const TPlayMarks& Marks(std::size_t ix) const { return mMeasures[ix].mMarks; }

    // An ending goes on to its end, to the sign that goes back, or else to the next ending or
    // repeat.
    void FindEndings() {
        std::optional<TEnding> open;
        const auto close = [&](std::size_t last) {
            if (!open) return;
            open->mLast = last;
            mPlan.mEndings.push_back(std::move(*open));
            open.reset();
        };
        for (std::size_t ix = 0; ix < mMeasures.size(); ++ix) {
            const TPlayMarks& marks = Marks(ix);
            if (ix > 0 && (marks.mEndingStarts || marks.mRepeatForward)) close(ix - 1);
            if (marks.mEndingStarts) {
                open.emplace();
                open->mFirst = ix;
                open->mNumbers = marks.mEndingNumbers;
            }
            if (marks.mEndingStops || marks.mRepeatBackward) close(ix);
        }
        if (!mMeasures.empty()) close(mMeasures.size() - 1);
    }

    // A bracket may be drawn over its first bar only; the ending lasts up to the sign that goes
    // back in front of the next ending all the same.
    void ReachForRepeatSigns() {
        for (std::size_t i = 0; i + 1 < mPlan.mEndings.size(); ++i) {
            TEnding& ending = mPlan.mEndings[i];
            const TEnding& next = mPlan.mEndings[i + 1];
            if (!Continues(ending, next) || Marks(ending.mLast).mRepeatBackward) continue;
            std::size_t ix = ending.mLast + 1;
            while (ix < next.mFirst && !Marks(ix).mRepeatBackward && !Marks(ix).mRepeatForward) {
                ++ix;
            }
            if (ix + 1 == next.mFirst && Marks(ix).mRepeatBackward) ending.mLast = ix;
        }
    }

    // Whether the numbers of an ending go on where those of the one before end.
    static bool Continues(const TEnding& ending, const TEnding& next) {
        if (ending.mNumbers.empty() || next.mNumbers.empty()) return true;
        return next.mNumbers.front() > ending.mNumbers.back();
    }

    void GroupEndings() {
        for (std::size_t i = 0; i < mPlan.mEndings.size(); ++i) {
            TEnding& ending = mPlan.mEndings[i];
            const bool isNext = i > 0 && mPlan.mEndings[i - 1].mLast + 1 == ending.mFirst &&
                                Continues(mPlan.mEndings[i - 1], ending) &&
                                !Marks(ending.mFirst).mRepeatForward;
            const bool isFull =
                isNext && mPlan.mGroups.back().HighestNumber() >= kHighestEndingNumber;
            if (!isNext || isFull) mPlan.mGroups.emplace_back().mFirstEnding = i;
            ending.mGroup = mPlan.mGroups.size() - 1;
            TEndingGroup& group = mPlan.mGroups.back();
            Describe(i, group);
            if (ending.mNumbers.empty()) ending.mNumbers = {group.HighestNumber() + 1};
            ++group.mEndingCount;
            group.mBehind = ending.mLast + 1;
            for (const std::int32_t pass : ending.mNumbers) group.mEndingOfPass.emplace(pass, i);
            group.mIsForAfterJump |= Marks(ending.mLast).mRepeatAfterJump;
        }
        // Each but the last ending goes back, even where its sign was forgotten.
        for (std::size_t i = 0; i + 1 < mPlan.mEndings.size(); ++i) {
            TEnding& ending = mPlan.mEndings[i];
            if (mPlan.mEndings[i + 1].mGroup != ending.mGroup) continue;
            if (!Marks(ending.mLast).Jumps()) ending.mGoesBack = true;
        }
    }

    void Describe(std::size_t i, TEndingGroup& group) {
        TEnding& ending = mPlan.mEndings[i];
        ending.mGoesBack = Marks(ending.mLast).mRepeatBackward;
        for (std::size_t ix = ending.mFirst; ix <= ending.mLast; ++ix) {
            mPlan.mMeasures[ix].mEnding = i;
            if (Marks(ix).mFine) group.mEndingWithFine = std::min(group.mEndingWithFine, i);
        }
    }

    // A repeat goes back to the sign that begins it, or else behind the repeat before it.
    void FindRepeatStarts() {
        std::size_t start = 0;
        std::int32_t timesAtStart = 0;
        for (std::size_t ix = 0; ix < mMeasures.size(); ++ix) {
            const TPlayMarks& marks = Marks(ix);
            TMeasurePlan& measure = mPlan.mMeasures[ix];
            if (marks.mRepeatForward && measure.mEnding == kNoMeasure) {
                start = ix;
                timesAtStart = marks.mRepeatTimes;
            }
            const TEnding* ending = EndingAt(ix);
            if (ending != nullptr && ix == ending->mFirst) {
                TEndingGroup& group = mPlan.mGroups[ending->mGroup];
                if (group.mFirstEnding == measure.mEnding) group.mRepeatStart = start;
            }
            const bool endsEnding = ending != nullptr && ix == ending->mLast;
            if (!marks.mRepeatBackward && !(endsEnding && ending->mGoesBack)) {
                if (endsEnding && mPlan.mGroups[ending->mGroup].mBehind == ix + 1) start = ix + 1;
                continue;
            }
            measure.mRepeatStart =
                ending == nullptr ? start : mPlan.mGroups[ending->mGroup].mRepeatStart;
            measure.mRepeatTimes = TimesOf(marks, ending, timesAtStart);
            if (ending == nullptr || mPlan.mGroups[ending->mGroup].mBehind == ix + 1) {
                start = ix + 1;
                timesAtStart = 0;
            }
        }
    }

    [[nodiscard]] std::int32_t TimesOf(const TPlayMarks& marks, const TEnding* ending,
                                       std::int32_t timesAtStart) const {
        const std::int32_t told = marks.mRepeatTimes != 0 ? marks.mRepeatTimes : timesAtStart;
        if (ending == nullptr) return told != 0 ? told : 2;
        return std::max(told, mPlan.mGroups[ending->mGroup].HighestNumber());
    }

    // For a measure before the endings, the first of them stands for all.
    void FindRepeatEnds() {
        std::size_t end = kNoMeasure;
        for (std::size_t ix = mMeasures.size(); ix-- > 0;) {
            TMeasurePlan& measure = mPlan.mMeasures[ix];
            if (measure.mRepeatStart != kNoMeasure) end = ix;
            if (end == kNoMeasure || mPlan.mMeasures[end].mRepeatStart > ix) continue;
            if (measure.mEnding == kNoMeasure || measure.mEnding == mPlan.mMeasures[end].mEnding) {
                measure.mRepeatEnd = end;
            }
        }
    }

    // Signs of the coda alone come in pairs: from the first one to the second.
    void FindCodas() {
        CPlaces codas;
        std::vector<std::size_t> signs;
        bool hasToCoda = false;
        for (std::size_t ix = 0; ix < mMeasures.size(); ++ix) {
            if (Marks(ix).mToCoda.mIsSet) {
                hasToCoda = true;
            } else if (Marks(ix).mCoda.mIsSet) {
                codas.Add(ix, Marks(ix).mCoda.mName);
                signs.push_back(ix);
            }
        }
        for (std::size_t i = 0; !hasToCoda && i + 1 < signs.size(); i += 2) {
            SetCodaTarget(signs[i], signs[i + 1]);
        }
        for (std::size_t ix = 0; hasToCoda && ix < mMeasures.size(); ++ix) {
            const TJumpMark& toCoda = Marks(ix).mToCoda;
            if (!toCoda.mIsSet) continue;
            SetCodaTarget(ix, codas.Behind(ix, toCoda.mName).value_or(codas.First()));
        }
    }

    void SetCodaTarget(std::size_t ix, std::size_t coda) {
        mPlan.mMeasures[ix].mCodaTarget = coda;
        const std::size_t ending = mPlan.mMeasures[ix].mEnding;
        if (ending == kNoMeasure) return;
        TEndingGroup& group = mPlan.mGroups[mPlan.mEndings[ending].mGroup];
        group.mEndingWithToCoda = std::min(group.mEndingWithToCoda, ending);
    }

    void FindJumpTargets() {
        CPlaces segnos;
        for (std::size_t ix = 0; ix < mMeasures.size(); ++ix) {
            if (Marks(ix).mSegno.mIsSet) segnos.Add(ix, Marks(ix).mSegno.mName);
        }
        for (std::size_t ix = 0; ix < mMeasures.size(); ++ix) {
            if (!Marks(ix).Jumps()) continue;
            std::size_t target = 0;
            if (const TJumpMark& dalSegno = Marks(ix).mDalSegno; dalSegno.mIsSet) {
                const std::size_t first = segnos.First() == kNoMeasure ? 0 : segnos.First();
                target = segnos.UpTo(ix, dalSegno.mName).value_or(first);
            }
            mPlan.mMeasures[ix].mJumpTarget = target;
        }
    }

    [[nodiscard]] const TEnding* EndingAt(std::size_t ix) const {
        const std::size_t ending = mPlan.mMeasures[ix].mEnding;
        return ending == kNoMeasure ? nullptr : &mPlan.mEndings[ending];
    }

    const TScoreMeasures& mMeasures;
    TJumpPlan mPlan;
};

}  // namespace

TJumpPlan MakeJumpPlan(const TScoreMeasures& measures) {
    return CPlanner(measures).Make();
}

}  // namespace brindle
