// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <string>

namespace brindle {

class GChChord;
class GChChordDescr;
class GChTuningDescr;

// Names of fingerings, told from what sounds. The root is a key number: 0 to 11, -1 for none, below
// that 0; above 11 there is no name. `enhType` spells it: 1 with a sharp, 2 with a flat, any other
// value naturally. Names are written by `CurrentChordNamePrefs` with "maj7" and blanks between the
// parts; the comma forms join the parts by commas. A missing chord or tuning has no name.

/// "C maj7/E" of what the strings sound under the capodaster on fret `capo`.
[[nodiscard]] std::optional<std::string> GChHarmonyStringFromChord(const GChChord* chord, int root,
                                                                   int enhType, int capo);
/// The same with commas: root, basic chord and options apart.
[[nodiscard]] std::optional<std::string> GChHarmonyCommaSeparatedStringFromChord(
    const GChChord* chord, int root, int enhType, int capo);
/// The same of a detached fingering, with the capodaster of its tuning.
[[nodiscard]] std::optional<std::string> GChHarmonyStringFromChordDescr(
    const GChChordDescr* chordDescr, const GChTuningDescr* tuningDescr, int root, int enhType);
/// The same with commas.
[[nodiscard]] std::optional<std::string> GChHarmonyCommaSeparatedStringFromChordDescr(
    const GChChordDescr* chordDescr, const GChTuningDescr* tuningDescr, int root, int enhType);

/// The root over which the name has the fewest characters, the lowest of several; -1 for a missing
/// chord.
[[nodiscard]] int GChProposedRootNoteFromChord(const GChChord* chord, int capo);
/// The same; -1 also for a missing tuning.
[[nodiscard]] int GChProposedRootNoteFromChordDescr(const GChChordDescr* chordDescr,
                                                    const GChTuningDescr* tuningDescr);

}  // namespace brindle
