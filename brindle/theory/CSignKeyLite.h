// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/TSignKeyType.h"

#include <iosfwd>
#include <tuple>

namespace brindle {

/// A major or minor key as a key signature names it: a spelled root and a type.
struct CSignKeyLite {
    CKeyEnh mRootKeyEnh;
    TSignKeyType mSignKeyType = TSignKeyType_Undef;

    constexpr CSignKeyLite() = default;
    constexpr CSignKeyLite(CKeyEnh root, TSignKeyType type)
        : mRootKeyEnh(root), mSignKeyType(type) {}

    /// True when the root or the type is undefined.
    [[nodiscard]] constexpr bool IsUndef() const {
        return mRootKeyEnh.IsUndef() || mSignKeyType == TSignKeyType_Undef;
    }

    /// Writes `{"CKeyEnh":...,"Type":"major"}`.
    void AppendJSONString(std::ostream& stream) const;

    friend constexpr bool operator==(const CSignKeyLite&, const CSignKeyLite&) = default;
    friend constexpr bool operator<(const CSignKeyLite& a, const CSignKeyLite& b) {
        return std::tie(a.mRootKeyEnh, a.mSignKeyType) < std::tie(b.mRootKeyEnh, b.mSignKeyType);
    }
};

std::ostream& operator<<(std::ostream& stream, const CSignKeyLite& signKey);

inline constexpr CSignKeyLite CSignKeyLite_Undef{};

}  // namespace brindle
