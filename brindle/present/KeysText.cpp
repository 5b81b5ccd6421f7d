// SPDX-License-Identifier: MIT
#include "brindle/present/KeysText.h"

#include "brindle/present/CTable.h"
#include "brindle/present/ShownText.h"

#include <fmt/format.h>

namespace brindle {
namespace {

constexpr std::string_view kMargin = "    ";

std::string Head(const CShownKeys& keys, const CPaint& paint) {
    return paint.Strong("Key of the song " + keys.mName) +
           paint.Faint(fmt::format(", confidence {:.2f}", keys.mConfidence)) + '\n';
}

std::string ChordRows(const CShownKeyRegion& region, const CBars& bars, const CPaint& paint) {
    CTable table({" bar", " beat", "chord", "numeral"});
    long barBefore = 0;
    for (const CShownNumeral& chord : region.mChords) {
        const long bar = bars.BarOf(chord.mRange.mBegin);
        table.AddRow({bar == barBefore ? "" : fmt::format("{}", bar),
                      ShortNumber(bars.BeatOf(chord.mRange.mBegin)), chord.mSymbol,
                      chord.mNumeral.empty() ? "-" : chord.mNumeral});
        barBefore = bar;
    }
    return table.Text(paint, kMargin);
}

}  // namespace

std::string KeysText(const CShownSong& song, const CPaint& paint) {
    const CShownKeys& keys = song.mKeys;
    if (keys.mRegions.empty()) return paint.Strong("No key: no chords") + '\n';
    const CBars bars(song.mBeatsPerBar, song.mBarStarts);
    std::string text = Head(keys, paint);
    for (const CShownKeyRegion& region : keys.mRegions) {
        text += "\n  " + paint.Accent(region.mName) +
                paint.Faint(", " + BarsOf(region.mRange, bars)) + "\n\n" +
                ChordRows(region, bars, paint);
    }
    return text;
}

std::string KeysSummary(const CShownKeys& keys, const CBars& bars, const CPaint& paint) {
    if (keys.mRegions.empty()) return {};
    CTable table({"key", "where", "numerals"});
    for (const CShownKeyRegion& region : keys.mRegions) {
        std::vector<std::string> numerals;
        for (const CShownNumeral& chord : region.mChords) {
            if (!chord.mNumeral.empty()) numerals.push_back(chord.mNumeral);
        }
        table.AddRow({region.mName, BarsOf(region.mRange, bars), FirstAndLast(numerals)});
    }
    return Head(keys, paint) + '\n' + table.Text(paint, kMargin);
}

}  // namespace brindle
