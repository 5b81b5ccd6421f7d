// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/platform/XmlStreamParser.h"

#include <initializer_list>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace brindle {

/// The attributes of one element, kept beyond the event that brought them.
class CMuxmlAttributes {
public:
    /// No attributes.
    CMuxmlAttributes() = default;
    /// Copies of these names and values.
    CMuxmlAttributes(
        std::initializer_list<std::pair<const std::string_view, std::string_view>> attributes);

    /// Takes over the attributes of an event. Texts that are held already lend their memory.
    void Assign(const XmlAttributes& attributes);
    void Clear() { mCount = 0; }  ///< forgets them, their memory is kept

    /// Value of the attribute; nothing if it is not there.
    [[nodiscard]] std::optional<std::string_view> Find(std::string_view name) const;

private:
    std::vector<std::pair<std::string, std::string>> mAttributes;
    std::size_t mCount = 0;  ///< how many of them are in use
};

}  // namespace brindle
