// SPDX-License-Identifier: MIT
// A song as a picture. Time runs from left to right and breaks into lines as text does. Each line
// has, from above: the numbers of the bars, a band for the sign key, a band for the center, the
// chords in boxes with their function or else their degree under them, their fingerings if these
// are asked for, a band for the key of the passage, and thin bands for the repeated passages and
// for the readings. A score has its title above, and its times and rehearsal marks beside the
// numbers of the bars. The color of a band is that of its key.

#include "brindle/present/AnalysisSvg.h"

#include "brindle/present/CTimeAxis.h"
#include "brindle/present/GridsSvg.h"
#include "brindle/present/KeyColor.h"
#include "brindle/present/ShownNames.h"
#include "brindle/present/SongShapes.h"
#include "brindle/present/internal/AnalysisSvg_Copies.h"

#include <fmt/format.h>

#include <algorithm>

namespace brindle {
namespace {

constexpr double kMargin = 20.0;
constexpr double kLineWidth = 960.0;

// From above: what a line of the song is made of.
constexpr double kSignKeyTop = 18.0;
constexpr double kCenterTop = 38.0;
constexpr double kChordTop = 60.0;
constexpr double kFunctionTop = kChordTop + kCaptionBelowChord;
constexpr double kGridTop = 128.0;    // of the strings, with the open ones marked above
constexpr double kKeysTop = 115.0;    // without grids
constexpr double kCopiesTop = 138.0;  // without grids
constexpr double kGridRoom = 64.0;
constexpr double kReadingPitch = 16.0;
constexpr double kLineGap = 24.0;

constexpr double kBandHeight = 18.0;
constexpr double kReadingHeight = 14.0;

constexpr double kTitleHeight = 30.0;
constexpr double kTitleSize = 18.0;
// Right of a bar line, behind the number of the bar.
constexpr double kSectionLeft = 22.0;
constexpr double kSectionSize = 8.0;
constexpr double kTimeLeft = 34.0;

constexpr double kFunctionSize = 11.0;

// A chord with a grid under it, and the room on its left for the number of the first fret.
constexpr double kNarrowestGrid = 76.0;
constexpr double kGridLeft = 20.0;
constexpr double kGridScale = 0.5;
constexpr double kShapeTop = 176.0;  // under a grid, what is played under the capodaster
constexpr double kShapeSize = 8.0;

constexpr double kPadding = 5.0;

// More readings of one place than this are no help to the eye.
constexpr std::size_t kMostLanes = 8;

std::string FunctionOf(const CShownChord& chord) {
    std::string function = chord.mNumeral;
    if (function.empty()) function = DegreeName(chord.mRootDist);
    if (chord.mBassDist >= 0) function += fmt::format("/{}", DegreeName(chord.mBassDist));
    return function;
}

double WidestChord(const CShownSong& song, bool hasGrids) {
    double widest = hasGrids ? kNarrowestGrid : 0.0;
    ForEachChord(song, [&](const CShownChord& chord) {
        widest = std::max(widest, WidthOfChord(chord.mSymbol, FunctionOf(chord), kFunctionSize));
    });
    // A monster among the symbols does not stretch the whole picture.
    return std::min(widest, kLineWidth / 4);
}

/// Spreads the readings over lanes so that none covers another.
class CLanes {
public:
    /// `readings` are sorted by their begin.
    explicit CLanes(const std::vector<CShownCenter>& readings) {
        std::vector<double> laneEnds;
        for (const CShownCenter& reading : readings) {
            const auto free = std::find_if(laneEnds.begin(), laneEnds.end(), [&](double end) {
                return end <= reading.mRange.mBegin;
            });
            const auto lane = static_cast<std::size_t>(free - laneEnds.begin());
            mLaneOfReading.push_back(lane);
            if (free != laneEnds.end()) {
                *free = reading.mRange.mEnd;
            } else if (laneEnds.size() < kMostLanes) {
                laneEnds.push_back(reading.mRange.mEnd);
            } else {
                ++mLeftOut;
            }
        }
    }

    /// `kMostLanes` for a reading that is left out.
    [[nodiscard]] std::size_t LaneOf(std::size_t reading) const { return mLaneOfReading[reading]; }
    [[nodiscard]] std::size_t LeftOut() const { return mLeftOut; }

private:
    std::vector<std::size_t> mLaneOfReading;
    std::size_t mLeftOut = 0;
};

class CSongPicture {
public:
    CSongPicture(const CShownSong& song, const TChordGrids* grids, const CGridStyle& style)
        : mSong(song),
          mGrids(grids),
          mGridStyle(style),
          mAxis(song, kLineWidth, WidestChord(song, grids != nullptr)),
          mLanes(song.mReadings) {
        PlaceLines();
        if (song.mEnd <= 0.0) {
            mSvg.Text(kMargin + kPadding, kMargin + kChordTop, "no chords",
                      {.mSize = kSymbolSize, .mColor = kFaintInk});
            return;
        }
        DrawKeyNotes(mSvg, mSong.mKeys, kMargin, KeyNotesTop(), kLineWidth);
        DrawBarLines(mSvg, mAxis, mPlaces, kFunctionTop);
        DrawScore();
        DrawSignKeys();
        for (const CShownSignKey& signKey : song.mSignKeys) {
            for (const CShownCenter& center : signKey.mCenters) Draw(center);
        }
        const std::string noKey = ColorOf(CSignKeyLite_Undef, Shade_Chord);
        for (const CShownChord& chord : song.mLooseChords) Draw(chord, noKey);
        DrawKeyRegions(mSvg, mAxis, mPlaces, song.mKeys, kKeysTop + GridRoom(), kBandHeight);
        DrawCopies(mSvg, mAxis, mPlaces, song, kCopiesTop + GridRoom(), kReadingHeight);
        DrawReadings();
    }

    [[nodiscard]] std::string File() const {
        double height = mBottom + kMargin;
        CSvg svg = mSvg;
        if (mLanes.LeftOut() > 0) {
            svg.Text(kMargin, mBottom + kSmallSize,
                     fmt::format("{} more readings are not shown", mLanes.LeftOut()),
                     {.mSize = kSmallSize, .mColor = kFaintInk});
            height += kSmallSize;
        }
        return svg.File(kLineWidth + 2 * kMargin, height, Title(),
                        DescriptionOf("The harmony of a song in time", mSong.mKeys));
    }

private:
    [[nodiscard]] std::string Title() const {
        std::string title = mSong.mScore.mTitle.empty() ? "Harmony" : mSong.mScore.mTitle;
        for (const CShownSignKey& signKey : mSong.mSignKeys) title += ", " + signKey.mName;
        return title;
    }

    // What lies under the chords moves down by this.
    [[nodiscard]] double GridRoom() const { return mGrids == nullptr ? 0.0 : kGridRoom; }

    // The repeated passages have a band above the readings.
    [[nodiscard]] double ReadingsTop() const {
        return kCopiesTop + GridRoom() + (mSong.mCopies.empty() ? 0.0 : kReadingPitch);
    }

    [[nodiscard]] double KeyNotesTop() const {
        return mSong.mScore.mTitle.empty() ? kMargin : kMargin + kTitleHeight;
    }

    // Each line is as high as the readings on it need.
    void PlaceLines() {
        std::vector<std::size_t> lanes(mAxis.LineCount(), 0);
        for (std::size_t i = 0; i < mSong.mReadings.size(); ++i) {
            if (mLanes.LaneOf(i) >= kMostLanes) continue;
            for (const CTimeSegment& segment : mAxis.SegmentsOf(mSong.mReadings[i].mRange)) {
                lanes[segment.mLine] = std::max(lanes[segment.mLine], mLanes.LaneOf(i) + 1);
            }
        }
        mBottom = KeyNotesTop() + HeightOfKeyNotes(mSong.mKeys);
        for (const std::size_t count : lanes) {
            mPlaces.mTops.push_back(mBottom);
            mBottom += ReadingsTop() + static_cast<double>(count) * kReadingPitch + kLineGap;
        }
        mBottom -= kLineGap;
    }

    // The title above all, and beside the numbers of the bars the times and the rehearsal marks.
    void DrawScore() {
        const CShownScore& score = mSong.mScore;
        if (!score.mTitle.empty()) {
            mSvg.TextCut(kMargin, kMargin + kTitleSize, kLineWidth, score.mTitle,
                         {.mSize = kTitleSize, .mColor = kInk, .mBold = true});
        }
        for (const CShownScore::CTime& time : score.mTimes) {
            DrawMark(time.mPosition, [&](double x, double top) {
                mSvg.Text(x + kTimeLeft, top + 13, time.mName,
                          {.mSize = kSmallSize, .mColor = kInk, .mBold = true});
            });
        }
        for (const double section : score.mSections) {
            DrawMark(section, [&](double x, double top) {
                mSvg.Rect(x + kSectionLeft, top + 5, kSectionSize, kSectionSize, kInk,
                          "Rehearsal mark");
            });
        }
    }

    template <class TDraw>
    void DrawMark(double position, const TDraw& draw) {
        const auto segments = mAxis.SegmentsOf({position, mSong.mEnd});
        if (!segments.empty()) draw(kMargin + segments[0].mLeft, mPlaces.mTops[segments[0].mLine]);
    }

    void DrawSignKeys() {
        for (std::size_t i = 0; i < mSong.mSignKeys.size(); ++i) {
            const CShownSignKey& signKey = mSong.mSignKeys[i];
            const bool isLast = i + 1 == mSong.mSignKeys.size();
            const CTimeRange range{signKey.mBegin,
                                   isLast ? mSong.mEnd : mSong.mSignKeys[i + 1].mBegin};
            Band(range, kSignKeyTop, kBandHeight, ColorOf(signKey.mSignKey, Shade_SignKey),
                 "Key signature " + signKey.mName, {.mSize = kLabelSize, .mColor = kFaintInk});
        }
    }

    void Draw(const CShownCenter& center) {
        Band(center.mRange, kCenterTop, kBandHeight, ColorOf(center.mHarmCenter, Shade_Center),
             "Center " + center.mName, {.mSize = kLabelSize, .mColor = kInk, .mBold = true});
        const std::string color = ColorOf(center.mHarmCenter, Shade_Chord);
        for (const CShownChord& chord : center.mChords) Draw(chord, color);
    }

    void Draw(const CShownChord& chord, const std::string& color) {
        DrawChord(mSvg, mAxis, mPlaces, chord.mRange,
                  {kChordTop,
                   color,
                   chord.mSymbol,
                   FunctionOf(chord),
                   {.mSize = kFunctionSize, .mColor = kFaintInk}});
        DrawGridOf(chord);
    }

    void DrawGridOf(const CShownChord& chord) {
        if (mGrids == nullptr) return;
        const auto grid = mGrids->find(chord.mSymbol);
        const auto segments = mAxis.SegmentsOf(chord.mRange);
        if (grid == mGrids->end() || segments.empty()) return;
        const double x = kMargin + segments[0].mLeft + kPadding + kGridLeft;
        const double top = mPlaces.mTops[segments[0].mLine];
        DrawGrid(mSvg, grid->second, x, top + kGridTop, kGridScale, mGridStyle);
        if (grid->second.mCapo == 0) return;
        mSvg.Text(x, top + kShapeTop,
                  fmt::format("capo {}: {}", grid->second.mCapo, grid->second.mName),
                  {.mSize = kShapeSize, .mColor = kFaintInk});
    }

    void DrawReadings() {
        for (std::size_t i = 0; i < mSong.mReadings.size(); ++i) {
            const CShownCenter& reading = mSong.mReadings[i];
            const std::size_t lane = mLanes.LaneOf(i);
            if (lane >= kMostLanes) continue;
            Band(reading.mRange, ReadingsTop() + static_cast<double>(lane) * kReadingPitch,
                 kReadingHeight, ColorOf(reading.mHarmCenter, Shade_Reading),
                 fmt::format("{} {:.2f}", reading.mName, reading.mProbability),
                 {.mSize = kSmallSize, .mColor = kInk});
        }
    }

    void Band(const CTimeRange& range, double top, double height, const std::string& color,
              const std::string& label, const CSvgFont& font) {
        DrawBand(mSvg, mAxis, mPlaces, range, {top, height, color, label, font});
    }

    const CShownSong& mSong;
    const TChordGrids* mGrids;
    CGridStyle mGridStyle;
    CTimeAxis mAxis;
    CLanes mLanes;
    CSvg mSvg;
    CLinePlaces mPlaces{kMargin, {}};
    double mBottom = 0.0;
};

}  // namespace

std::string AnalysisSvg(const CShownSong& song, const TChordGrids* grids, const CGridStyle& style) {
    return CSongPicture(song, grids, style).File();
}

}  // namespace brindle
