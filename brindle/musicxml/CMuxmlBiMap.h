// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstddef>
#include <optional>
#include <string_view>

namespace brindle {

/// A word of a score and the value that it stands for.
template <class Value>
struct CMuxmlWord {
    Value mValue;            ///< what records hold
    std::string_view mWord;  ///< exactly as the file has it; lives as long as the program
};

/// A closed list of words, read in both directions. It is a constant of the program, so that no
/// table has to be filled before the first import.
template <class Value, std::size_t Count>
struct CMuxmlBiMap {
    std::array<CMuxmlWord<Value>, Count> mRows;  ///< in any order; looked up from the first on

    /// Words are compared exactly; nothing for a word that the list does not hold.
    [[nodiscard]] constexpr std::optional<Value> ValueOf(std::string_view word) const {
        for (const CMuxmlWord<Value>& row : mRows) {
            if (row.mWord == word) return row.mValue;
        }
        return std::nullopt;
    }

    /// Nothing for a value without a word.
    [[nodiscard]] constexpr std::optional<std::string_view> WordOf(Value value) const {
        for (const CMuxmlWord<Value>& row : mRows) {
            if (row.mValue == value) return row.mWord;
        }
        return std::nullopt;
    }

    /// Whether no value and no word occurs twice.
    [[nodiscard]] constexpr bool IsOneToOne() const {
        for (const CMuxmlWord<Value>& row : mRows) {
            if (ValueOf(row.mWord) != row.mValue || WordOf(row.mValue) != row.mWord) return false;
        }
        return true;
    }
};

/// Makes the list from its rows.
template <class Value, std::size_t Count>
[[nodiscard]] constexpr CMuxmlBiMap<Value, Count> MuxmlBiMap(
    const CMuxmlWord<Value> (&rows)[Count]) {
    return {std::to_array(rows)};
}

/// The words of an enumeration: `mBiMap<TMuxmlEnum_Step>.ValueOf("C")`.
template <class Enumeration>
inline constexpr int mBiMap = 0;

/// The value of a word; `fallBack` for a word that the list of the enumeration does not hold.
template <class Enumeration>
[[nodiscard]] constexpr Enumeration MuxmlValueOf(std::string_view word, Enumeration fallBack) {
    return mBiMap<Enumeration>.ValueOf(word).value_or(fallBack);
}

}  // namespace brindle
