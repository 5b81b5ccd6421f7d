// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/CSongModel.h"

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace brindle {

/// The styles of the songs of a model, each once, in alphabetic order.
[[nodiscard]] std::vector<std::string> StylesOf(const CSongModel& model);

/// Whether two names of styles are one: "Hymn" and "hymn".
[[nodiscard]] bool IsSameStyle(std::string_view a, std::string_view b);

/// The model of those songs that have a style; nothing if there are none.
[[nodiscard]] std::optional<CSongModel> ModelOfStyle(const CSongModel& model,
                                                     std::string_view style);

}  // namespace brindle
