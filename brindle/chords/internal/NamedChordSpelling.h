// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/internal/NamingScan.h"

#include <array>
#include <span>

namespace brindle {

/// The spelling that notes came with, by key; undefined for those that came without one. Of two
/// the last one counts.
using TGivenSpellings = std::array<CKeyEnh, 12>;

[[nodiscard]] TGivenSpellings GivenSpellings(std::span<const CNote> notes);

/// The degrees of a candidate, each at its tone; undefined at the tones that it does not have. They
/// are all of a type, also those that are left out.
using TDegreesOfTones = std::array<CChordDegree, 12>;

[[nodiscard]] TDegreesOfTones DegreesOfTones(const CNamingCandidate& candidate);

/// Spells a candidate: its root, its tones from the root and its bass.
class CNamedChordSpelling {
public:
    CNamedChordSpelling(const CNamingCandidate& candidate, const TGivenSpellings& given,
                        const CSignKeyLite& key);

    [[nodiscard]] const CKeyEnh& Root() const { return mRoot; }
    /// A tone that sounds or that is the bass.
    [[nodiscard]] CKeyEnh KeyOfTone(int tone) const;

private:
    TDegreesOfTones mDegrees;
    TToneMask mTones;
    CKeyEnh mRoot;
};

}  // namespace brindle
