// SPDX-License-Identifier: MIT
#pragma once

// Internal to musicxml/: tables of what is done at elements, written in their own order and
// searched by name.

#include <array>
#include <cstddef>
#include <string_view>

namespace brindle::muxml {

/// Rows with a name in `mElement`, no name twice. Finding one takes time with the logarithm of
/// their number.
template <class Row, std::size_t Count>
class CElementTable {
public:
    constexpr explicit CElementTable(const std::array<Row, Count>& rows) : mRows(rows) {
        for (std::size_t n = 0; n < Count; ++n) {
            std::size_t place = n;
            for (; place > 0 && Name(place - 1) > mRows[n].mElement; --place) {
                mOrder[place] = mOrder[place - 1];
            }
            mOrder[place] = n;
        }
    }

    /// The row of the element; null when there is none.
    [[nodiscard]] constexpr const Row* Find(std::string_view element) const {
        std::size_t begin = 0;
        std::size_t end = Count;
        while (begin < end) {
            const std::size_t middle = begin + (end - begin) / 2;
            const int difference = Name(middle).compare(element);
            if (difference == 0) return &mRows[mOrder[middle]];
            (difference < 0 ? begin : end) = difference < 0 ? middle + 1 : middle;
        }
        return nullptr;
    }

    [[nodiscard]] constexpr bool HasNoNameTwice() const {
        for (std::size_t place = 1; place < Count; ++place) {
            if (Name(place - 1) == Name(place)) return false;
        }
        return true;
    }

private:
    [[nodiscard]] constexpr std::string_view Name(std::size_t place) const {
        return mRows[mOrder[place]].mElement;
    }

    std::array<Row, Count> mRows;
    std::array<std::size_t, Count> mOrder{};
};

}  // namespace brindle::muxml
