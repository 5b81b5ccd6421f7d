// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordLite.h"

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace brindle {

/// What one text between two bar lines can be.
enum TChordTextKind : std::uint8_t {
    TChordText_Chord,    ///< a symbol with a root
    TChordText_NoChord,  ///< "N.C." and its like
    /// The chord (or the bar) before it again: "%", "/", "-".
    TChordText_Repeat,
    TChordText_NotUnderstood,  ///< none of these; the fault says why
};

/// How a chord text is read.
struct CChordTextOptions {
    /// The letter B is B flat, and H is B natural. `Bb` and `Bes` are B flat all the same. A song
    /// that has any H is to be read so throughout.
    bool mBIsBFlat = false;
    /// Roots may be syllables: `Rem7`, `Sol#`.
    bool mSolfege = false;
    /// A root in lower case without a word for its quality is minor.
    bool mLowerCaseIsMinor = false;
    /// The text is a name that this library printed, with a blank between its parts: `C 9` is then
    /// C with an added ninth.
    bool mOwnName = false;
};

/// What ReadChordText makes of a text.
struct CChordTextReading {
    /// Chord, no chord, repeat, or not understood.
    TChordTextKind mKind = TChordText_NotUnderstood;
    /// Chord: root, bass and exact semitones; a bass on the root's key is none. NoChord: "No Chord
    /// Yield" or "No Chord Force", or undefined for the word `undef`. Otherwise undefined.
    CChordLite mChord;
    /// A text from which CChordSetFromStringHelper reads the chord (with `mBForBFlat` as
    /// `mBIsBFlat`). The input itself, byte for byte, if that reads it the same. Empty for a
    /// repeat and for what is not understood.
    std::string mParserText;
    /// False: `mParserText` is only the nearest chord, since no such text says this one.
    bool mParserTextIsExact = false;
    /// Root or bass is written with the letter H.
    bool mHasH = false;
    /// The tone ten semitones above the root is written as a raised sixth, `Ab(#6)`, and by nothing
    /// else.
    bool mHasAugmentedSixth = false;
    /// Where the fault is: characters (not bytes) from 1; 0 without a fault.
    int mFaultPos = 0;
    /// What is wrong, as in `"x" at 4 is not understood`. Only the first fault is told.
    std::string mFault;
};

/// Reads a chord symbol as people write it: `Cmaj`, `Co7`, `CΔ`, `C-7`, `F♯m7♭5`, `C7alt/E`,
/// `Ab:min7/b3`.
///
/// It knows the whole of its grammar, "N.C." for no chord too, and tells what it does not
/// understand, where CChordSetFromStringHelper steps over it. Time is linear in the length of the
/// text.
[[nodiscard]] CChordTextReading ReadChordText(std::string_view text,
                                              const CChordTextOptions& prefs = {});

/// The `mParserText` of a chord; nothing for any other text. Normalising the result again changes
/// nothing, except with `mOwnName`: the result is no printed name.
[[nodiscard]] std::optional<std::string> NormaliseChordSymbol(std::string_view text,
                                                              const CChordTextOptions& prefs = {});

}  // namespace brindle
