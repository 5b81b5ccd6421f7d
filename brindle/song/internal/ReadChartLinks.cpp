// SPDX-License-Identifier: MIT
#include "brindle/platform/internal/CTextPlaces.h"
#include "brindle/song/internal/ChartLinks.h"
#include "brindle/song/internal/SongReaders.h"
#include "brindle/song/internal/StatedKey.h"

#include <algorithm>
#include <utility>

namespace brindle::SongReaders {

namespace {

CSong ReadChart(const ChartLinks::CPackedChart& chart, TSongFormat format,
                const CSongOptions& prefs) {
    CSong song = ReadSheet(chart.mChart, TSongFormat_Chart, prefs);
    song.mFormat = format;
    song.mTitle = chart.mTitle;
    song.mMakers = chart.mMakers;
    song.mStyle = chart.mStyle;
    if (chart.mTempo > 0.0) song.mTempo = chart.mTempo;
    if (!chart.mListName.empty()) song.mRemarks.push_back({"list", chart.mListName});
    AppendStatedKey(chart.mKey, 0.0, song);
    return song;
}

/// The text of a link is packed: a fault stands where the link does.
void MoveFaults(const ChartLinks::CPackedChart& chart, std::size_t line, std::size_t column,
                CSong& song) {
    for (CSongFault& fault : song.mFaults) {
        fault.mText = chart.mTitle + ", character " + std::to_string(fault.mColumn) +
                      " of the chart: " + fault.mText;
        fault.mLine = line;
        fault.mColumn = column;
    }
}

CSong SongWithoutCharts(TSongFormat format) {
    CSong song;
    song.mFormat = format;
    song.mFaults.push_back({1, 1, "no chart stands here"});
    return song;
}

std::size_t BytesOf(const ChartLinks::CPackedChart& chart) {
    return sizeof(chart) + chart.mChart.size() + chart.mTitle.size() + chart.mMakers.size();
}

}  // namespace

std::vector<CUnreadSong> SplitChartLinks(std::string_view text, TSongFormat format,
                                         const CSongOptions& prefs) {
    std::vector<CUnreadSong> songs;
    CTextPlaces places(text);
    for (ChartLinks::CPackedChart& chart : ChartLinks::FindCharts(text)) {
        places.GoToByte(chart.mOffset);
        const std::size_t bytes = BytesOf(chart);
        const auto read = [chart = std::move(chart), line = places.Line(), column = places.Column(),
                           format, prefs] {
            CSong song = ReadChart(chart, format, prefs);
            MoveFaults(chart, line, column, song);
            return song;
        };
        songs.push_back({read, bytes});
    }
    if (songs.empty()) songs.push_back({[format] { return SongWithoutCharts(format); }, 0});
    return songs;
}

std::vector<CSong> ReadChartLinks(std::string_view text, TSongFormat format,
                                  const CSongOptions& prefs) {
    std::vector<CSong> songs;
    for (const CUnreadSong& song : SplitChartLinks(text, format, prefs)) {
        songs.push_back(song.mRead());
    }
    return songs;
}

}  // namespace brindle::SongReaders
