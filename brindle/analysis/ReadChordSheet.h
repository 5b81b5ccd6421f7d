// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/chords/ReadChordText.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace brindle {

/// In what form the text of a song is written.
enum TChordSheetForm : std::uint8_t {
    /// Chord symbols, bar lines and holds between white space: `Dm7 G7 | C . . .`.
    TChordSheet_Plain,
    /// Lyrics with chords in square brackets and directives in braces, `{title: ...}`.
    TChordSheet_ChordPro,
    /// The packed text of chart collections: `{*AT44C^7 |A-7 D7 }`.
    TChordSheet_IReal,
    /// Whichever of these it looks like.
    TChordSheet_Auto,
};

/// How the text of a song is read.
struct CChordSheetPrefs {
    TChordSheetForm mForm = TChordSheet_Plain;
    /// Length of a bar, and how far a chord or a hold moves on. Beats above 0.
    double mBeatsPerBar = 4.0;
    double mBeatsPerChord = 1.0;
    /// The chords of a bar that has no holds share it evenly; a text without bar lines has no bars.
    /// Charts of the packed form are always read so.
    bool mEven = false;
    /// What is not understood becomes a "No Chord Yield", and all faults are told.
    bool mLenient = false;
    /// `mBIsBFlat` is set by any H in the song.
    CChordTextPrefs mChordTextPrefs{};
};

/// What is wrong with the text of a song, and where.
struct CChordSheetFault {
    /// From 1.
    std::size_t mLine = 0;
    /// In characters (not bytes) from 1.
    std::size_t mColumn = 0;
    std::string mText;
};

/// A part of a song with a name.
struct CChordSheetSection {
    std::string mName;
    /// In beats.
    double mPosition = 0.0;
};

/// What ReadChordSheet makes of the text of a song.
struct CChordSheetReading {
    /// As played, repeats and endings followed, with the end marker. Empty when there is a fault,
    /// unless the reading is lenient.
    CHarmAnlsChords mChords;
    /// What was typed for each chord; the end marker has none.
    std::vector<std::string> mSymbols;
    std::vector<CChordSheetSection> mSections;
    /// Empty if the song does not tell.
    std::string mTitle;
    std::string mKey;
    /// The bar of the song, or of the preferences if the song does not tell.
    double mBeatsPerBar = 4.0;
    /// B is B flat, since the song has an H.
    bool mIsGerman = false;
    /// Empty if all is understood. The first one; a lenient reading tells more, by their places.
    std::vector<CChordSheetFault> mFaults;
};

/// Reads the text of a song.
///
/// Positions are those of ParseStringIntoHarmAnlsChords: a chord and a hold (`.`, `/`) move on by
/// `mBeatsPerChord`, and `|` goes on to the next bar line. Chords are read by ReadChordText. `|:`
/// and `:|` repeat, with endings `[1` and `[2`; `%` alone in a bar is the bar before it; a name in
/// `{}` or before `:` begins a section. Repeats may add 64 times the written bars and chords,
/// 10,000 in any case and 100,000 at most; more is a fault. Time is linear in the length of what is
/// read and played.
[[nodiscard]] CChordSheetReading ReadChordSheet(std::string_view text,
                                                const CChordSheetPrefs& prefs = {});

}  // namespace brindle
