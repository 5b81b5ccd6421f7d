// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstdint>
#include <vector>

namespace brindle {

/// Most strings that a tuning or a fingering can have.
inline constexpr int kGChMaxStrings = 16;

/// The tuning of a fretted instrument: the MIDI pitch of each open string, from the string with the
/// lowest index, on a guitar the low E. 60 is middle C.
///
/// The first 0 ends the list; without one there are 16 strings.
using GChShortTuning = std::array<std::uint8_t, kGChMaxStrings>;

/// E A D G B E as they are written: an octave above what a guitar sounds, whose low E is 40.
inline constexpr GChShortTuning kGChStandardGuitar{52, 57, 62, 67, 71, 76};

/// No strings.
void GChClearShortTuning(GChShortTuning& tuning);
/// The same as assigning.
void GChCopyShortTuning(const GChShortTuning& source, GChShortTuning& target);
/// The standard guitar.
void GChSetDefaultGuitarShortTuning(GChShortTuning& tuning);

/// 0 to 16.
[[nodiscard]] int GChNumberOfStringsInShortTuning(const GChShortTuning& tuning);
/// The index is 0 to 15; it is not checked.
[[nodiscard]] int GChPitchForStringIndexInShortTuning(int index, const GChShortTuning& tuning);
/// 52, 57, 62, 67, 71, 76 for index 0 to 5, otherwise 0.
[[nodiscard]] int GChStandardGuitarOpenStringPitch(int index);

/// Whether both are the same tuning up to whole octaves.
///
/// Kept: a string that lies exactly as far above 0 as the tunings lie apart counts as the end of
/// the list, so that 64, 12 and 52 are equal.
[[nodiscard]] bool GChIsEqualShortTuning(const GChShortTuning& a, const GChShortTuning& b);
/// Whether there are at least 3 strings and each has a pitch of 1 to 127.
[[nodiscard]] bool GChIsValidShortTuning(const GChShortTuning& tuning);

/// The pitches up to the first 0.
[[nodiscard]] std::vector<int> GChPitchArrayFromShortTuning(const GChShortTuning& tuning);
/// Takes at most 16 pitches, each cut to a byte, and fills up with 0.
void GChPitchArrayToShortTuning(const std::vector<int>& pitches, GChShortTuning& tuning);

}  // namespace brindle
