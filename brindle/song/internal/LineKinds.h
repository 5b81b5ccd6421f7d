// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <string_view>
#include <vector>

namespace brindle::SongText {

/// What a line of a song sheet is, when chords stand above lyrics.
enum class TLineKind : std::uint8_t {
    Blank,
    Chords,
    /// A name of a part alone: `[Verse 1]`, `Chorus:`.
    Section,
    /// A name and what it is: `Key: G`.
    Field,
    /// Strings of an instrument with frets on them, or a chord with its frets.
    Tablature,
    Lyrics,
};

struct CTextLine {
    /// Without white space around it.
    std::string_view mText;
    TLineKind mKind = TLineKind::Blank;
};

/// The lines of a text. Lines such as "A" and "Go" are told from their neighbours.
[[nodiscard]] std::vector<CTextLine> LinesOf(std::string_view text);

/// Whether the name of a part stands in brackets in front of other things: `[Intro] G C`.
[[nodiscard]] bool BeginsWithSection(std::string_view line);

/// `Verse 1` of `[Verse 1]` and of `Verse 1:`.
[[nodiscard]] std::string_view NameOfSection(std::string_view line);

/// The bytes of a name of a part that a line with chords in brackets begins with, `[Verse 1]`;
/// 0 for a line that begins otherwise.
[[nodiscard]] std::size_t LengthOfNameInBrackets(std::string_view line);

/// Whether a line without brackets has chords alone, two or more, and not only those that are
/// words, too.
[[nodiscard]] bool IsLineOfChords(std::string_view line);

/// Whether `[G]` stands in a text as a chord.
[[nodiscard]] bool HasChordInBrackets(std::string_view text);

}  // namespace brindle::SongText
