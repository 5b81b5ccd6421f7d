// SPDX-License-Identifier: MIT
#pragma once

/// Music theory and harmony analysis. What holds wherever nothing else is said:
///
/// - A key number (`KeyNr`) is a pitch class, 0 (C) to 11 (B), and 15 is none. A note is a MIDI
///   number: 60 is middle C, -1 is none. CKeyEnh and CNote add the spelling: C sharp and D flat are
///   enharmonic, one key number with two names.
/// - The key that a song is in is a tonality, a tonic with a mode: CSignKeyLite. Where it is a
///   number, major keys are 0 to 11 by their tonics, and minor ones 12 to 23.
/// - Intervals are semitones, negative for down; `kIntvlUndef` is none. Degrees count from 0.
/// - Positions and lengths in time are beats; `kPosUndef` is none.
/// - An undefined value is no error: what is asked of it is undefined, too.
/// - Texts are UTF-8. Ranges end one behind their last element.
/// - "Kept:" tells of behaviour that looks wrong and is meant, since others rely on it.
namespace brindle {

/// The version of the library as text.
inline constexpr const char* BrindleVersionString = "0.1.0";
/// The same as one number: major * 10000 + minor * 100 + patch.
inline constexpr int BrindleVersionNumber = 100;

}  // namespace brindle
