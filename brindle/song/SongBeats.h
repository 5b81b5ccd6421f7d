// SPDX-License-Identifier: MIT
#pragma once

namespace brindle {

/// Shortest and longest step or bar that users may ask for; what lies beyond is a slip of the
/// finger.
inline constexpr double kFewestBeats = 1.0 / 1024;
inline constexpr double kMostBeats = 1024.0;  ///< see kFewestBeats

/// Whether a number will do as the beats of CSongOptions; false for what is no number.
[[nodiscard]] constexpr bool AreSongBeats(double beats) {
    return beats >= kFewestBeats && beats <= kMostBeats;
}

}  // namespace brindle
