// SPDX-License-Identifier: MIT
#include "brindle/musicxml/internal/JumpPlan.h"

#include <algorithm>
#include <map>
#include <optional>
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

/// The ways of jumps.
class CJumps {
public:
    CJumps(TMarksOfMeasures marks, CJumpPlan& plan) : mMarks(marks), mPlan(plan) {}

    void Plan() {
        FindCodas();
        FindJumpTargets();
    }

private:
    // Signs of the coda alone come in pairs: from the first one to the second.
    void FindCodas() {
        CPlaces codas;
        std::vector<std::size_t> signs;
        bool hasToCoda = false;
        for (std::size_t ix = 0; ix < mMarks.size(); ++ix) {
            if (mMarks[ix].mToCoda.mIsSet) {
                hasToCoda = true;
            } else if (mMarks[ix].mCoda.mIsSet) {
                codas.Add(ix, mMarks[ix].mCoda.mName);
                signs.push_back(ix);
            }
        }
        for (std::size_t i = 0; !hasToCoda && i + 1 < signs.size(); i += 2) {
            SetCodaTarget(signs[i], signs[i + 1]);
        }
        for (std::size_t ix = 0; hasToCoda && ix < mMarks.size(); ++ix) {
            const CJumpMark& toCoda = mMarks[ix].mToCoda;
            if (!toCoda.mIsSet) continue;
            SetCodaTarget(ix, codas.Behind(ix, toCoda.mName).value_or(codas.First()));
        }
    }

    void SetCodaTarget(std::size_t ix, std::size_t coda) {
        mPlan.mMeasures[ix].mCodaTarget = coda;
        const std::size_t ending = mPlan.mMeasures[ix].mEnding;
        if (ending == kNoMeasure) return;
        CEndingGroup& group = mPlan.mGroups[mPlan.mEndings[ending].mGroup];
        group.mEndingWithToCoda = std::min(group.mEndingWithToCoda, ending);
    }

    void FindJumpTargets() {
        CPlaces segnos;
        for (std::size_t ix = 0; ix < mMarks.size(); ++ix) {
            if (mMarks[ix].mSegno.mIsSet) segnos.Add(ix, mMarks[ix].mSegno.mName);
        }
        for (std::size_t ix = 0; ix < mMarks.size(); ++ix) {
            if (!mMarks[ix].Jumps()) continue;
            std::size_t target = 0;
            if (const CJumpMark& dalSegno = mMarks[ix].mDalSegno; dalSegno.mIsSet) {
                const std::size_t first = segnos.First() == kNoMeasure ? 0 : segnos.First();
                target = segnos.UpTo(ix, dalSegno.mName).value_or(first);
            }
            mPlan.mMeasures[ix].mJumpTarget = target;
        }
    }

    TMarksOfMeasures mMarks;
    CJumpPlan& mPlan;
};

}  // namespace

CJumpPlan MakeJumpPlan(TMarksOfMeasures marks) {
    CJumpPlan plan;
    plan.mMeasures.resize(marks.size());
    PlanEndings(marks, plan);
    PlanRepeats(marks, plan);
    CJumps(marks, plan).Plan();
    return plan;
}

}  // namespace brindle
