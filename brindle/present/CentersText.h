// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/CPaint.h"
#include "brindle/present/ShownSong.h"

#include <string>

namespace brindle {

/// The centers of an analysis for people: a line for each key signature, under it its centers,
/// under these their chords; and all readings, if the song has them.
[[nodiscard]] std::string CentersText(const CShownSong& song, const CPaint& paint);

}  // namespace brindle
