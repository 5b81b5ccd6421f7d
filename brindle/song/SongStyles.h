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

/// The model of those songs that have a style; nothing if there are none.
[[nodiscard]] std::optional<CSongModel> ModelOfStyle(const CSongModel& model,
                                                     std::string_view style);

}  // namespace brindle
