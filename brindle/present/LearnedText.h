// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/markov/VariableLengthMarkovModel.h"
#include "brindle/song/CSongModel.h"

#include <cstddef>
#include <string>
#include <utility>
#include <vector>

namespace brindle {

/// What a plain model was taught.
struct CLearnReport {
    std::size_t mFiles = 0;   ///< that were read
    std::size_t mChords = 0;  ///< in all of them
    /// Names of files that could not be read, and what is wrong with them.
    std::vector<std::pair<std::string, std::string>> mUnread;
};

/// What was learned, and how large the model is, as a line of text and as JSON, see docs/json.md.
[[nodiscard]] std::string LearnedText(const CLearnReport& report,
                                      const VariableLengthMarkovModel& model);
/// The same as JSON, see docs/json.md.
[[nodiscard]] std::string LearnedJson(const CLearnReport& report,
                                      const VariableLengthMarkovModel& model);

/// The same for a model of songs, which were in so many files.
[[nodiscard]] std::string LearnedSongsText(const CSongModel& model, std::size_t files);
/// The same as JSON, see docs/json.md.
[[nodiscard]] std::string LearnedSongsJson(const CSongModel& model, std::size_t files);

}  // namespace brindle
