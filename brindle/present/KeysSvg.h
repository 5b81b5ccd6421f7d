// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/ShownSong.h"

#include <string>

namespace brindle {

/// The keys of a song as a picture: a ribbon of its regions, with the chords and their numerals
/// under it.
[[nodiscard]] std::string KeysSvg(const CShownSong& song);

}  // namespace brindle
