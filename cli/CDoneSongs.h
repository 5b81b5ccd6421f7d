// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace brindle::cli {

/// The songs of an earlier output, by what its lines tell of their sources: 16 bytes a song. Two
/// sources share a key once in 2^64 times.
///
/// A line stands for one song. Of two sources that are told alike, as when a file is named twice or
/// its name is no UTF-8, the first takes the first line.
class CDoneSongs {
public:
    /// Reads the lines of an output. Nothing, with the error printed, when it cannot be read or has
    /// other lines. A last line that is half written is cut off if the standard output goes on with
    /// the same file, else a warning tells of it.
    [[nodiscard]] static std::optional<CDoneSongs> Read(const std::string& path);

    /// Takes all songs of a file if they are done: how many, or 0.
    [[nodiscard]] std::size_t TakeAll(std::string_view path, std::string_view member);
    /// Whether that one is done; it is taken then.
    [[nodiscard]] bool Take(std::string_view path, std::string_view member, std::size_t number);

private:
    struct CSongKey {
        std::uint64_t mSource = 0;
        std::uint32_t mNumber = 0;
        /// How many songs the source has; 0 when the line was taken.
        std::uint32_t mCount = 0;
    };

    [[nodiscard]] bool AddLine(std::string_view line);
    void Sort();
    [[nodiscard]] CSongKey* Find(std::uint64_t source, std::size_t number);

    std::vector<CSongKey> mSongs;  // sorted by source and number
};

}  // namespace brindle::cli
