// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/CSong.h"
#include "brindle/song/CSongModel.h"

#include <string>
#include <string_view>
#include <vector>

namespace brindle {

/// The songs of the built-in model: traditional ones, and those whose makers died before 1955 and
/// that appeared before 1930. With title, makers, style and chords; folk, hymn, ragtime, early jazz
/// and blues.
[[nodiscard]] std::vector<CSong> BuiltInSongs();

/// Who made a built-in song, with years, "Scott Joplin (1868-1917), 1901"; empty for a song that is
/// not built in.
[[nodiscard]] std::string_view BuiltInMakersOf(std::string_view title, std::string_view style);

/// A model of the built-in songs of a style, of all without one; empty for a style that is none.
[[nodiscard]] CSongModel BuiltInSongModel(std::string_view style = {});

}  // namespace brindle
