// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordLite.h"
#include "brindle/theory/CSignKeyLite.h"

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace brindle {

/// A chord that is wished for, or a kind of chord.
struct CWishedChord {
    CChordLite mChord;  ///< its spelling does not count
    /// Any chord on this root with the third and the fifth of the chord, and no other sevenths than
    /// `mSevenths`: Dm, Dm7 and Dm9 for ii in C. Otherwise exactly this one.
    bool mIsKind = false;
    /// Bit 10 for a minor seventh and bit 11 for a major one.
    std::uint64_t mSevenths = kBothSevenths;

    bool mAnyBass = false;  ///< `mChord` over whichever bass

    /// Any seventh.
    static constexpr std::uint64_t kBothSevenths = 0b110000000000;

    /// Whether a chord is such a one, whatever its spelling.
    [[nodiscard]] bool Fits(int root, int bass, std::uint64_t mask) const;
};

/// What is wished of some chords.
enum TSongWishKind : std::uint8_t {
    TSongWish_Bars,      ///< these beats sound so, the rest is free
    TSongWish_Begin,     ///< the song begins with this chord
    TSongWish_End,       ///< the song ends on this chord
    TSongWish_Contains,  ///< these chords stand somewhere, one behind the other
    TSongWish_Never,     ///< none of these chords; without a bass of its own over none at all
};

/// What somebody wants of a song.
struct CSongWish {
    TSongWishKind mKind = TSongWish_Never;  ///< tells which fields count
    /// As it was typed.
    std::string mText;
    std::vector<CWishedChord> mChords;  ///< those that it names, in their order
    /// Of TSongWish_Bars: for each beat from `mFirstBeat` on the index of its chord, -1 for free.
    std::vector<std::int32_t> mBeats;
    std::size_t mFirstBeat = 0;  ///< from 0, the first beat of the song
};

/// Wishes, or what is wrong with the text of them.
struct CSongWishReading {
    std::vector<CSongWish> mWishes;  ///< to be used only without a fault
    /// Of a sheet: its length.
    std::size_t mBars = 0;
    std::string mFault;  ///< a line for people; empty if all is understood
};

/// Reads a lead sheet with gaps. In `C . Am . | _ | _ | G7 | C`, bars stand between |, the chords
/// of a bar share it evenly, a dot holds the chord before and `_` is free. Each chord is a wish of
/// its own.
[[nodiscard]] CSongWishReading ReadSheetWishes(std::string_view text, int beatsPerBar);

/// `C`, `Dm7 G7 C`, `ii-V-I of F`, `ii7 V7`: chords, or numerals of a key, `key` where the text
/// tells none. One wish with all of them.
[[nodiscard]] CSongWishReading ReadChordsWish(TSongWishKind kind, std::string_view text,
                                              const CSignKeyLite& key);

/// The wishes of a blues, twelve bars a chorus: I, IV and V where every blues has them.
[[nodiscard]] std::vector<CSongWish> BluesWishes(const CSignKeyLite& key, int beatsPerBar,
                                                 std::size_t choruses = 1);

}  // namespace brindle
