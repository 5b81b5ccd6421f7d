// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CopiedPassages.h"
#include "brindle/analysis/internal/CPassageLengths.h"
#include "brindle/analysis/internal/CPlaceSet.h"

#include <cstddef>
#include <cstdint>
#include <vector>

namespace brindle {

/// Decides which repeating sequences become copies. Sequences are tried in their order; each takes
/// the chords of its starts that no sequence took before, and its first start is searched for
/// shorter repetitions before them.
///
/// Sources do not overlap and are at most half of the passage that they stand in, so the search in
/// them looks at each start of each sequence at most once for each halving: with e starts in all it
/// takes e log e log n steps.
class CCopyFinder {
public:
    /// `chords` is the passage to search, `start` the place of its first chord in the list that the
    /// sequences count from. The arguments must stay as long as the finder.
    CCopyFinder(const CHarmAnlsChordsWithLength& chords, const THarmRepeatingSequences& sequences,
                std::uint64_t start);

    /// Appends the copies; the passage begins at `position` in beats. Their chords are counted from
    /// the first of the passage.
    void AppendCopies(std::int32_t position, std::vector<CCopiedPassage>& copies);

private:
    struct CStart {
        TPlace mSequence;
        TPlace mPlace;
    };
    using TStarts = std::vector<CStart>;

    static bool ComesFirst(const CStart& a, const CStart& b) {
        return a.mSequence != b.mSequence ? a.mSequence < b.mSequence : a.mPlace < b.mPlace;
    }

    void Fill(TPlace first, TPlace end, std::int32_t position, const TStarts& starts,
              std::vector<CCopiedPassage>& copies);
    void FillFromSequence(const TStarts& places, TPlace first,
                          const std::vector<std::int32_t>& beatsTo, std::int32_t position,
                          std::vector<CCopiedPassage>& copies);
    void FillFromSource(TPlace source, TPlace length, std::int32_t position,
                        std::vector<CCopiedPassage>& copies);
    [[nodiscard]] TPlace LengthOf(TPlace sequence) const;
    [[nodiscard]] bool IsFree(const CStart& start) const;
    void Cover(const CStart& start);

    const CHarmAnlsChordsWithLength& mChords;
    const THarmRepeatingSequences& mSequences;
    CPassageLengths mLengths;
    CPlaceSet mCovered;
    // Starts in the passage: in the order of the sequences, and by place, where those of place p
    // are from mFirstAtPlace[p] to mFirstAtPlace[p + 1].
    TStarts mStarts;
    std::vector<TPlace> mSequencesByPlace;
    std::vector<std::size_t> mFirstAtPlace;
};

}  // namespace brindle
