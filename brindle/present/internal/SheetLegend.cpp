// SPDX-License-Identifier: MIT
#include "brindle/present/internal/SheetLegend.h"

#include "brindle/present/CSvg.h"
#include "brindle/present/internal/SheetShapes.h"
#include "brindle/present/internal/SheetStyle.h"

#include <fmt/format.h>

#include <algorithm>

namespace brindle::LeadSheet {
namespace {

constexpr double kLegendSize = 11.0;
constexpr double kSmallestLegendSize = 6.0;
constexpr double kLegendTextGap = 5.0;
constexpr double kLegendGap = 16.0;

// In em. The italics of the legend are narrower than the letters that are measured.
double LegendWidthOf(std::string_view text) {
    return 0.85 * WidthOf(text);
}

/// What the marks of a score are.
struct CMarkKinds {
    bool mHasArrow = false;
    bool mHasDottedArrow = false;
    bool mHasBracket = false;
    bool mHasDottedBracket = false;

    explicit CMarkKinds(const CSheetScore& score) {
        for (const CLineMarks& marks : score.mMarks) {
            for (const CLinkMark& arrow : marks.mArrows) {
                (arrow.mIsDotted ? mHasDottedArrow : mHasArrow) = true;
            }
            for (const CLinkMark& bracket : marks.mBrackets) {
                (bracket.mIsDotted ? mHasDottedBracket : mHasBracket) = true;
            }
        }
    }
};

/// The first key that a score has a color for; undefined for none.
CSignKeyLite FirstKeyOf(const CSheetScore& score) {
    for (const CLineMarks& marks : score.mMarks) {
        for (const CKeyMark& key : marks.mKeys) {
            if (!key.mKey.mRootKeyEnh.IsUndef()) return key.mKey;
        }
    }
    return CSignKeyLite_Undef;
}

enum class TSample { Arrow, Bracket, Color };

/// A sample of a mark and what it means, somewhere in the legend.
struct CLegendEntry {
    TSample mSample = TSample::Arrow;
    bool mIsDotted = false;
    std::string_view mText;
    double mX = 0.0;
    std::size_t mLine = 0;
    double mSize = kLegendSize;

    [[nodiscard]] double SampleWidth() const {
        return mSample == TSample::Arrow ? 26.0 : mSample == TSample::Bracket ? 24.0 : 14.0;
    }
    [[nodiscard]] double TextLeft() const { return SampleWidth() + kLegendTextGap; }
    [[nodiscard]] double Width() const { return TextLeft() + mSize * LegendWidthOf(mText); }
};

std::vector<CLegendEntry> LegendEntries(const CSheetScore& score) {
    const CMarkKinds kinds(score);
    std::vector<CLegendEntry> entries;
    const auto add = [&](bool isUsed, TSample sample, bool isDotted, std::string_view text) {
        if (isUsed) entries.push_back({sample, isDotted, text});
    };
    add(kinds.mHasArrow, TSample::Arrow, false, "a dominant resolves");
    add(kinds.mHasDottedArrow, TSample::Arrow, true, "a substitute resolves");
    add(kinds.mHasBracket, TSample::Bracket, false, "ii and V");
    add(kinds.mHasDottedBracket, TSample::Bracket, true, "ii and a substitute for V");
    const bool hasKey = !FirstKeyOf(score).mRootKeyEnh.IsUndef();
    add(hasKey, TSample::Color, false, "color of the key");
    return entries;
}

/// Sets the entries beside each other on as many lines as they need; one that is wider than a line
/// is set smaller.
std::vector<CLegendEntry> PlacedLegend(const CSheetScore& score, double width) {
    std::vector<CLegendEntry> entries = LegendEntries(score);
    double x = 0.0;
    std::size_t line = 0;
    for (CLegendEntry& entry : entries) {
        const double most = (width - entry.TextLeft()) / LegendWidthOf(entry.mText);
        entry.mSize = std::clamp(most, kSmallestLegendSize, kLegendSize);
        if (x > 0.0 && x + entry.Width() > width) {
            x = 0.0;
            ++line;
        }
        entry.mX = x;
        entry.mLine = line;
        x += entry.Width() + kLegendGap;
    }
    return entries;
}

void DrawSample(CSheetPen& pen, const CSheetScore& score, const CLegendEntry& entry, double x,
                double y) {
    if (entry.mSample == TSample::Arrow) {
        CLinkMark mark;
        mark.mIsDotted = entry.mIsDotted;
        DrawArrow(pen, x, x + 24, y, 12, mark);
    } else if (entry.mSample == TSample::Bracket) {
        pen.Path(fmt::format("M{} {}v5h24v-5", SvgNumber(x), SvgNumber(y - 6)),
                 entry.mIsDotted ? "dot" : "arc");
    } else {
        pen.Rect(x, y - 8, 14, 9, BandStyle(FirstKeyOf(score)));
    }
}

}  // namespace

std::size_t LegendLines(const CSheetScore& score, double width) {
    const std::vector<CLegendEntry> entries = PlacedLegend(score, width);
    return entries.empty() ? 0 : entries.back().mLine + 1;
}

void DrawLegend(CSheetPen& pen, const CSheetScore& score, double x, double y, double width) {
    for (const CLegendEntry& entry : PlacedLegend(score, width)) {
        const double left = x + entry.mX;
        const double bottom = y + static_cast<double>(entry.mLine) * kLegendLineHeight;
        DrawSample(pen, score, entry, left, bottom);
        pen.Text(left + entry.TextLeft(), bottom, entry.mSize, entry.mText, "ita quiet");
    }
}

}  // namespace brindle::LeadSheet
