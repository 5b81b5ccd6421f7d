// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>

namespace brindle {

/// The forms in which songs are written down.
enum TSongFormat : std::uint8_t {
    /// Whichever of these it looks like.
    TSongFormat_Auto,
    /// Chord symbols, bar lines and holds between white space: `Dm7 G7 | C . . .`.
    TSongFormat_ChordText,
    /// The same, where the chords of a bar without holds share it evenly: `Dm7 G7 | C`.
    TSongFormat_EvenText,
    /// Lines of chords above lines of lyrics.
    TSongFormat_ChordsAboveLyrics,
    /// Lyrics with chords in square brackets and directives in braces, `{title: ...}`.
    TSongFormat_ChordPro,
    /// The packed text of chart collections: `{*AT44C^7 |A-7 D7 }`.
    TSongFormat_Chart,
    /// `irealb://` or `irealbook://`, one link with one or many charts.
    TSongFormat_ChartLink,
    /// A web page with such links.
    TSongFormat_ChartPage,
    /// Lengths and chords, one sequence a line: `(4,C);(2,G7)`.
    TSongFormat_ChordStrings,
    TSongFormat_MusicXml,
    /// A zip container with a score in it, `.mxl`.
    TSongFormat_CompressedMusicXml,
    /// Analyses in Roman numerals, a line for each measure: `m1 C: I b3 V65/V`.
    TSongFormat_RomanText,
};

/// Whether a song in this form is engraved music.
[[nodiscard]] constexpr bool IsScore(TSongFormat format) {
    return format == TSongFormat_MusicXml || format == TSongFormat_CompressedMusicXml;
}

}  // namespace brindle
