// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsChord.h"

#include <nlohmann/json_fwd.hpp>

/// Readers of analysis records from dictionaries. A value of the wrong kind counts as missing.
namespace brindle::CHarmAnls {

/// Reads a chord with its distances to a center.
struct Chord {
    /// The distances are read only if both are there, else both are -1.
    [[nodiscard]] static CHarmAnlsChord FromDictionary(const nlohmann::json& dictionary);
};

/// Reads a chord that has a place in a song.
struct ChordWithPos {
    /// A missing position is `kPosUndef`.
    [[nodiscard]] static CHarmAnlsChordWithPos FromDictionary(const nlohmann::json& dictionary);
};

/// Reads a chord that has a length instead of a place.
struct ChordWithLength {
    /// Distances are not read, they are -1; a missing length is `kPosUndef`.
    [[nodiscard]] static CHarmAnlsChordWithLength FromDictionary(const nlohmann::json& dictionary);
};

}  // namespace brindle::CHarmAnls
