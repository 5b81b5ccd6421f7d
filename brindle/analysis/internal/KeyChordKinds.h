// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/internal/KeyChords.h"

#include <cstdint>
#include <span>
#include <vector>

namespace brindle {

/// A class of chord, or one that its neighbours tell more about. The first eight are the classes.
enum TKeyChordKind : std::uint8_t {
    TKeyChordKind_DomResolving = kKeyChordClassCount,  ///< G7 in G7 C
    TKeyChordKind_DomSubstitute,                       ///< Db7 in Db7 C
    TKeyChordKind_Min7BeforeDom,                       ///< Dm7 in Dm7 G7
    TKeyChordKind_HDimBeforeDom,                       ///< Dm7b5 in Dm7b5 G7
    TKeyChordKind_DimLeading,                          ///< C#o7 in C#o7 Dm
    TKeyChordKind_TriadResolved,                       ///< C in G7 C
    TKeyChordKind_Maj7Resolved,                        ///< Cmaj7 in G7 Cmaj7
    TKeyChordKind_MinResolved,                         ///< Cm in G7 Cm
};
inline constexpr std::size_t kKeyChordKindCount = 16;

/// The kind of each chord.
[[nodiscard]] std::vector<TKeyChordKind> KeyChordKindsOf(std::span<const CKeyChord> chords);

}  // namespace brindle
