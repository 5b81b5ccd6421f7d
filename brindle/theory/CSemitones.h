// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/Quantize.h"
#include "brindle/theory/TBasicChord.h"

#include <algorithm>
#include <array>
#include <bit>
#include <concepts>
#include <cstdint>
#include <initializer_list>
#include <iosfwd>
#include <vector>

namespace brindle {

class CIntvlSet;

/// A set of intervals above a root within one octave: bit n is set when the tone n semitones
/// above the root is there. Bits 0 to 11 are used. The major scale is 2741.
///
/// Parentheses take a mask, braces take the members: `CSemitones(145)` and `CSemitones{0, 4, 7}`
/// are both the major triad, while `CSemitones{145}` is empty, since 145 is no semitone.
class CSemitones {
public:
    constexpr CSemitones() = default;
    /// The mask as it is. Bits above 11 are no tones, yet size, comparison and Mask see them.
    constexpr explicit CSemitones(std::uint64_t mask) : mMask(mask) {}

    /// Each value below 12 sets its bit; larger values are ignored.
    template <class T>
    requires(std::same_as<T, unsigned> ||
             std::same_as<T, int>) constexpr CSemitones(std::initializer_list<T> semitones) {
        for (const T semitone : semitones) {
            if (static_cast<unsigned>(semitone) < 12u)
                SetSemitone(static_cast<int>(semitone), true);
        }
    }

    /// Twelve bools; argument n sets bit n.
    template <std::same_as<bool>... Bits>
    requires(sizeof...(Bits) == 12) constexpr explicit CSemitones(Bits... bits) {
        int ix = 0;
        (SetSemitone(ix++, bits), ...);
    }

    /// Bit n: n semitones above the root.
    [[nodiscard]] constexpr std::uint64_t Mask() const { return mMask; }
    /// No bit is set, so it counts as undefined, too.
    [[nodiscard]] constexpr bool IsEmpty() const { return mMask == 0; }
    /// Number of intervals in the set.
    [[nodiscard]] constexpr int size() const { return std::popcount(mMask); }

    /// False for a value outside 0 to 11, even one that would reduce into it.
    [[nodiscard]] constexpr bool HasIntvl(int intvl) const {
        return intvl >= 0 && intvl < 12 && (mMask >> intvl & 1) != 0;
    }
    /// Whether every member of the set is here. False for an empty set.
    [[nodiscard]] bool HasTheseOrMoreIntvls(const CIntvlSet& intvls) const;
    /// Whether the members of the set are here and nothing else. False for an empty set.
    [[nodiscard]] bool HasExactlyTheseIntvls(const CIntvlSet& intvls) const;
    /// The members as an interval set that wraps at the octave.
    [[nodiscard]] CIntvlSet IntvlSet() const;

    /// Whether it is one of the seven modes of the major scale.
    [[nodiscard]] constexpr bool IsModalScale() const;
    /// Whether it is ionian, lydian or mixolydian.
    [[nodiscard]] constexpr bool IsModalScaleMajor() const;
    /// Whether it is dorian, phrygian or aeolian.
    [[nodiscard]] constexpr bool IsModalScaleMinor() const;

    /// The interval to add to index `ix` (0 to 11) to reach a member, 0 if `ix` is one itself.
    /// When wrapping at the octave it is the difference of the two indices, so -11 leads from 11
    /// up to 0; otherwise it has the sign of the way taken.
    /// `kIntvlUndef` for an empty set, an index out of range or an unknown option.
    [[nodiscard]] int QuantizeToActiveSemitonesAsIntvl(int ix,
                                                       TQuantizeSemitonesOptions options) const;
    /// The index reached when wrapping at the octave; `ix` itself where there is none.
    [[nodiscard]] int QuantizeToActiveSemitonwAsIndex(int ix, TQuantizeDirection direction) const;

    /// Empties the set.
    constexpr void Reset() { mMask = 0; }
    /// Sets or clears bit `ix`; an index outside 0 to 11 is ignored.
    constexpr void SetSemitone(int ix, bool on) {
        if (ix < 0 || ix > 11) return;
        const std::uint64_t bit = std::uint64_t{1} << ix;
        mMask = on ? mMask | bit : mMask & ~bit;
    }
    /// Sets the bit of the interval, reduced into the octave.
    constexpr void AddIntvl(int intvl) { SetSemitone(SemitoneIxFromIntvl(intvl), true); }
    /// Clears the bit of the interval, reduced into the octave.
    constexpr void EraseIntvl(int intvl) { SetSemitone(SemitoneIxFromIntvl(intvl), false); }
    /// Sets the bit of each interval, reduced into the octave.
    void AddIntvls(const CIntvlSet& intvls);
    /// Clears the bit of each interval, reduced into the octave.
    void EraseIntvls(const CIntvlSet& intvls);
    /// Replaces the set by the intervals, reduced into the octave.
    void SetFromIntvlSet(const CIntvlSet& intvls);

    /// Adds the tones of the basic chord: 0 4 7 for a major chord, nothing for `None`.
    constexpr void AddSemitonesFromBasicChord(TBasicChord basicChord);
    /// Replaces the set by the tones of the basic chord.
    constexpr void SetFromBasicChord(TBasicChord basicChord) {
        Reset();
        AddSemitonesFromBasicChord(basicChord);
    }
    /// Turns the set so that semitone `ix` becomes the root: C major on 7 is G mixolydian.
    constexpr void RotateRootToIx(int ix) {
        const int shift = SemitoneIxFromIntvl(ix);
        const std::uint64_t octave = mMask & kOctaveMask;
        mMask = (octave >> shift | octave << (12 - shift)) & kOctaveMask;
    }

    /// The interval reduced into 0 to 11.
    [[nodiscard]] static constexpr int SemitoneIxFromIntvl(int intvl) {
        return FoldIntoOctave(intvl);
    }
    /// Packs element n into bit n; elements beyond the mask's width are ignored.
    [[nodiscard]] static std::uint64_t VectorBoolToInt(const std::vector<bool>& bits);
    /// Makes `out` the twelve bits, but only when the mask is at most 4096.
    void ToVectorBool(std::vector<bool>& out) const;

    /// Writes the twelve bits from bit 0 as `[1,0,...]`.
    void AppendJSONString(std::ostream& stream) const;

    /// Union.
    [[nodiscard]] friend constexpr CSemitones operator+(CSemitones a, CSemitones b) {
        return CSemitones(a.mMask | b.mMask);
    }
    /// The members of `a` that are not in `b`.
    [[nodiscard]] friend constexpr CSemitones operator-(CSemitones a, CSemitones b) {
        return CSemitones(a.mMask & ~b.mMask);
    }
    friend constexpr bool operator==(const CSemitones&, const CSemitones&) = default;
    friend constexpr auto operator<=>(const CSemitones&, const CSemitones&) = default;

    // The masks of small chord vocabularies, by index. The first two of each are no chord and all
    // tones.
    /// 0 4 7 and 0 3 7: the major and the minor triad.
    static constexpr std::array<std::uint64_t, 4> _sSemitones_Chords_MajorMinorMode{0, 4095, 145,
                                                                                    137};
    /// The chords of common songs: triads, sixths, sevenths, ninths without seventh, power chord.
    static constexpr std::array<std::uint64_t, 18> _sSemitones_Chords_CommonMode{
        0,    4095, 145, 137,  657, 649,  1169, 2193, 149,
        1161, 73,   585, 1097, 273, 1297, 133,  161,  129};
    /// The common chords that a recogniser tells apart; the third is a bare root.
    static constexpr std::array<std::uint64_t, 18> _sSemitones_Chords_MetroRecognizedMode{
        0, 4095, 1, 145, 137, 1169, 2193, 149, 1161, 2185, 73, 585, 273, 1297, 133, 161, 129, 1153};

private:
    static constexpr std::uint64_t kOctaveMask = 0xFFF;

    std::uint64_t mMask = 0;
};

/// Writes the mask as a number.
std::ostream& operator<<(std::ostream& stream, const CSemitones& semitones);

/// No tones.
inline constexpr CSemitones CSemitones_Undef{};
/// The major scale.
inline constexpr CSemitones kSemitonesMajor(0xAB5);  // 0 2 4 5 7 9 11
/// The natural minor scale.
inline constexpr CSemitones kSemitonesNaturalMinor(0x5AD);  // 0 2 3 5 7 8 10

/// The seven modes of the major scale, from the mode on C to the mode on B in the usual order.
inline constexpr std::array<CSemitones, 7> CSemitones_ScalesModalAll{
    CSemitones(2741),  // ionian
    CSemitones(1709),  // dorian
    CSemitones(1451),  // phrygian
    CSemitones(2773),  // lydian
    CSemitones(1717),  // mixolydian
    CSemitones(1453),  // aeolian
    CSemitones(1387),  // locrian
};
/// The modes with a major third and a fifth: ionian, lydian, mixolydian.
inline constexpr std::array<CSemitones, 3> CSemitones_ScalesModalMajor{
    CSemitones(2741), CSemitones(2773), CSemitones(1717)};
/// The modes with a minor third and a fifth: dorian, phrygian, aeolian.
inline constexpr std::array<CSemitones, 3> CSemitones_ScalesModalMinor{
    CSemitones(1709), CSemitones(1451), CSemitones(1453)};

constexpr bool CSemitones::IsModalScale() const {
    return std::find(CSemitones_ScalesModalAll.begin(), CSemitones_ScalesModalAll.end(), *this) !=
           CSemitones_ScalesModalAll.end();
}

constexpr bool CSemitones::IsModalScaleMajor() const {
    return std::find(CSemitones_ScalesModalMajor.begin(), CSemitones_ScalesModalMajor.end(),
                     *this) != CSemitones_ScalesModalMajor.end();
}

constexpr bool CSemitones::IsModalScaleMinor() const {
    return std::find(CSemitones_ScalesModalMinor.begin(), CSemitones_ScalesModalMinor.end(),
                     *this) != CSemitones_ScalesModalMinor.end();
}

constexpr void CSemitones::AddSemitonesFromBasicChord(TBasicChord basicChord) {
    const auto add = [this](CSemitones tones) { mMask |= tones.mMask; };
    switch (basicChord) {
        case TBasicChord::Major:
            return add({0, 4, 7});
        case TBasicChord::Minor:
            return add({0, 3, 7});
        case TBasicChord::Augmented:
            return add({0, 4, 8});
        case TBasicChord::Diminished:
            return add({0, 3, 6});
        case TBasicChord::Sus4:
            return add({0, 5, 7});
        case TBasicChord::Sus2:
            return add({0, 2, 7});
        case TBasicChord::Drone:
            return add({0, 7});
        case TBasicChord::None:
            return;
    }
}

}  // namespace brindle
