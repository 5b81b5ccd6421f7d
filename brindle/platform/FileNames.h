// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/platform/Ascii.h"

#include <algorithm>
#include <cstddef>
#include <string_view>

namespace brindle {

/// Whether a word ends as names of files do: song.txt, My Song.TXT, songs/blues.musicxml; no link
/// and no "C." does.
[[nodiscard]] inline bool HasFileEnding(std::string_view word) {
    constexpr std::size_t shortest = 2;
    constexpr std::size_t longest = 8;
    const std::size_t dot = word.rfind('.');
    if (dot == word.npos || dot == 0 || word.find("://") != word.npos) return false;
    const std::string_view ending = word.substr(dot + 1);
    return ending.size() >= shortest && ending.size() <= longest &&
           std::all_of(ending.begin(), ending.end(), Ascii::IsLetter);
}

/// Whether a word, of which no file was found, was meant as the name of one rather than as music:
/// by its ending, or since it begins as a path does. Asks no file system.
[[nodiscard]] inline bool LooksLikeFileName(std::string_view word) {
    if (word.find_first_of("|\n") != word.npos) return false;
    for (const std::string_view start : {"/", "./", "../", "~/"}) {
        if (word.starts_with(start)) return true;
    }
    return HasFileEnding(word);
}

}  // namespace brindle
