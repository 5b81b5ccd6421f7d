// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/KeyIntervals.h"

#include <string>

namespace brindle {

/// A tone of a chord as its name counts it from the root: {9, -1} is b9, the flat ninth.
struct CChordDegree {
    /// 1 to 7, 9, 11 or 13; 0 for none.
    int mNumber = 0;
    /// Semitones by which it is raised, negative for flat. Those of a major scale have none, and
    /// the seventh without a sign is the major one.
    int mSigns = 0;

    /// Whether it is no degree.
    [[nodiscard]] constexpr bool IsUndef() const { return mNumber == 0; }
    /// Semitones above the root, 0 to 11; -1 for none.
    [[nodiscard]] constexpr int Tone() const {
        if (mNumber < 1) return -1;
        return (kNaturalKeyNrs[static_cast<unsigned>(mNumber - 1) % 7] + mSigns + 24) % 12;
    }
    /// The key of this tone over a root, with the letter that its number asks for. Undefined where
    /// that takes more than a double sign, and over the undefined root.
    [[nodiscard]] CKeyEnh KeyOver(const CKeyEnh& root) const;
    /// "5", "b9", "#11".
    [[nodiscard]] std::string Name() const;

    friend constexpr bool operator==(const CChordDegree&, const CChordDegree&) = default;
};

}  // namespace brindle
