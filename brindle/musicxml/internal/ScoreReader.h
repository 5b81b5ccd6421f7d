// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/internal/WrittenScore.h"
#include "brindle/platform/XmlError.h"

#include <optional>
#include <string_view>

namespace brindle {

/// A score as it is written, or why there is none.
struct CScoreReading {
    CWrittenScore mScore;
    std::optional<XmlError> mError;
    /// Whether the score has more measures than can be played.
    bool mWasCut = false;
};

/// Reads a plain MusicXML text in one pass, by parts or by measures. The harmonies are those of the
/// first part that has any; the marks of all parts are joined.
[[nodiscard]] CScoreReading ReadScore(std::string_view bytes);

}  // namespace brindle
