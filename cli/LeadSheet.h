// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/song/HarmonySymbols.h"

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
struct TTypedSong {
    std::string mName;  ///< of the file, empty for what stands on the command line
    std::string mText;
    /// Whether it is a score in MusicXML, by its name or by its first bytes.
    bool mIsScore = false;
};

/// The song in a file, or in the words of a command line: one word that ends like the name of a
/// score (.musicxml, .xml, .mxl) is the name of a file, and "-" reads standard input. Nothing when
/// it cannot be read; then the error has been printed.
[[nodiscard]] std::optional<TTypedSong> ReadTypedSong(const std::vector<std::string>& words,
                                                      const std::string& file);

/// Whether a file that begins so is a score and no chord text.
[[nodiscard]] bool HasScoreBytes(std::string_view bytes);

/// The chords of a score, plain or compressed. Nothing when it cannot be read; then the error has
/// been printed.
[[nodiscard]] std::optional<TMusicXMLDoc> ReadLeadSheet(const TTypedSong& song, TTiming timing);

/// Whether every chord has a place in time; a score read as TTiming::Native may have others.
[[nodiscard]] bool HasTimes(const TMusicXMLDoc& sheet);

/// Where the last chord ends.
[[nodiscard]] double EndOf(const TMusicXMLDoc& sheet);

/// `chords`, which an analysis read from the score, in the form that a chord text gives: with an
/// undefined chord where no chord sounds, and one at the end.
[[nodiscard]] CHarmAnlsChords WithRests(const CHarmAnlsChords& chords, const TMusicXMLDoc& sheet);

/// The chord symbol of a harmony as a lead sheet prints it, in a form that reads back as the same
/// chord where there is one: "F#m7b5/C", "N.C.".
[[nodiscard]] std::string SymbolOf(const TMusicXMLHarmony& harmony);

}  // namespace brindle::cli
