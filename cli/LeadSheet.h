// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/TMusicXMLDoc.h"

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace brindle::cli {

/// How the chords of a score are laid out in time.
enum class TTiming {
    Played,  ///< as a musician plays the score
    Native,  ///< as TMusicXMLDoc::LoadFromMusicXMLFile does
};

/// What the user names or types as a song, not yet understood.
struct CTypedSong {
    std::string mName;  ///< of the file, empty for what stands on the command line
    std::string mText;
    /// Whether it is a score in MusicXML, by its name or by its first bytes.
    bool mIsScore = false;
};

/// The song in a file, or in the words of a command line: one word that ends like the name of a
/// score (.musicxml, .xml, .mxl) is the name of a file, and "-" reads standard input. Nothing when
/// it cannot be read; then the error has been printed.
[[nodiscard]] std::optional<CTypedSong> ReadTypedSong(const std::vector<std::string>& words,
                                                      const std::string& file);

/// Whether a file that begins so is a score and no chord text.
[[nodiscard]] bool HasScoreBytes(std::string_view bytes);

/// The chords of a score, plain or compressed. Nothing when it cannot be read; then the error has
/// been printed.
[[nodiscard]] std::optional<TMusicXMLDoc> ReadLeadSheet(const CTypedSong& song, TTiming timing);

}  // namespace brindle::cli
