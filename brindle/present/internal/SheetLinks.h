// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/ReadHarmony.h"
#include "brindle/present/internal/Sheet.h"

#include <cstddef>
#include <vector>

namespace brindle::LeadSheet {

/// Two chords on a lead sheet that belong together, by their indices in the song.
struct CSheetLink {
    std::size_t mFrom = 0;
    /// Behind `mFrom`; `kNone` for an arrow that leads back over a repeat sign.
    std::size_t mTo = kNone;
    /// An arrow from a substitute dominant, or a bracket to a chord that stands for a dominant.
    bool mIsDotted = false;

    friend bool operator==(const CSheetLink&, const CSheetLink&) = default;
};

struct CSheetLinks {
    /// From a dominant to the chord that it resolves to.
    std::vector<CSheetLink> mArrows;
    /// From a second to its dominant.
    std::vector<CSheetLink> mBrackets;
};

/// The links between chords that are drawn, in their order. Of the chords that lead to the same
/// chord the last one has the arrow. A passage that is drawn once for several times leads where
/// it leads the first time that this is not back.
[[nodiscard]] CSheetLinks MakeLinks(const CSong& song, const CSongReading& reading,
                                    const CSheet& sheet);

}  // namespace brindle::LeadSheet
