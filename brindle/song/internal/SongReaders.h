// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/ReadSong.h"
#include "brindle/song/SplitSongs.h"

#include <string_view>
#include <vector>

/// The readers of single forms. Each gives a song with its format and its faults, by their places.
namespace brindle::SongReaders {

/// Chord text, plain or even, chords above lyrics, ChordPro, packed charts, and chord strings.
[[nodiscard]] CSong ReadSheet(std::string_view text, TSongFormat format, const CSongOptions& prefs);

/// One song of a text that holds several.
struct CPartOfText {
    std::string_view mText;
    std::size_t mLinesBefore = 0;
};

/// The songs of a ChordPro text, which `{new_song}` parts from each other; one at least.
[[nodiscard]] std::vector<CPartOfText> SongsOfChordPro(std::string_view text);
[[nodiscard]] CSong ReadChordProSong(const CPartOfText& part, const CSongOptions& prefs);

/// Whether bytes of this form are links, or a page with links; asked at once, without a look at all
/// of them.
[[nodiscard]] bool HoldsCharts(std::string_view bytes, TSongFormat format);

/// The charts of links, or of a page with links; each link has one or more.
[[nodiscard]] std::vector<CUnreadSong> SplitChartLinks(std::string_view text, TSongFormat format,
                                                       const CSongOptions& prefs);
[[nodiscard]] std::vector<CSong> ReadChartLinks(std::string_view text, TSongFormat format,
                                                const CSongOptions& prefs);

/// An analysis in Roman numerals. Repeats are not played: what is written stands once.
[[nodiscard]] CSong ReadRomanSong(std::string_view text, const CSongOptions& prefs);

/// A score, plain or in a container.
[[nodiscard]] CSong ReadScoreSong(std::string_view bytes, TSongFormat format);

/// Leaves of a song with a fault its texts and the faults, unless the reading is lenient.
void GiveUpWhatIsAtFault(CSong& song, bool isLenient);

}  // namespace brindle::SongReaders
