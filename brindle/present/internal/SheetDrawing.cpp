// SPDX-License-Identifier: MIT
#include "brindle/present/internal/SheetDrawing.h"

#include "brindle/present/CSvg.h"
#include "brindle/present/internal/SheetShapes.h"
#include "brindle/present/internal/SheetStyle.h"

#include <fmt/format.h>

#include <algorithm>

namespace brindle::LeadSheet {
namespace {

// A line from above: the brackets of endings, the names of sections and keys, arrows, the band with
// the chords, brackets.
constexpr double kEndingHeight = 15.0;
constexpr double kHeadHeight = 18.0;
constexpr double kArrowHeight = 13.0;
constexpr double kLevelHeight = 5.5;
constexpr double kBracketHeight = 9.0;
constexpr double kLineGap = 9.5;

constexpr double kBandPadding = 6.0;
constexpr double kSymbolRise = 18.0;   // from the padding to the base line of the symbols
constexpr double kNumeralDrop = 19.0;  // to that of the numerals

constexpr double kSectionSize = 12.0;
constexpr double kKeyNameSize = 11.5;
constexpr double kRemarkSize = 11.0;
constexpr double kNumberSize = 9.5;
constexpr double kHeadGap = 8.0;

bool HasHeads(const CSheetBar& bar) {
    return bar.mBeginsSection || !bar.mRemark.empty() || bar.mTimes > 2 ||
           bar.mSign != TSongSign_None || !bar.mWords.empty();
}

// Behind "To Coda" the music goes on.
bool EndsPart(const CSheetBar& bar) {
    return bar.mWords.find("D.") != std::string::npos || bar.mWords == "Fine";
}

/// The heights of the parts of a line.
struct CHeights {
    double mEndings = 0.0;
    double mHeads = 0.0;
    double mArrows = 0.0;
    double mBand = 0.0;
    double mBrackets = 0.0;

    CHeights(const CSheetScore& score, std::size_t index) {
        const CLineMarks& marks = score.mMarks[index];
        for (const CKeyMark& key : marks.mKeys) {
            if (key.mIsNew) mHeads = kHeadHeight;
        }
        for (const CPlacedBar& placed : score.mLines.mLines[index].mBars) {
            const CSheetBar& bar = score.mSheet.mBars[placed.mBar];
            if (bar.mIsInEnding) mEndings = kEndingHeight;
            if (HasHeads(bar)) mHeads = kHeadHeight;
        }
        const std::size_t levels = marks.Levels();
        if (levels > 0) mArrows = kArrowHeight + kLevelHeight * static_cast<double>(levels - 1);
        if (!marks.mBrackets.empty()) mBrackets = kBracketHeight;
        mBand = 2 * kBandPadding + score.mLines.mScale * (kSymbolRise + kNumeralDrop);
    }

    [[nodiscard]] double BandTop() const { return mEndings + mHeads + mArrows; }
    [[nodiscard]] double BandEnd() const { return BandTop() + mBand; }
};

class CLineDrawing {
public:
    CLineDrawing(CSheetPen& pen, const CSheetScore& score, std::size_t index, double x, double y)
        : mPen(pen),
          mScore(score),
          mLine(score.mLines.mLines[index]),
          mMarks(score.mMarks[index]),
          mHeights(score, index),
          mX(x),
          mY(y),
          mTop(y + mHeights.BandTop()),
          mBottom(y + mHeights.BandEnd()) {}

    void Draw() {
        for (const CKeyMark& key : mMarks.mKeys) {
            if (key.mKey.mRootKeyEnh.IsUndef()) continue;
            mPen.Rect(mX + key.mBegin, mTop, key.mEnd - key.mBegin, mBottom - mTop,
                      BandStyle(key.mKey));
        }
        DrawNumber();
        for (const CPlacedBar& bar : mLine.mBars) DrawBar(bar);
        DrawHeads();
        for (const CLinkMark& arrow : mMarks.mArrows) DrawLink(arrow);
        for (const CLinkMark& bracket : mMarks.mBrackets) DrawBracket(bracket);
    }

private:
    [[nodiscard]] const CSheetBar& BarOf(const CPlacedBar& placed) const {
        return mScore.mSheet.mBars[placed.mBar];
    }
    [[nodiscard]] double Middle() const { return (mTop + mBottom) / 2; }
    [[nodiscard]] double Scale() const { return mScore.mLines.mScale; }

    void DrawNumber() {
        const CPlacedBar& first = mLine.mBars.front();
        const CSheetBar& bar = BarOf(first);
        if (!first.mIsBegin || bar.mIsUpbeat) return;
        mPen.Text(mX - 7, mTop + kNumberSize, kNumberSize, CutToWidth(bar.mNumber, 3.0),
                  "ita quiet", "end");
    }

    void DrawBar(const CPlacedBar& placed) {
        const CSheetBar& bar = BarOf(placed);
        if (placed.mIsBegin) DrawBegin(placed);
        if (placed.mIsEnd) DrawEnd(placed);
        if (bar.mIsInEnding) DrawEnding(placed);
        if (!bar.mTime.IsUndef() && placed.mIsBegin) DrawTime(placed);
        for (const CPlacedChord& chord : placed.mChords) DrawChord(chord);
        if (placed.mChords.empty()) DrawEmpty(placed);
    }

    void BarLine(double x, std::string_view style = "bar") {
        mPen.Line(mX + x, mTop, mX + x, mBottom, style);
    }

    void DrawBegin(const CPlacedBar& placed) {
        const CSheetBar& bar = BarOf(placed);
        const bool isFirst = placed.mX == 0.0;
        if (bar.mBeginsRepeat) {
            BarLine(placed.mX + 1.7, "thick");
            BarLine(placed.mX + 5.6);
            DrawDots(placed.mX + 9.8);
        } else if (isFirst) {
            BarLine(placed.mX);
        }
    }

    void DrawEnd(const CPlacedBar& placed) {
        const CSheetBar& bar = BarOf(placed);
        const double x = placed.End();
        const bool isLast = placed.mBar + 1 == mScore.mSheet.mBars.size();
        const bool isDouble =
            !isLast && (EndsPart(bar) || mScore.mSheet.mBars[placed.mBar + 1].mBeginsSection);
        if (bar.mEndsRepeat || isLast) {
            BarLine(x - 1.7, "thick");
            BarLine(x - 5.6);
            if (bar.mEndsRepeat) DrawDots(x - 9.8);
            return;
        }
        BarLine(x);
        if (isDouble) BarLine(x - 3.0);
    }

    void DrawDots(double x) {
        mPen.Dot(mX + x, Middle() - 5, 1.8, "ink");
        mPen.Dot(mX + x, Middle() + 5, 1.8, "ink");
    }

    void DrawEnding(const CPlacedBar& placed) {
        const CSheetBar& bar = BarOf(placed);
        const double y = mY + 2.5;
        const double end = mX + placed.End() - (bar.mClosesEnding ? 2.0 : 0.0);
        const double begin = mX + placed.mX + (bar.mEnding.empty() ? 0.0 : 2.0);
        mPen.Line(begin, y, end, y, "bar");
        if (bar.mClosesEnding && placed.mIsEnd) mPen.Line(end, y, end, y + 9, "bar");
        if (bar.mEnding.empty() || !placed.mIsBegin) return;
        mPen.Line(begin, y, begin, y + 9, "bar");
        mPen.Text(begin + 5, y + 10.5, kRemarkSize,
                  CutToWidth(bar.mEnding, (placed.mWidth - 8) / kRemarkSize), "num ink");
    }

    void DrawTime(const CPlacedBar& placed) {
        const CSheetBar& bar = BarOf(placed);
        constexpr double kSize = 19.0;
        const double x =
            mX + placed.mX + (bar.mBeginsRepeat ? kRepeatWidth : 0.0) + kTimeWidth / 2 + 3;
        const auto draw = [&](int number, double y) {
            const std::string text = fmt::format("{}", number);
            const double size = std::min(kSize, kTimeWidth / WidthOf(text) * 1.1);
            mPen.Text(x, y, size, text, "ttl ink", "middle");
        };
        draw(bar.mTime.mNumerator, Middle() - 1.5);
        draw(bar.mTime.mDenominator, Middle() + kSize * 0.7);
    }

    void DrawChord(const CPlacedChord& chord) {
        const CChordTexts& texts = mScore.mTexts[chord.mChord];
        const double baseLine = mTop + kBandPadding + Scale() * kSymbolRise;
        mPen.Runs(mX + chord.mX, baseLine, Scale() * kSheetSymbolSize, texts.mSymbol, "sym ink");
        if (texts.mNumeral.empty()) return;
        mPen.Runs(mX + chord.mX, baseLine + Scale() * kNumeralDrop, Scale() * kNumeralSize,
                  texts.mNumeral, "num ink");
    }

    void DrawEmpty(const CPlacedBar& placed) {
        const CSheetBar& bar = BarOf(placed);
        const double left = mX + placed.mX + LeftPadding(bar);
        const double right = mX + placed.End() - RightPadding(bar);
        const double x = (left + right) / 2;
        if (bar.mBarCount > 1) return DrawLongRest(left, right, bar.mBarCount);
        const bool sounds = bar.mBegin > 0;
        if (!sounds) {
            mPen.Rect(x - 5, Middle() - 2.5, 10, 5, "quiet");
        } else if (IsSimple(placed.mBar)) {
            DrawSlash(mPen, x, Middle());
            mPen.Dot(x - 7, Middle() - 4.5, 1.7, "quiet");
            mPen.Dot(x + 7, Middle() + 4.5, 1.7, "quiet");
        } else {
            for (const double part : {0.125, 0.375, 0.625, 0.875}) {
                DrawSlash(mPen, left + part * (right - left), Middle());
            }
        }
    }

    // Whether the bar before holds one chord and nothing else, so that it can be told to go on.
    [[nodiscard]] bool IsSimple(std::size_t index) const {
        if (index == 0 || !mScore.mSheet.mBars[index].mEnding.empty()) return false;
        const CSheetBar& before = mScore.mSheet.mBars[index - 1];
        const std::size_t held = before.mHeld == kNone ? 0 : 1;
        return held + before.mEnd - before.mBegin <= 1 && before.mBarCount == 1;
    }

    void DrawLongRest(double left, double right, std::size_t count) {
        mPen.Line(left, Middle() + 5, right, Middle() + 5, "thick");
        for (const double x : {left, right}) mPen.Line(x, Middle() - 2, x, Middle() + 12, "bar");
        mPen.Text((left + right) / 2, Middle() - 3, kKeyNameSize + 3, fmt::format("{}", count),
                  "ttl ink", "middle");
    }

    // The names of sections and keys and the remarks, from the left; each moves aside for those
    // before it.
    void DrawHeads() {
        double free = 0.0;
        std::size_t key = 0;
        const auto drawKeys = [&](double end) {
            for (; key < mMarks.mKeys.size() && mMarks.mKeys[key].mBegin < end; ++key) {
                if (mMarks.mKeys[key].mIsNew) DrawKeyName(mMarks.mKeys[key], free);
            }
        };
        for (const CPlacedBar& placed : mLine.mBars) {
            const CSheetBar& bar = BarOf(placed);
            if (placed.mIsBegin && bar.mSign != TSongSign_None) DrawSign(placed, free);
            if (placed.mIsBegin && bar.mBeginsSection) DrawSection(placed, free);
            drawKeys(placed.End());
            if (placed.mIsBegin && !bar.mRemark.empty()) {
                DrawHead(placed.mX + 2, kRemarkSize, bar.mRemark, "ita quiet", free);
            }
            if (placed.mIsEnd && bar.mTimes > 2) {
                DrawAtEnd(placed, fmt::format("\xC3\x97{}", bar.mTimes), "ttl ink", free);
            }
            if (placed.mIsEnd && !bar.mWords.empty()) {
                DrawAtEnd(placed, bar.mWords, "ttl ita ink", free);
            }
        }
    }

    [[nodiscard]] double HeadLine() const { return mY + mHeights.mEndings + 12.0; }

    void DrawHead(double x, double size, const std::string& text, std::string_view style,
                  double& free) {
        x = std::max(x, free);
        const std::string cut = CutToWidth(text, (HeadEnd() - x) / size);
        if (x + size > HeadEnd()) return;
        mPen.Text(mX + x, HeadLine(), size, cut, style);
        free = x + size * WidthOf(cut) + kHeadGap;
    }

    void DrawAtEnd(const CPlacedBar& placed, const std::string& text, std::string_view style,
                   double& free) {
        // A little room, so that rounding does not cut the text.
        const double width = kSectionSize * (WidthOf(text) + 0.1);
        DrawHead(placed.End() - width, kSectionSize, text, style, free);
    }

    void DrawSign(const CPlacedBar& placed, double& free) {
        const double x = std::max(placed.mX + 1, free);
        if (BarOf(placed).mSign == TSongSign_Coda) {
            DrawCodaSign(mPen, mX + x + 7, HeadLine() - 4.5);
        } else {
            DrawSegnoSign(mPen, mX + x + 7, HeadLine() - 4.5);
        }
        free = x + 14 + kHeadGap;
    }

    // A short line may have names that are longer.
    [[nodiscard]] double HeadEnd() const { return std::max(mLine.Width(), 180.0); }

    void DrawSection(const CPlacedBar& placed, double& free) {
        const std::string& name = BarOf(placed).mSection;
        if (name.empty()) return;
        const double x = std::max(placed.mX, free);
        const std::string text = CutToWidth(name, (HeadEnd() - x - 8) / kSectionSize);
        const double width = kSectionSize * WidthOf(text) + 8;
        mPen.Rect(mX + x, HeadLine() - 11, width, 14.5, "thin box");
        mPen.Text(mX + x + width / 2, HeadLine(), kSectionSize, text, "sec ink", "middle");
        free = x + width + kHeadGap;
    }

    void DrawKeyName(const CKeyMark& key, double& free) {
        DrawHead(key.mBegin + 1, kKeyNameSize, NameOfKey(key.mKey), "sec " + NameStyle(key.mKey),
                 free);
    }

    void DrawLink(const CLinkMark& arrow) {
        const double base = mTop - 2;
        const double rise = 13.0 + kLevelHeight * 4 / 3 * static_cast<double>(arrow.mLevel);
        DrawArrow(mPen, mX + arrow.mBegin, mX + arrow.mEnd, base, rise, arrow);
    }

    void DrawBracket(const CLinkMark& bracket) {
        const double y = mBottom + 3;
        std::string path = fmt::format("M{} {}", SvgNumber(mX + bracket.mBegin),
                                       SvgNumber(bracket.mIsFromBefore ? y + 5 : y));
        if (!bracket.mIsFromBefore) path += "v5";
        path += fmt::format("H{}", SvgNumber(mX + bracket.mEnd));
        if (!bracket.mGoesOn) path += "v-5";
        mPen.Path(path, bracket.mIsDotted ? "dot" : "arc");
    }

    CSheetPen& mPen;
    const CSheetScore& mScore;
    const CSheetLine& mLine;
    const CLineMarks& mMarks;
    CHeights mHeights;
    double mX;
    double mY;
    double mTop;
    double mBottom;
};

}  // namespace

double HeightOf(const CSheetScore& score, std::size_t line) {
    const CHeights heights(score, line);
    return heights.BandEnd() + heights.mBrackets + kLineGap;
}

void DrawLine(CSheetPen& pen, const CSheetScore& score, std::size_t line, double x, double y) {
    CLineDrawing(pen, score, line, x, y).Draw();
}

}  // namespace brindle::LeadSheet
