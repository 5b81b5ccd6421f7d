// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/guitarchords/CFingering.h"

#include <array>
#include <cstdint>
#include <optional>
#include <span>

namespace brindle {

/// The fingers that hold some frets.
struct CHand {
    std::array<CFingerPlace, kHandFingers> mPlaces{};
    int mCount = 0;
    int mBarres = 0;
    /// Barres of other fingers than the index that must not touch the string above.
    int mBentBarres = 0;
    /// Half frets that neighbouring fingers are pulled apart; up the neck a fret is one.
    int mStretch = 0;
    /// Frets beyond three under the hand.
    int mExtraWidth = 0;
    /// How hard it is to hold: about 60 make a step of difficulty.
    int mEffort = 0;
};

/// 0 to 9.
[[nodiscard]] int DifficultyOf(const CHand& hand);

/// The easiest way to hold frets (of each string: kMutedString, 0 open, from 1 pressed); nothing if
/// four fingers cannot.
///
/// A barre of the index finger lies at the lowest fret, and other fingers may be put down on its
/// strings further up; a barre of another finger covers neighbouring strings of one fret. Each such
/// row of strings is tried as a barre and as single fingers.
[[nodiscard]] std::optional<CHand> HandOf(std::span<const std::int8_t> frets);

}  // namespace brindle
