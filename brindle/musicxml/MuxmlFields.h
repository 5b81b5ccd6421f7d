// SPDX-License-Identifier: MIT
#pragma once

#include <string_view>
#include <tuple>

namespace brindle {

/// A field of a record by its name. Each record of an import gives the tuple of its fields in their
/// order as `Fields()`, from which it is printed and written as JSON (MuxmlJson.h).
template <class Record, class Value>
struct CMuxmlField {
    std::string_view mName;
    Value Record::*mMember;
};

/// A block of fields that a record begins with: one of its base classes.
template <class Block>
struct CMuxmlBlock {
    std::string_view mName;
};

template <class Record, class Value>
[[nodiscard]] constexpr CMuxmlField<Record, Value> MuxmlField(std::string_view name,
                                                              Value Record::*member) {
    return {name, member};
}

template <class T>
concept MuxmlRecord = requires {
    T::Fields();
};

}  // namespace brindle
