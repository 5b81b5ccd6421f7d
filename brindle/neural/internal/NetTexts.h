// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/neural/NetProperties.h"

#include <array>
#include <string_view>

namespace brindle {

/// The words for a net's types: in its report, and in its source and property forms.
struct CNetTypeWords {
    std::string_view mReport;
    std::string_view mSource;
};

inline constexpr std::array<CNetTypeWords, 5> kInputTypeWords = {{
    {"Sum", "INPUT_SUM"},
    {"Minimum", "INPUT_MIN"},
    {"Maximum", "INPUT_MAX"},
    {"Average", "INPUT_AVG"},
    {"Product", "INPUT_PROD"},
}};

inline constexpr std::array<CNetTypeWords, 4> kActTypeWords = {{
    {"Sigmoid", "ACT_SIGM"},
    {"Linear", "ACT_LIN"},
    {"Tanhyp", "ACT_TANHYP"},
    {"Ident. Projection", "ACT_IDENT"},
}};

inline constexpr std::array<CNetTypeWords, 2> kOutputTypeWords = {{
    {"None", "OUTPUT_NONE"},
    {"Binary", "OUTPUT_BIN"},
}};

/// The line before the weights in the property form.
inline constexpr std::string_view kWeightDefinitionsLine = "weight definitions";

}  // namespace brindle
