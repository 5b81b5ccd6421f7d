// SPDX-License-Identifier: MIT
#pragma once

#include "cli/Output.h"

#include "brindle/song/CSong.h"
#include "brindle/song/ReadLeadSheet.h"

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace brindle::cli {

/// What the user names or types as a song, not yet understood.
struct CTypedSong {
    std::string mName;  ///< of the file, empty for what stands on the command line
    std::string mText;
    /// Whether it is a score in MusicXML, by its name or by its first bytes.
    bool mIsScore = false;
};

/// Where a song is: in a file, "-" for standard input, or typed.
struct CSongSource {
    std::string mFile;
    std::string mText;
};

/// The songs in the words of a command line. A word that names a file or looks like the name of one
/// (song.txt, songs/blues.musicxml) is a song; the words between two of these are the text of one.
[[nodiscard]] std::vector<CSongSource> SongSources(const std::vector<std::string>& words);

/// The song of a source. Nothing when it cannot be read or is empty; then the error has been
/// printed.
[[nodiscard]] std::optional<CTypedSong> ReadTypedSong(const CSongSource& source);

/// Whether a file that begins so is a score and no chord text.
[[nodiscard]] bool HasScoreBytes(std::string_view bytes);

/// Prints why a score cannot be read, and whether it looks like one at all.
void TellScoreFault(std::string_view bytes, const std::string& name, std::string_view reason);

/// Prints that a song has no chords, and what finds them in the notes of a score.
TStatus FailWithoutChords(const CTypedSong& song);

/// The song of a score, as it is played. Nothing when it cannot be read; then the error has been
/// printed.
[[nodiscard]] std::optional<CSong> ReadScore(const CTypedSong& typed);

/// The harmonies of a score. Nothing when it cannot be read; then the error has been printed.
[[nodiscard]] std::optional<TMusicXMLDoc> ReadHarmonies(const CTypedSong& typed,
                                                        TLeadSheetTiming timing);

}  // namespace brindle::cli
