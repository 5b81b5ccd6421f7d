// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/CSemitones.h"

#include <cstdint>
#include <iosfwd>
#include <type_traits>

namespace brindle {

/// The compact form of a chord: a spelled root, a spelled bass or none, and the semitones that
/// sound above the root. No octaves, no heap data.
///
/// Root key number 15 means that this is no real chord; the root's spelling then tells which of
/// the three non-chords it is: undefined, "No Chord Yield" or "No Chord Force".
class CChordLite {
public:
    CKeyEnh mRootKeyEnh;
    /// Carried and compared for the host by EqualIncludingDir, never interpreted.
    std::int32_t mRootDirection = 0;
    /// (15, TEnh_Undef) is no bass.
    CKeyEnh mBassKeyEnh;
    std::int32_t mBassDirection = 0;
    /// Bit 0 is the root. A bass that is no chord tone has its bit clear.
    CSemitones mSemitones;

    constexpr CChordLite() = default;
    constexpr CChordLite(CKeyEnh root, CKeyEnh bass, CSemitones semitones)
        : mRootKeyEnh(root), mBassKeyEnh(bass), mSemitones(semitones) {}

    /// True for all three non-chords.
    [[nodiscard]] constexpr bool IsUndef() const { return mRootKeyEnh.IsUndef(); }
    [[nodiscard]] bool IsNoChordYield() const;
    [[nodiscard]] bool IsNoChordForce() const;

    /// These three write the root only; bass and semitones stay.
    void SetUndef();
    void SetNoChordYield();
    void SetNoChordForce();

    /// Writes root, bass and semitones as JSON members without braces.
    void AppendJSONClassSubstring(std::ostream& stream) const;
    void AppendJSONString(std::ostream& stream) const;

    friend constexpr bool operator==(const CChordLite& a, const CChordLite& b) {
        return a.mRootKeyEnh == b.mRootKeyEnh && a.mBassKeyEnh == b.mBassKeyEnh &&
               a.mSemitones == b.mSemitones;
    }
    /// By root, bass (each as CKeyEnh sorts) and semitones; the directions do not count.
    friend constexpr bool operator<(const CChordLite& a, const CChordLite& b) {
        if (a.mRootKeyEnh != b.mRootKeyEnh) return a.mRootKeyEnh < b.mRootKeyEnh;
        if (a.mBassKeyEnh != b.mBassKeyEnh) return a.mBassKeyEnh < b.mBassKeyEnh;
        return a.mSemitones < b.mSemitones;
    }
};

static_assert(std::is_trivially_copyable_v<CChordLite>);

inline constexpr CChordLite CChordLite_Undef{};
inline constexpr CChordLite CChordLite_NoChordYield{{kKeyNrUndef, TEnh{0}}, CKeyEnh_Undef, {}};
inline constexpr CChordLite CChordLite_NoChordForce{{kKeyNrUndef, TEnh{1}}, CKeyEnh_Undef, {}};

}  // namespace brindle
