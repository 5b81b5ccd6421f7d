// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>
#include <utility>

namespace brindle {

/// A small generator of random numbers that depend on nothing but its seed, so that a run can be
/// repeated on any machine and with any standard library. Not for secrets.
///
/// The steps are those of SplitMix64: a counter that grows by the golden ratio, then mixed.
class SeededRandom {
public:
    /// Equal seeds give equal numbers; any seed will do, 0 too.
    constexpr explicit SeededRandom(std::uint64_t seed) : mState(seed) {}

    /// 32 random bits.
    constexpr std::uint32_t Next() {
        mState += 0x9E3779B97F4A7C15U;
        std::uint64_t bits = mState;
        bits = (bits ^ (bits >> 30U)) * 0xBF58476D1CE4E5B9U;
        bits = (bits ^ (bits >> 27U)) * 0x94D049BB133111EBU;
        return static_cast<std::uint32_t>((bits ^ (bits >> 31U)) >> 32U);
    }

    /// A number from 0 to `bound` - 1; 0 if `bound` is 0. Evenly spread as far as 32 bits allow.
    constexpr std::uint32_t Below(std::uint32_t bound) {
        return static_cast<std::uint32_t>((std::uint64_t{Next()} * bound) >> 32U);
    }

    /// A number from 0.0 up to, but not including, 1.0.
    constexpr double Fraction() { return Next() * (1.0 / 4294967296.0); }

private:
    std::uint64_t mState;
};

/// Puts `items` (an indexed container of at most 2^32 elements) into a random order.
template <class Container>
constexpr void Shuffle(Container& items, SeededRandom& random) {
    for (std::size_t left = items.size(); left > 1; --left) {
        using std::swap;
        swap(items[left - 1], items[random.Below(static_cast<std::uint32_t>(left))]);
    }
}

}  // namespace brindle
