// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstddef>
#include <string_view>

namespace brindle {

inline constexpr std::string_view kNoNumeralTarget =
    "a degree or a bass is expected behind the slash";

/// What the slashes cut. The views are pieces of the folded text.
struct CNumeralPieces {
    static constexpr std::size_t kMostTargets = 8;

    std::string_view mChord;
    std::array<std::string_view, kMostTargets> mTargets;
    std::size_t mTargetCount = 0;
    std::string_view mBass;
    /// Behind `/^`: the degree counts as it is written.
    bool mIsExactBass = false;
    /// The half-diminished sign of RomanText, vii/o7: then mChord is only the degree.
    std::string_view mSlashedTail;
    std::string_view mFault;
    std::string_view mFaultPiece;

    void Fail(std::string_view fault, std::string_view piece) {
        mFault = fault;
        mFaultPiece = piece;
    }
};

/// Cuts a folded numeral at its slashes: `V65/V/3` is a chord, what it is applied to, and a bass.
/// The slashes of a figure, 6/5, do not cut.
[[nodiscard]] CNumeralPieces NumeralPiecesOf(std::string_view text);

/// The head of the Neapolitan sixth, N6, stands for bII.
[[nodiscard]] constexpr bool IsWordOfNeapolitan(std::string_view text) {
    return text.starts_with('N');
}

}  // namespace brindle
