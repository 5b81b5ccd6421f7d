// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/internal/NamingScan.h"
#include "brindle/musicxml/internal/NoteWindows.h"
#include "brindle/theory/CSignKeyLite.h"

#include <vector>

namespace brindle {

/// A chord that a window can have: a type over a root, and what it costs there, in tenths of a bit.
struct CWindowChord {
    int mCost = 0;
    int mRoot = 0;
    std::size_t mType = 0;

    [[nodiscard]] bool IsSameChord(const CWindowChord& other) const {
        return mRoot == other.mRoot && mType == other.mType;
    }
    friend auto operator<=>(const CWindowChord&, const CWindowChord&) = default;
};

/// What a chord costs in a window.
[[nodiscard]] int CostOfWindowChord(const CNoteWindow& window, int root, std::size_t type,
                                    const CSignKeyLite& key);

/// The `count` chords that cost the least.
[[nodiscard]] std::vector<CWindowChord> LikeliestChords(const CNoteWindow& window,
                                                        const CSignKeyLite& key, std::size_t count);

/// The candidate of a name in which the whole chord sounds over the bass of the window.
[[nodiscard]] CNamingCandidate CandidateOf(const CWindowChord& chord, const CNoteWindow& window);

}  // namespace brindle
