// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/CSemitones.h"

#include <iosfwd>
#include <tuple>

namespace brindle {

/// The compact form of a scale: a root and the semitones above it.
struct CScaleLite {
    CKeyEnh mRootKeyEnh;
    CSemitones mSemitones;

    /// Writes `{"CKeyEnh":...,"Semitones":"[...]"}`.
    void AppendJSONString(std::ostream& stream) const;

    friend constexpr bool operator==(const CScaleLite&, const CScaleLite&) = default;
    friend constexpr bool operator<(const CScaleLite& a, const CScaleLite& b) {
        return std::tie(a.mRootKeyEnh, a.mSemitones) < std::tie(b.mRootKeyEnh, b.mSemitones);
    }
};

std::ostream& operator<<(std::ostream& stream, const CScaleLite& scale);

inline constexpr CScaleLite CScaleLite_Undef{};

}  // namespace brindle
