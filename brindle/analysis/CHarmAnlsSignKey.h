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
    CSignKeyLite mSignKey;
    CHarmAnlsCenters mHarmCenters;

    /// True when the key or the type is undefined.
    [[nodiscard]] bool IsUndef() const { return mSignKey.IsUndef(); }

    /// An undefined sign key takes key and type of the center, and its position if its own is
    /// unknown.
    void IfUndefFillWithHarmAnlsCenter(const CHarmAnlsCenter& center);

    void AppendJSONString(std::ostream& stream) const;

    /// Compares everything but the probability.
    friend bool operator==(const CHarmAnlsSignKey& a, const CHarmAnlsSignKey& b) {
        return a.mPosition == b.mPosition && a.mSignKey == b.mSignKey &&
               a.mHarmCenters == b.mHarmCenters;
    }
};

std::ostream& operator<<(std::ostream& stream, const CHarmAnlsSignKey& signKey);

}  // namespace brindle
