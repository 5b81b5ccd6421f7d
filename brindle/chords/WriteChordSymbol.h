// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordLite.h"
#include "brindle/chords/ReadChordText.h"

#include <cstdint>
#include <string>

namespace brindle {

/// What notes are called in a chord symbol.
enum TNoteNaming : std::uint8_t {
    TNoteNaming_Letters,  ///< C D E F G A B
    TNoteNaming_German,   ///< B is written H, and B flat is B
    TNoteNaming_Solfege,  ///< Do Re Mi Fa Sol La Si
};

/// How a chord symbol is written. The default is what people type: `Bbm7b5`.
struct CChordSymbolStyle {
    TNoteNaming mNotes = TNoteNaming_Letters;  ///< letters, German names or syllables
    /// The signs U+266F and U+266D: `B♭m7♭5`.
    bool mUnicodeSigns = false;
};

/// The symbol of a chord as people type it, `E7b9`, `Gm(maj7)`, `E9sus4`, `Bm7b5/A`; "N.C." for an
/// undefined chord.
///
/// ReadChordText (with ReadingPrefsOf the style) reads the same chord back: its tones and the
/// spelling of root and bass. A triple accidental is written as a double one of the same key, and a
/// bass on the root's key is left out. A tone is written by its usual name, 3 above a major third
/// as #9, 6 beside a fifth as #11; a seventh that brings a ninth brings it in its number (E9).
[[nodiscard]] std::string WriteChordSymbol(const CChordLite& chord,
                                           const CChordSymbolStyle& style = {});

/// What stands behind the root: "m7b5" for 0 3 6 10. Every set of tones has a text of its own,
/// empty for the major triad.
[[nodiscard]] std::string ChordSymbolSuffix(CSemitones semitones);

/// The name of a note alone, "Bb"; empty for the undefined key.
[[nodiscard]] std::string WriteNoteName(const CKeyEnh& note, const CChordSymbolStyle& style = {});

/// How ReadChordText reads what is written in a style.
[[nodiscard]] CChordTextOptions ReadingPrefsOf(const CChordSymbolStyle& style);

}  // namespace brindle
