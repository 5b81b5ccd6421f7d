// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/CPaint.h"
#include "brindle/present/ShownSong.h"

#include <string>

namespace brindle {

/// An analysis for people: a line for each sign key, under it its centers, under these their
/// chords.
[[nodiscard]] std::string AnalysisText(const CShownSong& song, const CPaint& paint);

}  // namespace brindle
