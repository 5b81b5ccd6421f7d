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

/// The styles of the built-in songs, in alphabetic order.
[[nodiscard]] std::vector<std::string> BuiltInStyles();

/// A model of the built-in songs of a style, of all without one; empty for a style that is none.
[[nodiscard]] CSongModel BuiltInSongModel(std::string_view style = {});

}  // namespace brindle
