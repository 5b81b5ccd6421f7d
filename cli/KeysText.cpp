// SPDX-License-Identifier: MIT
#include "cli/KeysView.h"
#include "cli/Table.h"

#include <fmt/format.h>

namespace brindle::cli {
namespace {

constexpr std::string_view kMargin = "    ";

std::string Head(const TSongKeys& keys, const CPaint& paint) {
    return paint.Strong("Key of the song " + keys.mName) +
           paint.Faint(fmt::format(", confidence {:.2f}", keys.mConfidence)) + '\n';
}

std::string ChordRows(const TShownKeyRegion& region, const CBars& bars, const CPaint& paint) {
    CTable table({" bar", " beat", "chord", "numeral"});
    long barBefore = 0;
    for (const TShownNumeral& chord : region.mChords) {
        const long bar = bars.BarOf(chord.mRange.mBegin);
        table.AddRow({bar == barBefore ? "" : fmt::format("{}", bar),
                      ShortNumber(bars.BeatOf(chord.mRange.mBegin)), chord.mSymbol,
                      chord.mNumeral.empty() ? "-" : chord.mNumeral});
        barBefore = bar;
    }
    return table.Text(paint, kMargin);
}

}  // namespace

std::string KeysText(const TSong& song, const CPaint& paint) {
    const TSongKeys& keys = song.mKeys;
    if (keys.mRegions.empty()) return paint.Strong("No key: no chords") + '\n';
    const CBars bars(song.mBeatsPerBar, song.mBarStarts);
    std::string text = Head(keys, paint);
    for (const TShownKeyRegion& region : keys.mRegions) {
        text += "\n  " + paint.Accent(region.mName) +
                paint.Faint(", " + BarsOf(region.mRange, bars)) + "\n\n" +
                ChordRows(region, bars, paint);
    }
    return text;
}

std::string KeysSummary(const TSongKeys& keys, const CBars& bars, const CPaint& paint) {
    if (keys.mRegions.empty()) return {};
    CTable table({"key", "where", "numerals"});
    for (const TShownKeyRegion& region : keys.mRegions) {
        std::vector<std::string> numerals;
        for (const TShownNumeral& chord : region.mChords) {
            if (!chord.mNumeral.empty()) numerals.push_back(chord.mNumeral);
        }
        table.AddRow({region.mName, BarsOf(region.mRange, bars), FirstAndLast(numerals)});
    }
    return Head(keys, paint) + '\n' + table.Text(paint, kMargin);
}

}  // namespace brindle::cli
