// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/CSongModel.h"

#include <string>
#include <string_view>

namespace brindle {

/// What a song model file holds, or what is wrong with it.
struct CSongModelReading {
    CSongModel mModel;  ///< empty if the file is at fault
    /// Empty if the file was read.
    std::string mFault;
};

/// The songs of a model as JSON, docs/songwriting.md tells the form.
[[nodiscard]] std::string SongModelText(const CSongModel& model);

/// Reads what SongModelText wrote. A text of another version, with a value that makes no sense or
/// with a sum that does not fit its songs is refused as a whole.
[[nodiscard]] CSongModelReading ReadSongModel(std::string_view text);

/// Whether a text says of itself that it is a song model; not whether it is a good one.
[[nodiscard]] bool LooksLikeSongModel(std::string_view text);

}  // namespace brindle
