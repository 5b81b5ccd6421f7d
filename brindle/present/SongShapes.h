// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/CSvg.h"
#include "brindle/present/CTimeAxis.h"

#include <string>
#include <vector>

namespace brindle {

// The shapes that the pictures of a song share. Heights count from the top of a line of the song.

inline constexpr std::string_view kInk = "#222222";       ///< of chord symbols
inline constexpr std::string_view kFaintInk = "#666666";  ///< of what stands beside them

inline constexpr double kSymbolSize = 14.0;  ///< of chord symbols, in pixels
inline constexpr double kLabelSize = 12.0;   ///< of the labels of bands
inline constexpr double kSmallSize = 10.0;   ///< of bar numbers

/// Where the lines of a song lie in a picture, in pixels.
struct CLinePlaces {
    double mLeft = 0.0;         ///< where all of them begin
    std::vector<double> mTops;  ///< of each line
};

/// The bar lines of the song from its bar numbers down to `bottom`.
void DrawBarLines(CSvg& svg, const CTimeAxis& axis, const CLinePlaces& places, double bottom);

/// A colored band with a label: where it lies, and how it looks.
struct CBand {
    double mTop = 0.0;      ///< of the band in its line, in pixels
    double mHeight = 18.0;  ///< in pixels
    std::string mColor;     ///< of its ground, as in CSS
    std::string mLabel;     ///< cut where it does not fit; whole as a tooltip
    CSvgFont mFont;         ///< of its label
};

/// Draws a band over all lines that the range touches, with its label on each.
void DrawBand(CSvg& svg, const CTimeAxis& axis, const CLinePlaces& places, const CTimeRange& range,
              const CBand& band);

/// Draws a band for each region of the keys of a song; the key of the song is bold.
void DrawKeyRegions(CSvg& svg, const CTimeAxis& axis, const CLinePlaces& places,
                    const CShownKeys& keys, double top, double height);

/// What DrawKeyNotes needs below its top, in pixels.
[[nodiscard]] double HeightOfKeyNotes(const CShownKeys& keys);

/// Writes what is to be said of keys that contradict each other, a line each.
void DrawKeyNotes(CSvg& svg, const CShownKeys& keys, double left, double top, double width);

/// What a screen reader tells of such a picture: what it is, then the keys with their chords. No
/// longer than anybody listens.
[[nodiscard]] std::string DescriptionOf(std::string_view picture, const CShownKeys& keys);

/// A chord in a colored box, with a text under it.
struct CChordBox {
    double mTop = 0.0;      ///< of the box in its line, in pixels
    std::string mColor;     ///< of its ground, as in CSS
    std::string mSymbol;    ///< in the box
    std::string mCaption;   ///< below the box
    CSvgFont mCaptionFont;  ///< of that text
};

/// From the top of a chord's box to the top of its caption.
inline constexpr double kCaptionBelowChord = 36.0;

/// Draws a box over all lines that the chord touches, with its texts on the first.
void DrawChord(CSvg& svg, const CTimeAxis& axis, const CLinePlaces& places, const CTimeRange& range,
               const CChordBox& box);

/// The width for the widest of some chords: `symbol` and `caption` are as long as they are drawn.
[[nodiscard]] double WidthOfChord(std::string_view symbol, std::string_view caption,
                                  double captionSize);

}  // namespace brindle
