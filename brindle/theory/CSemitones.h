// SPDX-License-Identifier: MIT
#pragma once

#include <bit>
#include <cstdint>
#include <iosfwd>

namespace brindle {

/// A set of intervals above a root within one octave: bit n is set when the tone n semitones
/// above the root is there. Bits 0 to 11 are used. The major scale is 2741.
class CSemitones {
public:
    constexpr CSemitones() = default;
    constexpr explicit CSemitones(std::uint64_t mask) : mMask(mask) {}

    [[nodiscard]] constexpr std::uint64_t Mask() const { return mMask; }
    [[nodiscard]] constexpr bool IsEmpty() const { return mMask == 0; }
    /// Number of intervals in the set.
    [[nodiscard]] constexpr int size() const { return std::popcount(mMask); }

    /// Writes the twelve bits from bit 0 as `[1,0,...]`.
    void AppendJSONString(std::ostream& stream) const;

    friend constexpr bool operator==(const CSemitones&, const CSemitones&) = default;
    friend constexpr auto operator<=>(const CSemitones&, const CSemitones&) = default;

private:
    std::uint64_t mMask = 0;
};

std::ostream& operator<<(std::ostream& stream, const CSemitones& semitones);

inline constexpr CSemitones CSemitones_Undef{};
inline constexpr CSemitones kSemitonesMajor{0xAB5};         // 0 2 4 5 7 9 11
inline constexpr CSemitones kSemitonesNaturalMinor{0x5AD};  // 0 2 3 5 7 8 10

}  // namespace brindle
