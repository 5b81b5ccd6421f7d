// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>

namespace brindle {

// MIDI pitches and their names. Octaves are counted so that pitch 60, middle C, is "C3".

/// "C#-1", "Bb2": the default name and the octave. Pitches are 0 to 127; below, the octave counts
/// towards zero, so that -1 is "B-2".
[[nodiscard]] std::string GChMidiPitchDefaultName(int pitch);

/// C, C#, D, D#, E, F, F#, G, G#, A, Bb, B for index 0 to 11, otherwise empty.
[[nodiscard]] std::string_view GChOctPitchDefaultName(int index);

/// The name of one of the 17 usual spelled keys from C to B, where C sharp is 1 and D flat is 2, by
/// `CurrentChordNamePrefs`. Empty outside 0 to 16.
[[nodiscard]] std::string GChEnhPitchName(int index);

/// The pitch of a name with its octave: "C3" is 60, "eb2" is 51. The octave is one digit, or "-1",
/// "-2"; what stands behind it is not read. -1 for anything else and for pitches above 127.
///
/// Kept: a sign does not change the octave, so that Cb3 lies a major seventh above C3.
[[nodiscard]] int GChMidiPitchForPitchString(std::string_view text);

/// The text with U+266D for every "b" and U+266F for every "#": each b changes, also within a word.
[[nodiscard]] std::string stringByConvertingMusicalSymbols(std::string_view text);

}  // namespace brindle
