// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/guitarchords/GChShortTuning.h"

#include <optional>
#include <span>
#include <string_view>

namespace brindle {

/// A tuning that has a name of its own.
struct CNamedTuning {
    /// As people type it: "drop-d".
    std::string_view mName;
    /// As a title: "Drop D".
    std::string_view mTitle;
    /// Another name, perhaps its letters; empty for none.
    std::string_view mAlias;
    GChShortTuning mTuning{};  ///< from the string with the lowest index
};

/// The usual tunings of guitar, bass, ukulele, mandolin, banjo and cavaquinho. Guitars and basses
/// stand as they are written, an octave above their sound.
[[nodiscard]] std::span<const CNamedTuning> NamedTunings();

/// The tuning of a name, a title or an alias, whatever its case, with blanks, underscores or
/// hyphens between its words or nothing: "Drop D", "drop_d", "DropD".
[[nodiscard]] std::optional<GChShortTuning> TuningOfName(std::string_view name);

/// The title of exactly this tuning; empty if it has none.
[[nodiscard]] std::string_view TitleOfTuning(const GChShortTuning& tuning);

}  // namespace brindle
