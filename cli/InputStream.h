// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <functional>
#include <optional>
#include <string>

namespace brindle::cli {

/// The bytes of a pipe, a terminal or a device, which may be long in coming; "-" is standard input.
/// Nothing when they cannot be read, are more than `limit`, or `isEndAsked`, which is called
/// several times a second as long as they are waited for, says so.
[[nodiscard]] std::optional<std::string> ReadInputStream(const std::string& path, std::size_t limit,
                                                         const std::function<bool()>& isEndAsked);

}  // namespace brindle::cli
