// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/internal/NamingTypes.h"
#include "brindle/theory/CSemitones.h"

#include <cstddef>
#include <cstdint>
#include <string_view>

namespace brindle {

// The table of chord types that names are found in is the one that other tables of chords are
// derived from, or held against.

/// Never defined: a table that names a chord type which does not exist does not compile.
void ThereIsNoSuchChordKind();

/// The tones of the chord type that has this behind its root: 0 3 6 10 for "m7b5". With the ninth
/// and the eleventh below an eleventh and a thirteenth.
[[nodiscard]] consteval CSemitones TonesOfChordKind(std::string_view suffix) {
    for (std::size_t ix = 0; ix < kNamingTypeRows.size(); ++ix) {
        if (kNamingTypeRows[ix].mSuffix != suffix) continue;
        return CSemitones(std::uint64_t{kNamingTypes[ix].mTones});
    }
    ThereIsNoSuchChordKind();
    return {};
}

}  // namespace brindle
