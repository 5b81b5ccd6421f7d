// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordLite.h"
#include "brindle/theory/CSignKeyLite.h"

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace brindle {

class CHarmAnlsChords;
struct CKeyOfSong;

/// How numerals are written, and which of two readings "I6" has.
struct TNumeralOptions {
    /// Nashville numbers: 2-7 5 1 instead of ii7 V I.
    bool mNashville = false;
    /// Inversions as figures: V65, I6. Otherwise the degree of the bass stands behind a slash,
    /// V7/7, and I6 has an added sixth.
    bool mFigures = false;
    /// The printed signs, ø and °, instead of h and o.
    bool mPrintedSigns = false;
};

/// The degree of a chord in a key with a few signs for its kind. Empty for an undefined chord or
/// key.
///
/// Degrees count in the key: III is E flat in C minor and E in C major. Small letters are minor and
/// diminished chords. Behind them stand ^7 (a major seventh), 6, 7, h7 (half diminished), o, o7, +,
/// sus and 5 (no third); further tensions are not written. Behind a slash stands the degree of the
/// bass in digits, I/3.
///
/// With the chord that follows, a dominant of another degree is written as such: A7 before Dm in
/// C major is V7/ii, Eb7 there is subV7/ii, C#o is viio/ii.
[[nodiscard]] std::string RomanNumeral(const CChordLite& chord, const CSignKeyLite& key,
                                       const CChordLite* next = nullptr,
                                       const TNumeralOptions& options = {});

/// The numeral of each chord of a list in its region; empty for the undefined ones.
[[nodiscard]] std::vector<std::string> NumeralsOf(const CHarmAnlsChords& chords,
                                                  const CKeyOfSong& keys,
                                                  const TNumeralOptions& options = {});

/// The chord of a numeral or a Nashville number in a key; nothing if the text is none. Of the
/// options only `mFigures` counts.
///
/// Reads what RomanNumeral writes, also ninths and the like (V9, V7b9, Iadd9), maj7 for ^7, chords
/// of another degree with any numeral (ii7/V), and a bass by degree or by name (I/3, I/E). In
/// minor, bIII, bVI and bVII are III, VI and VII, as many write them.
[[nodiscard]] std::optional<CChordLite> ChordFromNumeral(std::string_view text,
                                                         const CSignKeyLite& key,
                                                         const TNumeralOptions& options = {});

}  // namespace brindle
