// SPDX-License-Identifier: MIT
#pragma once

#include <nlohmann/json_fwd.hpp>
#include <string>
#include <string_view>

namespace brindle {

// JSON as all of ours is written: UTF-8 in which unprintable characters (see IsUnprintable) are
// escaped, so that it can be shown as it is and a reader gets what it was made of. Bytes that are
// no UTF-8 become U+FFFD.

/// A text in quotation marks.
[[nodiscard]] std::string JsonString(std::string_view text);

/// A value on one line without blanks and without its end.
[[nodiscard]] std::string DumpJson(const nlohmann::json& value);
/// The same of one whose members keep their order.
[[nodiscard]] std::string DumpJson(const nlohmann::ordered_json& value);

/// The value that a text tells; `is_discarded()` of it where the text is no JSON.
[[nodiscard]] nlohmann::json ParseJson(std::string_view text);

}  // namespace brindle
