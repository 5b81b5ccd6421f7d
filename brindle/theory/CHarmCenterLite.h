// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/CScaleLite.h"
#include "brindle/theory/CSemitones.h"

#include <iosfwd>
#include <tuple>

namespace brindle {

/// A tonal center that holds for a passage: a root and a modal mask.
struct CHarmCenterLite {
    CKeyEnh mRootKeyEnh;
    CSemitones mSemitones;

    constexpr CHarmCenterLite() = default;
    constexpr CHarmCenterLite(CKeyEnh root, CSemitones semitones)
        : mRootKeyEnh(root), mSemitones(semitones) {}
    constexpr explicit CHarmCenterLite(const CScaleLite& scale)
        : CHarmCenterLite(scale.mRootKeyEnh, scale.mSemitones) {}

    [[nodiscard]] constexpr bool IsUndef() const { return mRootKeyEnh.IsUndef(); }
    /// The same root and mask as a scale.
    [[nodiscard]] constexpr CScaleLite ToScaleLite() const { return {mRootKeyEnh, mSemitones}; }

    friend constexpr bool operator==(const CHarmCenterLite&, const CHarmCenterLite&) = default;
    friend constexpr bool operator<(const CHarmCenterLite& a, const CHarmCenterLite& b) {
        return std::tie(a.mRootKeyEnh, a.mSemitones) < std::tie(b.mRootKeyEnh, b.mSemitones);
    }
};

std::ostream& operator<<(std::ostream& stream, const CHarmCenterLite& center);

inline constexpr CHarmCenterLite CHarmCenterLite_Undef{};

}  // namespace brindle
