// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/markov/CMarkovObjects.h"

#include <cstdint>
#include <map>
#include <set>
#include <vector>

namespace brindle {

/// What a template search remembers: its way, and the dead ends that it found.
class TMarkovSamplingInformation {
public:
    /// The depth of the search at each step.
    std::vector<std::int32_t> mDepths;
    /// The position in beats at each step.
    std::vector<double> mBeats;
    /// The number of candidates at each step.
    std::vector<std::int32_t> mBranching;
    /// Seconds of the last run.
    double mTime = 0.0;
    /// How often IsBlocklisted said yes.
    std::int32_t mBlockedCount = 0;
    /// Whether the last search ran out of steps.
    bool mHasGivenUp = false;

    /// Empties the three lists, with `blocklistToo` also the blocklist and its counter.
    void Clear(bool blocklistToo);

    /// Remembers that nothing fits at this position behind any history that ends in this one. Of
    /// several such histories only the shortest stays.
    void AddToBlocklist(double beats, MarkovSequenceView history);
    /// Whether the history ends in one that is blocked at exactly this position. A hit is counted.
    bool IsBlocklisted(double beats, MarkovSequenceView history);
    /// The same without counting.
    [[nodiscard]] bool IsDeadEnd(double beats, MarkovSequenceView history) const;
    /// The number of dead ends.
    [[nodiscard]] std::size_t BlocklistSize() const;

private:
    /// Compares from the newest symbol back, so that histories of one end stand side by side.
    struct CFromNewest {
        using is_transparent = void;
        bool operator()(MarkovSequenceView a, MarkovSequenceView b) const;
    };
    using THistories = std::set<MarkovSequence, CFromNewest>;

    [[nodiscard]] static THistories::const_iterator EndOf(const THistories& histories,
                                                          MarkovSequenceView history);

    std::map<double, THistories> mBlocklist;
};

}  // namespace brindle
