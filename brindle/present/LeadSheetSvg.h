// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <string>
#include <vector>

namespace brindle {

struct CSong;
struct CSongReading;

/// The colors of a lead sheet.
enum TSheetTheme : std::uint8_t {
    TSheetTheme_Auto,  ///< those that the viewer prefers, light or dark
    TSheetTheme_Light,
    TSheetTheme_Dark,
};

/// What a lead sheet is drawn on.
enum TSheetPage : std::uint8_t {
    TSheetPage_Endless,  ///< one page, as high as the song
    TSheetPage_A4,       ///< 210 by 297 mm
};

/// How a lead sheet is laid out and coloured.
struct CLeadSheetOptions {
    /// 1 to 16. A line has fewer where they don't fit.
    int mBarsPerLine = 4;
    /// Of an endless page, 200 to 4000 pixels. A narrow page has fewer bars a line.
    double mWidth = 800.0;
    /// An endless page, or paper.
    TSheetPage mPage = TSheetPage_Endless;
    /// The colours of paper and ink.
    TSheetTheme mTheme = TSheetTheme_Auto;
};

/// Draws a song as a lead sheet with the marks of a teacher: bars with chord symbols, the numerals
/// below them, the key as a quiet color with its name where it begins, brackets under a second with
/// its dominant, and arrows from a dominant to the chord that it resolves to; what stands for a
/// dominant has dotted ones.
///
/// A passage that repeats the one directly before it stands once between repeat signs, with its
/// endings; one that is played again by a jump is written out and says which bars it is. A long
/// rest is one bar with a number. Pages stand below each other, each an `<svg>` of its own; a song
/// is set smaller if that lets it fit: by an eighth for one page, by a third at most for two.
/// `reading` is that of the chords of the song; what it lacks is left out. Values of options beyond
/// their ranges count as the nearer end. Linear in the length of the song.
[[nodiscard]] std::string LeadSheetSvg(const CSong& song, const CSongReading& reading,
                                       const CLeadSheetOptions& options = {});

/// The same as files, one a page.
[[nodiscard]] std::vector<std::string> LeadSheetPages(const CSong& song,
                                                      const CSongReading& reading,
                                                      const CLeadSheetOptions& options = {});

}  // namespace brindle
