// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/MidiFile.h"
#include "brindle/song/WriteSong.h"

#include <cstdint>
#include <string>
#include <string_view>

namespace brindle {

/// A song as a chord text, four bars a line, each part under its letter in brackets. Read with as
/// many beats in a bar it is the same song again.
[[nodiscard]] std::string WrittenSongText(const CSong& song);

/// "the longest quote: 2.5 bars from bar 5 on are bars 1 to 3 of Amazing Grace"; empty for none.
[[nodiscard]] std::string QuoteText(const CWrittenQuote& quote);

/// Why there is no song, with the wishes that cannot be met together; `sign` stands before each of
/// them, as before an option. Empty if the song was written.
[[nodiscard]] std::string WrittenSongFault(const CWrittenSong& written, std::string_view sign = {});

/// The song with the reading of its chords as JSON; docs/json.md has the members.
[[nodiscard]] std::string WrittenSongJson(const CWrittenSong& written, const std::string& form,
                                          std::uint64_t seed);

/// Beats a minute of a song that tells none.
inline constexpr double kUsualTempo = 120.0;

/// Whether a number will do as the tempo of a song that is played; false for what is no number.
[[nodiscard]] constexpr bool IsPlayableTempo(double tempo) {
    return tempo >= 1.0 && tempo <= 1000.0;
}

/// A song for two tracks, chords and bass. Each chord is laid so that its tones are near to those
/// of the chord before, around the E above middle C. `tempo` is beats a minute.
[[nodiscard]] CMidiPiece MidiPieceOfSong(const CSong& song, double tempo);

}  // namespace brindle
