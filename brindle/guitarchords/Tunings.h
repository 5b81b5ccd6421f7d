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

/// Whether a string is tuned higher than the one behind it, as the G of a ukulele is.
[[nodiscard]] bool IsReentrant(const GChShortTuning& tuning);

/// Whether the lowest note of a chord is heard as its bass. It is not on a re-entrant tuning, nor
/// on up to four strings that are no bass guitar, which lies below C2 or has fourths from string to
/// string: what a guitarist would call inversions are the usual shapes of mandolin, cavaquinho and
/// baritone ukulele.
[[nodiscard]] bool BearsBass(const GChShortTuning& tuning);

/// Whether the first of five strings is the short one of a banjo, which sounds above all others and
/// begins at the fifth fret: it is left open or does not sound.
[[nodiscard]] bool HasShortString(const GChShortTuning& tuning);

}  // namespace brindle
