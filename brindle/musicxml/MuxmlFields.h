// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <string_view>
#include <tuple>
#include <type_traits>
#include <utility>

namespace brindle {

/// A field of a record by its name. Each record of an import gives the tuple of its fields in their
/// order as `Fields()`, from which it is printed and written as JSON (MuxmlJson.h).
template <class Record, class Value>
struct CMuxmlField {
    std::string_view mName;  ///< as in the source, "mFifths"
    Value Record::*mMember;  ///< where a record has it
};

/// A block of fields that a record begins with: one of its base classes.
template <class Block>
struct CMuxmlBlock {
    std::string_view mName;  ///< that of the class
};

/// A row of a tuple of fields.
template <class Record, class Value>
[[nodiscard]] constexpr CMuxmlField<Record, Value> MuxmlField(std::string_view name,
                                                              Value Record::*member) {
    return {name, member};
}

/// For counting only: becomes whatever an aggregate is made of.
struct CMuxmlAnyValue {
    /// Declared only: no value is ever made.
    template <class Value>
    operator Value() const;
};

/// Whether a record can be made of so many values.
template <class Record, std::size_t... Numbers>
[[nodiscard]] constexpr bool MuxmlTakesValues(std::index_sequence<Numbers...>) {
    return requires {
        Record{(static_cast<void>(Numbers), CMuxmlAnyValue{})...};
    };
}

/// How many fields and base classes an aggregate has.
template <class Record, std::size_t Count = 1>
[[nodiscard]] constexpr std::size_t MuxmlCountFields() {
    if constexpr (MuxmlTakesValues<Record>(std::make_index_sequence<Count + 1>())) {
        return MuxmlCountFields<Record, Count + 1>();
    } else {
        return Count;
    }
}

/// Whether a row of the tuple is a field of the record itself, and not one of its blocks.
template <class Record, class Field>
inline constexpr bool kIsMuxmlFieldOf = false;
/// It is, where both name the same record.
template <class Record, class Value>
inline constexpr bool kIsMuxmlFieldOf<Record, CMuxmlField<Record, Value>> = true;

/// Whether any row of the tuple is such a field.
template <class Record, class... Fields>
[[nodiscard]] constexpr bool MuxmlHasOwnFields(const std::tuple<Fields...>&) {
    return (kIsMuxmlFieldOf<Record, Fields> || ...);
}

/// Whether `Fields()` forgets none of the fields. What is no aggregate cannot be counted, and a
/// record without fields of its own has those of its bases.
template <class Record>
[[nodiscard]] constexpr bool MuxmlNamesAllFields() {
    if constexpr (std::is_aggregate_v<Record> && MuxmlHasOwnFields<Record>(Record::Fields())) {
        return std::tuple_size_v<decltype(Record::Fields())> == MuxmlCountFields<Record>();
    } else {
        return true;
    }
}

/// A record of an import: it gives its fields as `Fields()`.
template <class T>
concept MuxmlRecord = requires {
    T::Fields();
};

}  // namespace brindle
