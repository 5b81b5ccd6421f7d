// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsChordForMetro.h"
#include "brindle/present/CPaint.h"

#include <span>
#include <string>
#include <vector>

namespace brindle {

/// The vector of a chord for learning systems, and what it says.
struct CShownVector {
    /// The symbol of the chord that it was made of; empty if the vector itself was given.
    std::string mSymbol;
    /// 46 places of 0.0 or 1.0, see CHarmAnlsChordForMetro.
    std::vector<float> mVector;
    CHarmAnlsChordForMetro mReadBack;  ///< the chord that the vector says
};

/// What a vector of 46 places says.
[[nodiscard]] CShownVector ShowVector(std::vector<float> vector);
/// The vector of a chord, under the symbol that it was written with.
[[nodiscard]] CShownVector ShowVectorOfChord(std::string symbol, const CChordLite& chord);

/// Vectors and what they say, as a table and as JSON, see docs/json.md.
[[nodiscard]] std::string VectorsText(std::span<const CShownVector> vectors, const CPaint& paint);
/// The same as JSON, see docs/json.md.
[[nodiscard]] std::string VectorsJson(std::span<const CShownVector> vectors);

}  // namespace brindle
