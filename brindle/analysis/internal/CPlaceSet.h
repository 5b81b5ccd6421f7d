// SPDX-License-Identifier: MIT
#pragma once

#include <bit>
#include <cstddef>
#include <cstdint>
#include <vector>

namespace brindle {

/// The number of a chord in a list, from 0.
using TPlace = std::uint32_t;
inline constexpr TPlace kNoPlace = UINT32_MAX;

/// A set of places in a list that finds the last member up to a place in a few steps: a tree of
/// words, in which each bit tells whether the word below it has any.
class CPlaceSet {
public:
    /// For the places below `count`.
    explicit CPlaceSet(std::size_t count) {
        do {
            count = (count + kBits - 1) / kBits;
            mLevels.emplace_back(count, 0);
        } while (count > 1);
    }

    void Insert(TPlace place) {
        for (auto& words : mLevels) {
            words[place / kBits] |= Bit(place);
            place /= kBits;
        }
    }

    void Erase(TPlace place) {
        for (auto& words : mLevels) {
            words[place / kBits] &= ~Bit(place);
            if (words[place / kBits] != 0) return;
            place /= kBits;
        }
    }

    /// The greatest member that is not above `place`, which is below the count.
    [[nodiscard]] TPlace LastUpTo(TPlace place) const {
        TPlace end = place + 1;
        for (std::size_t level = 0; level < mLevels.size(); ++level) {
            if (end % kBits != 0) {
                const std::uint64_t below = mLevels[level][end / kBits] & (Bit(end) - 1);
                if (below != 0) return Descend(level, end / kBits * kBits + LastBit(below));
            }
            end /= kBits;
        }
        return kNoPlace;
    }

private:
    static constexpr TPlace kBits = 64;

    static constexpr std::uint64_t Bit(TPlace place) { return std::uint64_t{1} << place % kBits; }
    static TPlace LastBit(std::uint64_t word) {
        return kBits - 1 - static_cast<TPlace>(std::countl_zero(word));
    }
    [[nodiscard]] TPlace Descend(std::size_t level, TPlace place) const {
        while (level-- > 0) place = place * kBits + LastBit(mLevels[level][place]);
        return place;
    }

    std::vector<std::vector<std::uint64_t>> mLevels;
};

}  // namespace brindle
