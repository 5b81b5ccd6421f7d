// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordLite.h"
#include "brindle/theory/CSignKeyLite.h"

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace brindle {

class CHarmAnlsChords;
struct CKeyOfSong;

/// How numerals are written, and which of two readings some of them have.
struct CNumeralOptions {
    /// Nashville numbers: 2-7 5 1 instead of ii7 V I.
    bool mNashville = false;
    /// Inversions as figures: V65, I6, and viø7 in minor is on the raised sixth degree. Otherwise
    /// the degree of the bass stands behind a slash, V7/^7, and I6 has an added sixth.
    bool mFigures = false;
    /// The printed signs, ø and °, instead of h and o.
    bool mPrintedSigns = false;
    /// What has no sign of its own is that of the key, as in RomanText: IV7 in C is Fmaj7, V9 in A
    /// minor has an F, I6 is an inversion, and vi and vii in minor are on the raised degrees.
    /// Otherwise the text says all, as in a chord symbol: IV7 is F7 and V9 has an F sharp.
    bool mByKey = false;

    friend constexpr bool operator==(const CNumeralOptions&, const CNumeralOptions&) = default;
};

/// The degree of a chord in a key with signs for all its tones. Empty for an undefined chord or
/// key.
///
/// Degrees count in the key: III is E flat in C minor and E in C major. Small letters are minor and
/// diminished chords. Behind them stand ^7 (a major seventh), 6, 7, 9, h7 (half diminished), o, o7,
/// +, sus, 5 (no third) and alterations: 7b9, ^7#5, 7#11add13, no5. Behind a slash and a ^ stands
/// the degree of the bass in digits, spelled as it is in the key: I/^3, V7/ii/^#1.
///
/// With the chord that follows, a dominant of another degree is written as such: A7 before Dm in
/// C major is V7/ii, Eb7 there is subV7/ii, C#o is viio/ii.
///
/// ChordFromNumeral with the same options reads the same tones and the same bass.
[[nodiscard]] std::string RomanNumeral(const CChordLite& chord, const CSignKeyLite& key,
                                       const CChordLite* next = nullptr,
                                       const CNumeralOptions& options = {});

/// A numeral that is read already, "V7/ii" or "subV7/I", with all tones and the bass of its chord
/// and in another style: the degree and what it is applied to stay, N6, Ger6 and their like stay
/// as they are. With `mNashville` the number of the chord in the key.
[[nodiscard]] std::string NumeralInStyle(std::string_view numeral, const CChordLite& chord,
                                         const CSignKeyLite& key, const CNumeralOptions& options);

/// The numeral of each chord of a list in its region; empty for the undefined ones.
[[nodiscard]] std::vector<std::string> NumeralsOf(const CHarmAnlsChords& chords,
                                                  const CKeyOfSong& keys,
                                                  const CNumeralOptions& options = {});

/// What ReadNumeral makes of a text.
struct CNumeralReading {
    /// Undefined if the text is no numeral.
    CChordLite mChord;
    /// What is wrong, a text that lives as long as the program; empty if nothing is.
    std::string_view mFault;
    /// Where that is, in bytes from 0.
    std::size_t mFaultOffset = 0;
};

/// The chord of a Roman numeral or a Nashville number in a key. Of the options `mFigures` and
/// `mByKey` count.
///
/// Reads what RomanNumeral writes and what people write: docs/numerals.md has all forms. A figure
/// behind a slash is a figure (V6/5), a Roman degree behind a slash is what the numeral is applied
/// to (V7/V/V, in the key that its letters tell), a digit (I/3, also I/^3) or a letter (I/E) is the
/// bass. Tones in square brackets are those of the key: V[no3][add4]. Time is linear in the length.
[[nodiscard]] CNumeralReading ReadNumeral(std::string_view text, const CSignKeyLite& key,
                                          const CNumeralOptions& options = {});

/// The same without the reason; nothing if the text is no numeral.
[[nodiscard]] std::optional<CChordLite> ChordFromNumeral(std::string_view text,
                                                         const CSignKeyLite& key,
                                                         const CNumeralOptions& options = {});

}  // namespace brindle
