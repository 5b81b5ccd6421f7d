// SPDX-License-Identifier: MIT
// A song as a picture. Time runs from left to right and breaks into lines as text does. Each line
// has, from above: the numbers of the bars, a band for the sign key, a band for the center, the
// chords in boxes with their function or else their degree under them, and thin bands for the
// repeated passages and for the readings. A score has its title above, and its times and rehearsal
// marks beside the numbers of the bars. The color of a band is that of its key: neighbours on the
// circle of fifths have neighbouring colors, and minor keys are darker.

#include "cli/Analysis.h"
#include "cli/AnalysisSvg_Copies.h"
#include "cli/Names.h"
#include "cli/Svg.h"
#include "cli/TimeAxis.h"

#include <fmt/format.h>

#include <algorithm>

namespace brindle::cli {
namespace {

constexpr double kMargin = 20.0;
constexpr double kLineWidth = 960.0;

// From above: what a line of the song is made of.
constexpr double kBarNumberTop = 0.0;
constexpr double kSignKeyTop = 18.0;
constexpr double kCenterTop = 38.0;
constexpr double kChordTop = 60.0;
constexpr double kFunctionTop = 96.0;
constexpr double kReadingsTop = 116.0;
constexpr double kReadingPitch = 16.0;
constexpr double kLineGap = 24.0;

constexpr double kBandHeight = 18.0;
constexpr double kChordHeight = 34.0;
constexpr double kReadingHeight = 14.0;

constexpr double kTitleHeight = 30.0;
constexpr double kTitleSize = 18.0;
// Right of a bar line, behind the number of the bar.
constexpr double kSectionLeft = 22.0;
constexpr double kSectionSize = 8.0;
constexpr double kTimeLeft = 34.0;

constexpr double kSymbolSize = 14.0;
constexpr double kFunctionSize = 11.0;
constexpr double kLabelSize = 12.0;
constexpr double kSmallSize = 10.0;

constexpr double kNarrowestChord = 40.0;
constexpr double kPadding = 5.0;
constexpr double kGap = 1.0;

// More readings of one place than this are no help to the eye.
constexpr std::size_t kMostLanes = 8;

constexpr std::string_view kInk = "#222222";
constexpr std::string_view kFaintInk = "#666666";
constexpr std::string_view kBarLine = "#c8c8c8";
constexpr std::string_view kNoKey = "#ececec";

/// How strongly a band shows the color of its key: lightness in percent.
enum TShade : int { Shade_Center = 68, Shade_SignKey = 82, Shade_Reading = 82, Shade_Chord = 93 };

std::string ColorOf(const CKeyEnh& root, bool isMinor, TShade shade) {
    if (root.IsUndef()) return std::string(kNoKey);
    const int placeOnCircleOfFifths = root.mKeyNr * 7 % 12;
    return HslColor((placeOnCircleOfFifths * 30 + 50) % 360, 65,
                    static_cast<int>(shade) - (isMinor ? 7 : 0));
}

std::string ColorOf(const CHarmCenterLite& center, TShade shade) {
    const bool isMinor = center.mSemitones.HasIntvl(3) && !center.mSemitones.HasIntvl(4);
    return ColorOf(center.mRootKeyEnh, isMinor, shade);
}

std::string FunctionOf(const TShownChord& chord) {
    std::string function = chord.mNumeral;
    if (function.empty()) function = DegreeName(chord.mRootDist);
    if (chord.mBassDist >= 0) function += fmt::format("/{}", DegreeName(chord.mBassDist));
    return function;
}

double WidestChord(const TSong& song) {
    double widest = kNarrowestChord;
    ForEachChord(song, [&](const TShownChord& chord) {
        const double symbol = TextWidth(chord.mSymbol, kSymbolSize);
        const double function = TextWidth(FunctionOf(chord), kFunctionSize);
        widest = std::max({widest, symbol + 2 * kPadding, function + 2 * kPadding});
    });
    // A monster among the symbols does not stretch the whole picture.
    return std::min(widest, kLineWidth / 4);
}

/// Spreads the readings over lanes so that none covers another.
class CLanes {
public:
    /// `readings` are sorted by their begin.
    explicit CLanes(const std::vector<TShownCenter>& readings) {
        std::vector<double> laneEnds;
        for (const TShownCenter& reading : readings) {
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
    explicit CSongPicture(const TSong& song)
        : mSong(song), mAxis(song, kLineWidth, WidestChord(song)), mLanes(song.mReadings) {
        PlaceLines();
        if (song.mEnd <= 0.0) {
            mSvg.Text(kMargin + kPadding, kMargin + kChordTop, "no chords",
                      {.mSize = kSymbolSize, .mColor = kFaintInk});
            return;
        }
        DrawBars();
        DrawScore();
        DrawSignKeys();
        for (const TShownSignKey& signKey : song.mSignKeys) {
            for (const TShownCenter& center : signKey.mCenters) Draw(center);
        }
        for (const TShownChord& chord : song.mLooseChords) Draw(chord, std::string(kNoKey));
        DrawCopies(mSvg, mAxis, {kMargin, mTops, kReadingsTop, kReadingHeight}, song);
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
        return svg.File(kLineWidth + 2 * kMargin, height, Title());
    }

private:
    [[nodiscard]] std::string Title() const {
        std::string title = mSong.mScore.mTitle.empty() ? "Harmony" : mSong.mScore.mTitle;
        for (const TShownSignKey& signKey : mSong.mSignKeys) title += ", " + signKey.mName;
        return title;
    }

    // The repeated passages have a band above the readings.
    [[nodiscard]] double ReadingsTop() const {
        return kReadingsTop + (mSong.mCopies.empty() ? 0.0 : kReadingPitch);
    }

    // Each line is as high as the readings on it need.
    void PlaceLines() {
        std::vector<std::size_t> lanes(mAxis.LineCount(), 0);
        for (std::size_t i = 0; i < mSong.mReadings.size(); ++i) {
            if (mLanes.LaneOf(i) >= kMostLanes) continue;
            for (const TSegment& segment : mAxis.SegmentsOf(mSong.mReadings[i].mRange)) {
                lanes[segment.mLine] = std::max(lanes[segment.mLine], mLanes.LaneOf(i) + 1);
            }
        }
        mBottom = mSong.mScore.mTitle.empty() ? kMargin : kMargin + kTitleHeight;
        for (const std::size_t count : lanes) {
            mTops.push_back(mBottom);
            mBottom += ReadingsTop() + static_cast<double>(count) * kReadingPitch + kLineGap;
        }
        mBottom -= kLineGap;
    }

    void DrawBars() {
        for (std::size_t line = 0; line < mAxis.LineCount(); ++line) {
            const double top = mTops[line];
            for (const auto& [barX, bar] : mAxis.BarLines(line)) {
                const double x = kMargin + barX;
                mSvg.Line(x, top + kBarNumberTop + 4, x, top + kFunctionTop, kBarLine);
                mSvg.Text(x + 3, top + kBarNumberTop + 13, fmt::format("{}", bar),
                          {.mSize = kSmallSize, .mColor = kFaintInk});
            }
            const double right = kMargin + mAxis.Line(line).mRight;
            mSvg.Line(right, top + kBarNumberTop + 4, right, top + kFunctionTop, kBarLine);
        }
    }

    // The title above all, and beside the numbers of the bars the times and the rehearsal marks.
    void DrawScore() {
        const TShownScore& score = mSong.mScore;
        if (!score.mTitle.empty()) {
            mSvg.TextCut(kMargin, kMargin + kTitleSize, kLineWidth, score.mTitle,
                         {.mSize = kTitleSize, .mColor = kInk, .mBold = true});
        }
        for (const TShownScore::TTime& time : score.mTimes) {
            DrawMark(time.mPosition, [&](double x, double top) {
                mSvg.Text(x + kTimeLeft, top + kBarNumberTop + 13, time.mName,
                          {.mSize = kSmallSize, .mColor = kInk, .mBold = true});
            });
        }
        for (const double section : score.mSections) {
            DrawMark(section, [&](double x, double top) {
                mSvg.Rect(x + kSectionLeft, top + kBarNumberTop + 5, kSectionSize, kSectionSize,
                          kInk, "Rehearsal mark");
            });
        }
    }

    template <class TDraw>
    void DrawMark(double position, const TDraw& draw) {
        const auto segments = mAxis.SegmentsOf({position, mSong.mEnd});
        if (!segments.empty()) draw(kMargin + segments[0].mLeft, mTops[segments[0].mLine]);
    }

    void DrawSignKeys() {
        for (std::size_t i = 0; i < mSong.mSignKeys.size(); ++i) {
            const TShownSignKey& signKey = mSong.mSignKeys[i];
            const bool isLast = i + 1 == mSong.mSignKeys.size();
            const TRange range{signKey.mBegin, isLast ? mSong.mEnd : mSong.mSignKeys[i + 1].mBegin};
            const bool isMinor = signKey.mSignKey.mSignKeyType == TSignKeyType_Minor;
            Band(range, kSignKeyTop, kBandHeight,
                 ColorOf(signKey.mSignKey.mRootKeyEnh, isMinor, Shade_SignKey),
                 "Sign key " + signKey.mName, {.mSize = kLabelSize, .mColor = kFaintInk});
        }
    }

    void Draw(const TShownCenter& center) {
        Band(center.mRange, kCenterTop, kBandHeight, ColorOf(center.mHarmCenter, Shade_Center),
             center.mName, {.mSize = kLabelSize, .mColor = kInk, .mBold = true});
        const std::string color = ColorOf(center.mHarmCenter, Shade_Chord);
        for (const TShownChord& chord : center.mChords) Draw(chord, color);
    }

    void Draw(const TShownChord& chord, const std::string& color) {
        const std::vector<TSegment> segments = mAxis.SegmentsOf(chord.mRange);
        for (const TSegment& segment : segments) {
            mSvg.Rect(kMargin + segment.mLeft + kGap, mTops[segment.mLine] + kChordTop,
                      std::max(0.5, segment.Width() - 2 * kGap), kChordHeight, color,
                      chord.mSymbol);
        }
        if (segments.empty()) return;
        const TSegment& first = segments.front();
        const double x = kMargin + first.mLeft + kPadding;
        const double room = first.Width() - kPadding - kGap;
        const double top = mTops[first.mLine];
        mSvg.TextCut(x, top + kChordTop + 22, room, chord.mSymbol,
                     {.mSize = kSymbolSize, .mColor = kInk, .mBold = true});
        mSvg.TextCut(x, top + kFunctionTop + 11, room, FunctionOf(chord),
                     {.mSize = kFunctionSize, .mColor = kFaintInk});
    }

    void DrawReadings() {
        for (std::size_t i = 0; i < mSong.mReadings.size(); ++i) {
            const TShownCenter& reading = mSong.mReadings[i];
            const std::size_t lane = mLanes.LaneOf(i);
            if (lane >= kMostLanes) continue;
            Band(reading.mRange, ReadingsTop() + static_cast<double>(lane) * kReadingPitch,
                 kReadingHeight, ColorOf(reading.mHarmCenter, Shade_Reading),
                 fmt::format("{} {:.2f}", reading.mName, reading.mProbability),
                 {.mSize = kSmallSize, .mColor = kInk});
        }
    }

    // A band over all lines that the range touches, with its label on each.
    void Band(const TRange& range, double top, double height, const std::string& color,
              const std::string& label, const TSvgFont& font) {
        for (const TSegment& segment : mAxis.SegmentsOf(range)) {
            const double x = kMargin + segment.mLeft + kGap;
            const double y = mTops[segment.mLine] + top;
            mSvg.Rect(x, y, std::max(0.5, segment.Width() - 2 * kGap), height, color, label);
            mSvg.TextCut(x + kPadding, y + height / 2 + font.mSize * 0.36,
                         segment.Width() - kPadding, label, font);
        }
    }

    const TSong& mSong;
    CTimeAxis mAxis;
    CLanes mLanes;
    CSvg mSvg;
    std::vector<double> mTops;  // of each line
    double mBottom = 0.0;
};

}  // namespace

std::string AnalysisSvg(const TSong& song) {
    return CSongPicture(song).File();
}

}  // namespace brindle::cli
