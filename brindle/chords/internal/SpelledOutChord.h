// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/ChordDegree.h"
#include "brindle/chords/internal/NamingTypes.h"

#include <bit>
#include <string>

namespace brindle {

/// Tones of no known chord type, told one by one over a root that sounds: `Cm(b9,add9,no5)`.
class CSpelledOutChord {
public:
    /// `tones` has the root.
    constexpr explicit CSpelledOutChord(TToneMask tones) : mOptions(tones & ~TToneMask{1}) {
        mThird = TakeFirst({4, 3, 5, 2});
        mSeventh = TakeFirst({10, 11, 9});
        mHasFifth = TakeFirst({7}) == 7;
    }

    /// What stands in brackets behind the name.
    [[nodiscard]] constexpr int OptionsCount() const {
        return std::popcount(mOptions) + (HasNoThird() ? 1 : 0) + (HasNoFifth() ? 1 : 0);
    }
    [[nodiscard]] constexpr bool HasNoThird() const { return mThird < 0; }
    [[nodiscard]] constexpr bool HasNoFifth() const {
        return !mHasFifth && (mOptions & kAlteredFifths) == 0;
    }
    /// The tones that are told in brackets.
    [[nodiscard]] constexpr TToneMask Options() const { return mOptions; }
    /// The degree as which a tone that sounds is told.
    [[nodiscard]] CChordDegree DegreeOf(int tone) const;
    /// What stands behind the root, without brackets: "m7", "6sus2".
    [[nodiscard]] std::string Head() const;

private:
    static constexpr TToneMask kAlteredFifths = 0x140;  // 6 8

    /// Removes the first of these tones that is there; -1 if none is.
    constexpr int TakeFirst(std::initializer_list<int> tones) {
        for (const int tone : tones) {
            if (!HasTone(mOptions, tone)) continue;
            mOptions &= ~(TToneMask{1} << tone);
            return tone;
        }
        return -1;
    }

    TToneMask mOptions;
    int mThird = -1;
    int mSeventh = -1;
    bool mHasFifth = false;
};

}  // namespace brindle
