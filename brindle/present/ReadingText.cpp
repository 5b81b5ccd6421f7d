// SPDX-License-Identifier: MIT
#include "brindle/present/ReadingText.h"

#include "brindle/present/CTable.h"
#include "brindle/present/ShownNames.h"
#include "brindle/present/ShownText.h"
#include "brindle/present/internal/ReadingBars.h"
#include "brindle/present/internal/ReadingLines.h"
#include "brindle/present/internal/ReadingNotes.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <utility>

namespace brindle {
namespace {

std::string KeyDetails(const CSong& song, const CSongReading& reading) {
    std::string text;
    const bool isStated = song.mStatedKey && *song.mStatedKey == reading.mKey;
    if (isStated) text += ", as stated";
    if (reading.mConfidence != kPosUndef) {
        text += fmt::format(", {} (confidence {:.2f})", ConfidenceInWords(reading.mConfidence),
                            reading.mConfidence);
    }
    return text;
}

/// Whether the source numbers its bars otherwise: with an upbeat as 0, or where bars are repeated.
bool AreCountedAnew(const CSong& song) {
    for (std::size_t ix = 0; ix < song.mBars.size(); ++ix) {
        const std::string& number = song.mBars[ix].mNumber;
        if (!number.empty() && number != fmt::format("{}", ix + 1)) return true;
    }
    return false;
}

/// "32 bars of 3/4"; the time only where all bars have one.
std::string BarsText(const CSong& song) {
    if (song.mBars.empty()) return {};
    std::string text = song.mBars.size() == 1 ? "1 bar" : fmt::format("{} bars", song.mBars.size());
    const CSongTime& time = song.mBars.front().mTime;
    const bool isOneTime = std::all_of(song.mBars.begin(), song.mBars.end(),
                                       [&](const CSongBar& bar) { return bar.mTime == time; });
    if (isOneTime && !time.IsUndef()) {
        text += fmt::format(" of {}/{}", time.mNumerator, time.mDenominator);
    }
    return AreCountedAnew(song) ? text + ", counted from 1 as they are played" : text;
}

std::string Head(const CSong& song, const CSongReading& reading, const CPaint& paint) {
    std::string text;
    if (!song.mTitle.empty()) text += paint.Strong(Printable(song.mTitle)) + '\n';
    if (!song.mMakers.empty()) text += paint.Faint(Printable(song.mMakers)) + '\n';
    const std::string bars = BarsText(song);
    if (!bars.empty()) text += paint.Faint(bars) + '\n';
    if (!text.empty()) text += '\n';
    if (reading.mKey.IsUndef()) return text + paint.Strong("No key: no chords") + '\n';
    text += paint.Strong("Key of the song " + KeyInWords(reading.mKey)) +
            paint.Faint(KeyDetails(song, reading)) + '\n';
    for (const std::string& line : KeyContradictions(song, reading)) text += line + '\n';
    return text;
}

/// Where a chord stands, as the first two cells of a line; the bar only where it begins.
class CPlaceCells {
public:
    explicit CPlaceCells(const CBars& bars) : mBars(bars) {}

    [[nodiscard]] std::string Bar(double position) {
        const long bar = mBars.BarOf(position);
        const bool isSame = bar == mBarBefore;
        mBarBefore = bar;
        return isSame ? "" : fmt::format("{}", bar);
    }
    [[nodiscard]] std::string Beat(double position) const {
        return ShortNumber(mBars.BeatOf(position));
    }

private:
    const CBars& mBars;
    long mBarBefore = 0;
};

std::string LongTable(const CSong& song, const CSongReading& reading, const CBars& bars,
                      const CPaint& paint) {
    CTable table(
        {" bar", " beat", "chord", "key", "numeral", "function", "relation", "resolves to"});
    CPlaceCells place(bars);
    for (std::size_t ix = 0; ix < ChordCountOf(song); ++ix) {
        const CChordReading& chord = reading.mChords[ix];
        const double position = song.mChords[ix].mPosition;
        const auto target = static_cast<std::size_t>(chord.mResolvesTo);
        const bool isLed = chord.mResolvesTo >= 0 && target < song.mSymbols.size();
        const bool isChord = !chord.mKey.IsUndef();
        table.AddRow(
            {place.Bar(position), place.Beat(position),
             ix < song.mSymbols.size() ? Printable(song.mSymbols[ix]) : "",
             isChord ? chord.mKey.NameShort(NamePrefs()) : "-",
             chord.mNumeral.empty() ? "-" : chord.mNumeral, std::string(NameOf(chord.mFunction)),
             chord.mRelation == TChordRelation_None ? "" : std::string(NameOf(chord.mRelation)),
             isLed ? Printable(song.mSymbols[target]) : ""});
    }
    return table.Text(paint);
}

void AppendParagraph(std::string& text, std::string_view head,
                     const std::vector<std::string>& lines, const CPaint& paint) {
    if (lines.empty()) return;
    text += '\n' + paint.Accent(head) + '\n';
    for (const std::string& line : lines) text += "  " + Printable(line) + '\n';
}

/// A region with its numerals, which take several lines where they have to.
struct CRegionRow {
    std::string mKey;
    std::string mWhere;
    std::vector<std::string> mNumerals;
};

std::vector<CRegionRow> RegionRows(const CSongReading& reading, const CBars& bars) {
    std::vector<CRegionRow> rows;
    for (const CKeyRegion& region : reading.mRegions) {
        CRegionRow row{
            KeyInWords(region.mKey), BarsOf({region.mPosition, region.mEndPosition}, bars), {}};
        for (std::size_t ix = region.mBegin; ix < region.mEnd; ++ix) {
            const std::string& numeral = reading.mChords[ix].mNumeral;
            if (!numeral.empty()) row.mNumerals.push_back(numeral);
        }
        rows.push_back(std::move(row));
    }
    return rows;
}

}  // namespace

std::string_view ConfidenceInWords(double confidence) {
    if (confidence >= 0.9) return "clear";
    if (confidence >= 0.7) return "likely";
    if (confidence >= 0.5) return "doubtful";
    return "hardly shown by the chords";
}

std::string ReadingText(const CSong& song, const CSongReading& reading,
                        const CReadingTextOptions& options, const CPaint& paint) {
    std::string text = Head(song, reading, paint);
    if (reading.mKey.IsUndef()) return text;
    const CBars bars = BarsOfSong(song);
    const std::vector<CReadingBar> readingBars = ReadingBarsOf(song, bars);
    text += '\n';
    text += options.mIsLong ? LongTable(song, reading, bars, paint)
                            : ReadingLines(song, reading, {readingBars, options.mWidth}, paint);
    std::vector<std::string> repeats;
    for (const CRepeatedBars& repeat : RepeatedBarsOf(song, bars, readingBars)) {
        repeats.push_back(RepeatText(repeat));
    }
    AppendParagraph(text, "Repeats", repeats, paint);
    AppendParagraph(text, "Notes", ReadingNotes(song, reading, bars), paint);
    return text;
}

std::string RegionsText(const CSong& song, const CSongReading& reading,
                        const CReadingTextOptions& options, const CPaint& paint) {
    std::string text = Head(song, reading, paint);
    if (reading.mRegions.empty()) return text;
    const CBars bars = BarsOfSong(song);
    const std::vector<CRegionRow> rows = RegionRows(reading, bars);
    std::size_t key = 0;
    std::size_t where = 0;
    for (const CRegionRow& row : rows) {
        key = std::max(key, CountCharacters(row.mKey));
        where = std::max(where, CountCharacters(row.mWhere));
    }
    constexpr std::size_t least = 24;
    const std::size_t before = key + where + 6;
    const std::size_t width = std::max(options.mWidth, before + least) - before;
    CTable table({"key", "where", "numerals"});
    for (const CRegionRow& row : rows) {
        std::array<std::string, 2> cells{row.mKey, row.mWhere};
        for (const std::string& line : InLines(row.mNumerals, width)) {
            table.AddRow({std::exchange(cells[0], ""), std::exchange(cells[1], ""), line});
        }
    }
    return text + '\n' + table.Text(paint, "  ");
}

}  // namespace brindle
