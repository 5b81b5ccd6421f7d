// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsCenters.h"
#include "brindle/theory/CSignKeyLite.h"

#include <iosfwd>

namespace brindle {

/// A stretch of a piece under one key signature, and the harmonic centers inside it.
class CHarmAnlsSignKey {
public:
    /// Nothing in this library states one: `kPosUndef`.
    double mProbability = kPosUndef;
    /// Start in beats; `kPosUndef` when unknown.
    double mPosition = kPosUndef;
    CSignKeyLite mSignKey;          ///< the key signature; undefined where the score has none
    CHarmAnlsCenters mHarmCenters;  ///< in the order of time

    /// True when the key or the type is undefined.
    [[nodiscard]] bool IsUndef() const { return mSignKey.IsUndef(); }

    /// An undefined sign key takes key and type of the center, and its position if its own is
    /// unknown.
    void IfUndefFillWithHarmAnlsCenter(const CHarmAnlsCenter& center);

    /// Writes an object with all fields. No strict JSON: each list ends with a comma.
    void AppendJSONString(std::ostream& stream) const;

    /// Compares everything but the probability.
    friend bool operator==(const CHarmAnlsSignKey& a, const CHarmAnlsSignKey& b) {
        return a.mPosition == b.mPosition && a.mSignKey == b.mSignKey &&
               a.mHarmCenters == b.mHarmCenters;
    }
};

/// Writes the JSON text, for debugging.
std::ostream& operator<<(std::ostream& stream, const CHarmAnlsSignKey& signKey);

}  // namespace brindle
