// SPDX-License-Identifier: MIT
#pragma once

namespace brindle {

class CChordHeavy;
struct CChordNamePrefs;
struct TMusicXMLHarmony;

/// The full chord of a lead-sheet harmony: root, kind, degrees and bass. Of the degrees, only the
/// fifth can be altered or left out. Tones are read with `CurrentChordNamePrefs`; `prefs` is not
/// looked at.
[[nodiscard]] CChordHeavy CChordSetFromMusicXml(const TMusicXMLHarmony& harmony, int wrapIntvl,
                                                const CChordNamePrefs& prefs);
/// Replaces `chord`, which keeps its wrap interval.
void CChordSetFromMusicXml(const TMusicXMLHarmony& harmony, CChordHeavy& chord,
                           const CChordNamePrefs& prefs);

}  // namespace brindle
