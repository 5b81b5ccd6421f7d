// SPDX-License-Identifier: MIT
#include "brindle/present/LeadSheetSvg.h"

#include "brindle/present/CSvg.h"
#include "brindle/present/ShownText.h"
#include "brindle/present/internal/ReadingNotes.h"
#include "brindle/present/internal/SheetDrawing.h"
#include "brindle/present/internal/SheetLegend.h"
#include "brindle/present/internal/SheetStyle.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <iterator>
#include <string>
#include <vector>

namespace brindle {
namespace {

using namespace LeadSheet;

// A4 at 96 dots an inch.
constexpr double kA4Width = 793.7;
constexpr double kA4Height = 1122.52;

constexpr double kLeft = 44.0;
constexpr double kRight = 30.0;
constexpr double kTop = 26.0;
constexpr double kFooter = 34.0;
// Of the margins of a printed page.
constexpr double kPrintMargin = 18.0;

constexpr double kSheetTitleSize = 25.0;
constexpr double kSmallestTitleSize = 16.0;
constexpr double kMakersSize = 13.0;
constexpr double kKeyNoteSize = 12.0;

// A bar that is narrower is hard to read.
constexpr double kNarrowestUsualBar = 105.0;

// Chords that are read out.
constexpr std::size_t kMostToldChords = 64;

std::size_t BarsPerLine(const CLeadSheetOptions& options, double width) {
    auto bars = static_cast<std::size_t>(std::clamp(options.mBarsPerLine, 1, 16));
    while (bars > 1 && width / static_cast<double>(bars) < kNarrowestUsualBar && bars > 1) {
        bars = (bars + 1) / 2;
    }
    return bars;
}

std::vector<CSignKeyLite> KeysOf(const CSongReading& reading) {
    std::vector<CSignKeyLite> keys;
    for (const CChordReading& chord : reading.mChords) {
        const bool isKnown = std::any_of(keys.begin(), keys.end(), [&](const CSignKeyLite& key) {
            return BandStyle(key) == BandStyle(chord.mKey);
        });
        if (!isKnown && !chord.mKey.mRootKeyEnh.IsUndef()) keys.push_back(chord.mKey);
    }
    return keys;
}

/// Lays a song out on pages of one size.
class CSheetPages {
public:
    CSheetPages(const CSong& song, const CSongReading& reading, const CLeadSheetOptions& options,
                double scale)
        : mSong(song),
          mKeyNotes(KeyContradictions(song, reading)),
          mIsA4(options.mPage == TSheetPage_A4) {
        const double asked = std::isfinite(options.mWidth) ? options.mWidth : 800.0;
        mWidth = mIsA4 ? kA4Width / scale : std::clamp(asked, 200.0, 4000.0);
        mLeft = kLeft + (mIsA4 ? kPrintMargin : 0.0);
        mRight = kRight + (mIsA4 ? kPrintMargin : 0.0);
        mScore.mSheet = MakeSheet(song);
        mScore.mTexts = MakeChordTexts(song, reading);
        mScore.mLines = BreakLines(mScore.mSheet, mScore.mTexts, InnerWidth(),
                                   BarsPerLine(options, InnerWidth()));
        mScore.mMarks = MakeMarks(mScore.mLines, mScore.mTexts, reading,
                                  MakeLinks(song, reading, mScore.mSheet));
        const std::size_t lines = LegendLines(mScore, LegendWidth());
        if (lines > 1) mLegendRoom = kLegendLineHeight * static_cast<double>(lines - 1);
        mHeight = mIsA4 ? kA4Height / scale : 0.0;
        Fill();
    }

    [[nodiscard]] std::size_t Count() const { return mPages.size(); }
    [[nodiscard]] double Width() const { return mWidth; }
    [[nodiscard]] double Height() const { return mHeight; }
    [[nodiscard]] bool IsA4() const { return mIsA4; }

    /// The shapes of a page.
    [[nodiscard]] std::string Draw(std::size_t index) const {
        CSheetPen pen;
        pen.Rect(0, 0, mWidth, mHeight, "paper");
        if (index == 0) DrawHead(pen);
        double y = index == 0 ? Top() + HeadHeight() : Top();
        for (std::size_t i = mPages[index]; i < EndOf(index); ++i) {
            LeadSheet::DrawLine(pen, mScore, i, mLeft, y);
            y += HeightOf(mScore, i);
        }
        DrawFooter(pen, index);
        return pen.Body();
    }

private:
    [[nodiscard]] double InnerWidth() const { return mWidth - mLeft - mRight; }
    [[nodiscard]] double Top() const { return kTop + (mIsA4 ? kPrintMargin : 0.0); }
    [[nodiscard]] double Bottom() const {
        return kFooter + mLegendRoom + (mIsA4 ? kPrintMargin : 0.0);
    }
    // The number of the page stands beside it.
    [[nodiscard]] double LegendWidth() const { return InnerWidth() - (mIsA4 ? 40.0 : 0.0); }

    [[nodiscard]] bool HasSubtitle() const { return !mSong.mMakers.empty() || !Style().empty(); }

    [[nodiscard]] double HeadHeight() const {
        double height = 0.0;
        if (!mSong.mTitle.empty()) height += kSheetTitleSize + 8;
        if (HasSubtitle()) height += kMakersSize + 4;
        height += static_cast<double>(mKeyNotes.size()) * (kKeyNoteSize + 4);
        return height > 0.0 ? height + 6 : 0.0;
    }

    [[nodiscard]] std::string Style() const {
        std::string style = mSong.mStyle;
        if (mSong.mTempo && std::isfinite(*mSong.mTempo) && *mSong.mTempo > 0.0) {
            if (!style.empty()) style += ", ";
            style += fmt::format("\xE2\x99\xA9 = {}", ShortNumber(*mSong.mTempo));
        }
        return style;
    }

    // The first line of each page, and the height of an endless one.
    void Fill() {
        mPages.push_back(0);
        double y = Top() + HeadHeight();
        for (std::size_t i = 0; i < mScore.mLines.mLines.size(); ++i) {
            const double height = HeightOf(mScore, i);
            if (mIsA4 && y + height > mHeight - Bottom() && i > mPages.back()) {
                mPages.push_back(i);
                y = Top();
            }
            y += height;
        }
        if (mScore.mLines.mLines.empty()) y += 40.0;
        if (!mIsA4) mHeight = std::ceil(y + Bottom());
    }

    [[nodiscard]] std::size_t EndOf(std::size_t page) const {
        return page + 1 < mPages.size() ? mPages[page + 1] : mScore.mLines.mLines.size();
    }

    void DrawHead(CSheetPen& pen) const {
        double y = Top();
        if (!mSong.mTitle.empty()) {
            const double fitting = InnerWidth() / std::max(1.0, WidthOf(mSong.mTitle));
            const double size = std::clamp(fitting, kSmallestTitleSize, kSheetTitleSize);
            pen.Text(mWidth / 2, y + kSheetTitleSize - 4, size,
                     CutToWidth(mSong.mTitle, InnerWidth() / size), "ttl ink", "middle");
            y += kSheetTitleSize + 8;
        }
        const bool sharesLine = !Style().empty() && !mSong.mMakers.empty();
        const double half = InnerWidth() / kMakersSize / (sharesLine ? 2.0 : 1.0) - 1.0;
        if (!Style().empty()) {
            pen.Text(mLeft, y + kMakersSize - 2, kMakersSize, CutToWidth(Style(), half), "ita ink");
        }
        if (!mSong.mMakers.empty()) {
            pen.Text(mWidth - mRight, y + kMakersSize - 2, kMakersSize,
                     CutToWidth(mSong.mMakers, half), "ita ink", "end");
        }
        if (HasSubtitle()) y += kMakersSize + 4;
        for (const std::string& note : mKeyNotes) {
            pen.Text(mLeft, y + kKeyNoteSize - 2, kKeyNoteSize,
                     CutToWidth(note, InnerWidth() / kKeyNoteSize), "ita quiet");
            y += kKeyNoteSize + 4;
        }
        if (mScore.mLines.mLines.empty()) {
            pen.Text(mWidth / 2, Top() + HeadHeight() + 24, kMakersSize, "no chords", "ita quiet",
                     "middle");
        }
    }

    void DrawFooter(CSheetPen& pen, std::size_t page) const {
        const double y = mHeight - Bottom() + 20;
        if (page + 1 == Count()) {
            LeadSheet::DrawLegend(pen, mScore, mLeft, y, LegendWidth());
        }
        if (Count() > 1) {
            pen.Text(mWidth - mRight, y, kMakersSize, fmt::format("{} / {}", page + 1, Count()),
                     "num quiet", "end");
        }
    }

    const CSong& mSong;
    std::vector<std::string> mKeyNotes;
    bool mIsA4;
    double mWidth = 0.0;
    double mHeight = 0.0;
    double mLeft = 0.0;
    double mRight = 0.0;
    double mLegendRoom = 0.0;  // of its lines behind the first
    CSheetScore mScore;
    std::vector<std::size_t> mPages;
};

// A song that fits one page or two only if it is set smaller is set smaller.
CSheetPages LayOut(const CSong& song, const CSongReading& reading,
                   const CLeadSheetOptions& options) {
    CSheetPages pages(song, reading, options, 1.0);
    // A little smaller for one page, more so for two; nothing makes two pages of seven.
    if (pages.Count() == 1 || pages.Count() > 6) return pages;
    const std::size_t most = pages.Count() == 2 ? 1 : 2;
    for (const double scale : {0.875, 0.75, 0.65}) {
        CSheetPages smaller(song, reading, options, scale);
        if (smaller.Count() <= most) return smaller;
        if (most == 1) break;
    }
    return pages;
}

// What is read out is no longer than what a reader sees.
std::string Bounded(const std::string& text) {
    constexpr std::size_t kMostCharacters = 160;
    return FirstCharacters(text, kMostCharacters);
}

std::string TitleElement(const CSong& song) {
    const std::string title = song.mTitle.empty() ? "Lead sheet" : Bounded(song.mTitle);
    return "<title>" + XmlEscaped(Printable(title)) + "</title>\n";
}

std::string Description(const CSong& song, const CSongReading& reading) {
    std::string text = "Lead sheet";
    if (!song.mMakers.empty()) text += " of a song by " + Bounded(song.mMakers);
    const std::string key = NameOfKey(reading.mKey);
    if (!key.empty()) text += " in " + key;
    // Without the full stop at their end.
    for (const std::string& note : KeyContradictions(song, reading)) {
        text += ". " + note.substr(0, note.size() - 1);
    }
    const std::size_t count = CountChords(song);
    if (count > 0) text += ". Chords:";
    for (std::size_t i = 0; i < std::min({count, kMostToldChords, song.mSymbols.size()}); ++i) {
        text += " " + FirstCharacters(song.mSymbols[i], 24);
    }
    if (count > kMostToldChords) text += " \xE2\x80\xA6";
    return "<desc>" + XmlEscaped(Printable(text)) + "</desc>\n";
}

// The begin of a file with `pages` pages below each other.
std::string Head(const CSheetPages& pages, std::size_t count) {
    const auto number = static_cast<double>(count);
    const std::string size = pages.IsA4()
                                 ? fmt::format("width=\"210mm\" height=\"{}mm\"", 297 * count)
                                 : fmt::format("width=\"{}\" height=\"{}\"",
                                               SvgNumber(pages.Width()), SvgNumber(pages.Height()));
    return fmt::format(
        "<svg xmlns=\"http://www.w3.org/2000/svg\" role=\"img\" {} "
        "viewBox=\"0 0 {} {}\">\n",
        size, SvgNumber(pages.Width()), SvgNumber(pages.Height() * number));
}

std::string Preamble(const CSong& song, const CSongReading& reading,
                     const CLeadSheetOptions& options) {
    return TitleElement(song) + Description(song, reading) +
           StyleElement(KeysOf(reading), options.mTheme);
}

}  // namespace

std::string LeadSheetSvg(const CSong& song, const CSongReading& reading,
                         const CLeadSheetOptions& options) {
    const CSheetPages pages = LayOut(song, reading, options);
    std::string svg = Head(pages, pages.Count()) + Preamble(song, reading, options);
    for (std::size_t i = 0; i < pages.Count(); ++i) {
        if (pages.Count() == 1) {
            svg += pages.Draw(i);
            continue;
        }
        svg += fmt::format("<svg id=\"page-{}\" y=\"{}\" width=\"{}\" height=\"{}\">\n{}</svg>\n",
                           i + 1, SvgNumber(static_cast<double>(i) * pages.Height()),
                           SvgNumber(pages.Width()), SvgNumber(pages.Height()), pages.Draw(i));
    }
    return svg + "</svg>\n";
}

std::vector<std::string> LeadSheetPages(const CSong& song, const CSongReading& reading,
                                        const CLeadSheetOptions& options) {
    const CSheetPages pages = LayOut(song, reading, options);
    std::vector<std::string> files;
    for (std::size_t i = 0; i < pages.Count(); ++i) {
        files.push_back(Head(pages, 1) + Preamble(song, reading, options) + pages.Draw(i) +
                        "</svg>\n");
    }
    return files;
}

}  // namespace brindle
