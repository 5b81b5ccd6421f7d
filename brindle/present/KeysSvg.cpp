// SPDX-License-Identifier: MIT
// The keys of a song as a ribbon. Time runs from left to right and breaks into lines as text does.
// Each line has, from above: the numbers of the bars, the ribbon in the colors of the keys, the
// chords in boxes and their numerals under them.

#include "brindle/present/KeysSvg.h"

#include "brindle/present/KeyColor.h"
#include "brindle/present/SongShapes.h"

#include <fmt/format.h>

#include <algorithm>

namespace brindle {
namespace {

constexpr double kMarginOfKeys = 20.0;
constexpr double kWidthOfKeys = 960.0;
constexpr double kKeysTitleHeight = 30.0;

// From above: what a line of the song is made of.
constexpr double kRibbonTop = 18.0;
constexpr double kKeysChordTop = 44.0;
constexpr double kNumeralTop = kKeysChordTop + kCaptionBelowChord;
constexpr double kKeysLineHeight = 100.0;
constexpr double kKeysLineGap = 20.0;

constexpr double kRibbonHeight = 24.0;

constexpr double kKeysTitleSize = 16.0;
constexpr double kKeysNumeralSize = 13.0;

double WidestChord(const CShownKeys& keys) {
    double widest = 0.0;
    for (const CShownKeyRegion& region : keys.mRegions) {
        for (const CShownNumeral& chord : region.mChords) {
            widest =
                std::max(widest, WidthOfChord(chord.mSymbol, chord.mNumeral, kKeysNumeralSize));
        }
    }
    // A monster among the symbols does not stretch the whole picture.
    return std::min(widest, kWidthOfKeys / 4);
}

class CKeysPicture {
public:
    explicit CKeysPicture(const CShownSong& song)
        : mKeys(song.mKeys), mAxis(song, kWidthOfKeys, WidestChord(song.mKeys)) {
        for (std::size_t line = 0; line < mAxis.LineCount(); ++line) {
            mPlaces.mTops.push_back(kMarginOfKeys + kKeysTitleHeight + HeightOfKeyNotes(mKeys) +
                                    static_cast<double>(line) * (kKeysLineHeight + kKeysLineGap));
        }
        mSvg.Text(kMarginOfKeys, kMarginOfKeys + kKeysTitleSize, Title(),
                  {.mSize = kKeysTitleSize, .mColor = kInk, .mBold = true});
        DrawKeyNotes(mSvg, mKeys, kMarginOfKeys, kMarginOfKeys + kKeysTitleHeight, kWidthOfKeys);
        if (mKeys.mRegions.empty()) return;
        DrawBarLines(mSvg, mAxis, mPlaces, kNumeralTop);
        DrawKeyRegions(mSvg, mAxis, mPlaces, mKeys, kRibbonTop, kRibbonHeight);
        for (const CShownKeyRegion& region : mKeys.mRegions) Draw(region);
    }

    [[nodiscard]] std::string File() const {
        return mSvg.File(kWidthOfKeys + 2 * kMarginOfKeys,
                         mPlaces.mTops.back() + kKeysLineHeight + kMarginOfKeys, Title(),
                         DescriptionOf("The keys of a song in time", mKeys));
    }

private:
    [[nodiscard]] std::string Title() const {
        if (mKeys.mRegions.empty()) return "No key: no chords";
        return fmt::format("{}, confidence {:.2f}", mKeys.mName, mKeys.mConfidence);
    }

    void Draw(const CShownKeyRegion& region) {
        const std::string color = ColorOf(region.mKey, Shade_Chord);
        for (const CShownNumeral& chord : region.mChords) {
            DrawChord(
                mSvg, mAxis, mPlaces, chord.mRange,
                {kKeysChordTop, color, chord.mSymbol, chord.mNumeral, {.mSize = kKeysNumeralSize}});
        }
    }

    const CShownKeys& mKeys;
    CTimeAxis mAxis;
    CSvg mSvg;
    CLinePlaces mPlaces{kMarginOfKeys, {}};
};

}  // namespace

std::string KeysSvg(const CShownSong& song) {
    return CKeysPicture(song).File();
}

}  // namespace brindle
