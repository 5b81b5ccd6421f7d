// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/ReadSong.h"

#include <cstddef>
#include <functional>
#include <string>
#include <vector>

namespace brindle {

/// A song of a source, which is read when it is wanted, on any thread.
struct CUnreadSong {
    std::function<CSong()> mRead;  ///< reads it, without a fault that is thrown
    /// What it takes in memory before it is read.
    std::size_t mByteCount = 0;
};

/// The songs that `ReadSongs` reads from the source, in their order, not yet read. There is at
/// least one, which may have a fault.
[[nodiscard]] std::vector<CUnreadSong> SplitSongs(std::string bytes,
                                                  const CSongOptions& prefs = {});

}  // namespace brindle
