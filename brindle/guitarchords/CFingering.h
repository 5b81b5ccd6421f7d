// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/guitarchords/GChChordElem.h"
#include "brindle/guitarchords/GChShortTuning.h"
#include "brindle/theory/CSemitones.h"

#include <array>
#include <cstdint>
#include <span>
#include <type_traits>
#include <vector>

namespace brindle {

/// Fingers of a hand that holds strings down; the thumb stays behind the neck.
inline constexpr int kHandFingers = 4;

/// The fret of a string that does not sound.
inline constexpr int kMutedString = -1;

/// The place of one finger: on one string, or as a barre from string to string.
struct CFingerPlace {
    std::int8_t mFinger = 0;     ///< 1 index to 4 little finger
    std::int8_t mFret = 0;       ///< from 1, counted from the capodaster
    std::int8_t mMinString = 0;  ///< the string with the lowest index that it holds, from 0
    std::int8_t mMaxString = 0;  ///< the one with the highest index; the same for one string

    /// Whether the finger lies on more than one string.
    [[nodiscard]] constexpr bool IsBarre() const { return mMinString < mMaxString; }
    friend bool operator==(const CFingerPlace&, const CFingerPlace&) = default;
};

/// A chord as one hand holds it. A value without heap; the default has no strings.
struct CFingering {
    GChShortTuning mTuning{};  ///< the instrument
    int mCapo = 0;             ///< fret of the capodaster, 0 for none
    int mStringCount = 0;      ///< of the tuning, 0 to 16
    /// Of each string: kMutedString, 0 open, else the fret that sounds, counted from the
    /// capodaster.
    std::array<std::int8_t, kGChMaxStrings> mFrets{};
    /// The fingers that hold something, the first mFingerCount; barres are among them.
    std::array<CFingerPlace, kHandFingers> mFingers{};
    int mFingerCount = 0;  ///< how many of them there are, 0 to 4
    /// Tones of the chord that do not sound, above its root.
    CSemitones mOmitted;
    /// The lowest note is the bass of the chord: its root, or what stands behind the slash.
    bool mBassIsLowest = false;
    /// 0 to 9.
    int mDifficulty = 0;
    /// Place in the order of a player: less is better.
    int mCost = 0;

    /// mFrets of the strings that there are.
    [[nodiscard]] std::span<const std::int8_t> Frets() const {
        return {mFrets.data(), static_cast<std::size_t>(mStringCount)};
    }
    /// The fingers that hold something.
    [[nodiscard]] std::span<const CFingerPlace> Fingers() const {
        return {mFingers.data(), static_cast<std::size_t>(mFingerCount)};
    }
    /// MIDI number of a sounding string, counted from the pitches of the tuning (a guitar's are
    /// those that are written, an octave above the sound); kMutedString of another. The index is
    /// not checked.
    [[nodiscard]] int Pitch(int string) const;
    /// The lowest fret that a finger holds; 0 if none does.
    [[nodiscard]] int Position() const;
    /// The fingers as elements of a grid.
    [[nodiscard]] std::vector<GChChordElem> Elems() const;

    friend bool operator==(const CFingering&, const CFingering&) = default;
};

static_assert(std::is_trivially_copyable_v<CFingering>);

}  // namespace brindle
