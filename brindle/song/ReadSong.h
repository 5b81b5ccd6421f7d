// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/ReadChordText.h"
#include "brindle/song/CSong.h"

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace brindle {

/// How a song is read.
struct CSongOptions {
    TSongFormat mFormat = TSongFormat_Auto;  ///< to be found out, or the only form that is tried
    /// Length of a bar in a text that does not tell; beats above 0.
    double mBeatsPerBar = 4.0;
    /// How far a chord or a hold moves on in such a text; beats above 0.
    double mBeatsPerChord = 1.0;
    /// The chords of a bar that has no holds share it evenly, in texts of any form; a text without
    /// bar lines has no bars. Charts are always read so.
    bool mEven = false;
    /// What is not understood becomes a "No Chord Yield", and all faults are told.
    bool mLenient = false;
    /// `mBIsBFlat` is set by any H in the song.
    CChordTextOptions mChordTextPrefs{};
    /// Of the numerals of an analysis, up to the first key that it states.
    CSignKeyLite mKey = {};
};

/// Reads a song in any form.
///
/// Nothing is printed or thrown for bad music or bad bytes: faults are in the song. A text is
/// UTF-8, or UTF-16 that SongTextFromUtf16 knows. Of a source with many songs this is the first.
/// Repeats and jumps may play 64 times what is written, 10,000 bars and chords in any case and
/// 100,000 at most; a song that goes on is at fault. Time is n log n in what is read and played.
[[nodiscard]] CSong ReadSong(std::string_view bytes, const CSongOptions& prefs = {});

/// All songs of a source: those of a link, of a page, or of a ChordPro text with `{new_song}`; of
/// any other form there is one.
[[nodiscard]] std::vector<CSong> ReadSongs(std::string_view bytes, const CSongOptions& prefs = {});

/// The same for a file; that it is missing, unreadable or larger than 256 MiB is a fault. A song
/// without a title has none: the name of the file is not one.
[[nodiscard]] CSong ReadSongFile(const std::string& path, const CSongOptions& prefs = {});
/// All songs of a file.
[[nodiscard]] std::vector<CSong> ReadSongsFile(const std::string& path,
                                               const CSongOptions& prefs = {});

/// A text in UTF-16 as UTF-8, in which the lines and columns of its faults are counted. UTF-16 is
/// told by its byte-order mark, or by the zeros beside its first letters. Nothing for other bytes
/// and for scores, whose XML tells its encoding itself.
[[nodiscard]] std::optional<std::string> SongTextFromUtf16(std::string_view bytes);

/// Whether bytes, of which the first are looked at, are no text but a picture, a recording or the
/// like; so is a compressed score.
[[nodiscard]] bool HasNoText(std::string_view bytes);

/// What a source looks like: any form but TSongFormat_Auto and TSongFormat_EvenText.
[[nodiscard]] TSongFormat SongFormatOf(std::string_view bytes);

}  // namespace brindle
