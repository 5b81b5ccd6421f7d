// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/guitarchords/FindFingerings.h"
#include "brindle/guitarchords/GChChord.h"
#include "brindle/guitarchords/GChDatabase.h"
#include "brindle/guitarchords/GChShortTuning.h"
#include "brindle/present/CGridStyle.h"
#include "brindle/theory/CChordNamePrefs.h"

#include <cstddef>
#include <functional>
#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace brindle {

/// A fingering made ready for the eye.
struct CChordGrid {
    /// What the user asked for: frets, or a chord symbol.
    std::string mSymbol;
    /// Told from what sounds.
    std::string mName;
    /// The chord that sounds, where the name is that of the shape under a capodaster; else empty.
    std::string mSounds;
    /// Other names that are nearly as likely.
    std::vector<std::string> mOtherNames;
    GChShortTuning mTuning{};  ///< of the open strings, from the lowest on
    int mCapo = 0;             ///< the fret of a capodaster, 0 for none
    /// The fretted strings, with their fingers where these are known.
    std::vector<GChChordElem> mElems;
    /// Of each string: -1 muted, 0 open, else the fret that sounds, counted from the capodaster.
    std::vector<int> mFrets;
    /// Of each string: -1 muted.
    std::vector<int> mPitches;
    /// How its notes are written; without one as people type them.
    std::optional<CChordNamePrefs> mStyle;
    /// The chord that spells its notes: Eb of Cm9, not D#. Undefined if it has no name.
    CChordLite mChord;
    /// The pitch class that the name stands on, 0 (C) to 11; -1 without a name.
    int mRoot = -1;
    /// Where it comes from; empty for typed frets and for what was searched.
    std::string mLibrary;
    /// Degrees of the chord that was asked for and that do not sound, "5", "11".
    std::vector<std::string> mOmitted;
    /// How hard it is to hold, 0 to 9; -1 if one hand cannot.
    int mDifficulty = -1;
};

/// The frets that are drawn.
struct CFretWindow {
    int mFirst = 0;  ///< 0: from the nut
    int mCount = 4;  ///< how many frets are drawn from that one on
};

/// From the nut if the highest fret allows it, else from the lowest fret that is held; as many as
/// the fingering needs, but not less than four.
[[nodiscard]] CFretWindow WindowOf(const CChordGrid& grid);

/// The name, behind commas the other ones: "Am7, C6/A", and what is left out: "C13 (no 5, 11)".
[[nodiscard]] std::string NamesText(const CChordGrid& grid);

/// "x32010"; frets of two digits stand between dashes: "x-10-12-12-11-10".
[[nodiscard]] std::string FretsText(const CChordGrid& grid);

/// The frets of a text in one of these forms, or with commas, points or blanks between the strings;
/// nothing if it has another.
[[nodiscard]] std::optional<std::vector<int>> ReadFrets(std::string_view text);

/// The note that a string sounds with its octave, as guitarists write it, spelled by the chord and
/// in the style of the grid: "Eb4". Empty for a muted string.
[[nodiscard]] std::string NoteText(const CChordGrid& grid, std::size_t string);

/// What a string says at its fret: its note, "F#", or its degree as its chord names it, "b3", "9".
/// Empty for a muted string, for a finger, and for a degree without a root.
[[nodiscard]] std::string DotText(const CChordGrid& grid, std::size_t string, TGridDots dots);

/// The name of a tuning that is not the usual one, or its pitches; empty for the usual one.
[[nodiscard]] std::string TuningTitle(const CChordGrid& grid);

/// A tuning as people write it: its name (see TuningOfName), letters from the lowest string,
/// "DADGAD", or pitches with octaves, "E2A2D3G3B3E4". Six letters lie as near to the standard
/// guitar as they can; others ascend, the first in the octave of C2. Letters may be small,
/// "eadgbe". Nothing for any other text and for less than three strings.
[[nodiscard]] std::optional<GChShortTuning> ReadTuning(std::string_view text);

/// "E2 A2 D3 G3 B3 E4"
[[nodiscard]] std::string TuningText(const GChShortTuning& tuning);

/// Frets with the fingers of FingeringOfFrets, named as NameFingering does, in a style if one is
/// given; dots without fingers if one hand cannot hold them. Nothing if there are more fretted
/// strings than a fingering has elements.
[[nodiscard]] std::optional<CChordGrid> GridOfFrets(
    std::string_view symbol, const std::vector<int>& frets, const GChShortTuning& tuning, int capo,
    const std::optional<CChordNamePrefs>& style = {});

/// A fingering of a library over its stored root. It is named by the symbol, or if that is empty by
/// what the library says it is.
[[nodiscard]] CChordGrid GridOfChord(std::string_view symbol, const GChChord& chord, int capo);

/// A fingering that was found for a chord.
[[nodiscard]] CChordGrid GridOfFingering(std::string_view symbol, const CFingering& fingering,
                                         const CChordLite& chord);

/// The fingerings of a chord as people type it: those of the database that lie within the options
/// (what may be left out, the last fret, the span), or if it has none the best ones that
/// FindFingerings finds; as many as the options want.
[[nodiscard]] std::vector<CChordGrid> GridsForChord(const GChDatabase& database,
                                                    std::string_view symbol,
                                                    const CChordLite& chord,
                                                    const GChShortTuning& tuning,
                                                    const CFingeringOptions& options);
/// The found ones alone.
[[nodiscard]] std::vector<CChordGrid> FoundGrids(std::string_view symbol, const CChordLite& chord,
                                                 const GChShortTuning& tuning,
                                                 const CFingeringOptions& options);

/// Fingerings by the symbol of their chord.
using TChordGrids = std::map<std::string, CChordGrid, std::less<>>;

}  // namespace brindle
