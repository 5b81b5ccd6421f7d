// SPDX-License-Identifier: MIT
#include "brindle/platform/Utf8.h"
#include "brindle/song/internal/ChartLinks.h"
#include "brindle/song/internal/SongReaders.h"
#include "brindle/song/internal/StatedKey.h"

#include <algorithm>
#include <utility>

namespace brindle::SongReaders {

namespace {

/// Lines and columns of ascending places.
class CPlaces {
public:
    explicit CPlaces(std::string_view text) : mText(text) {}

    void GoTo(std::size_t offset) {
        for (; mOffset < offset; ++mOffset) {
            if (mText[mOffset] == '\n') {
                ++mLine;
                mColumn = 1;
            } else if (BeginsUtf8Character(mText[mOffset])) {
                ++mColumn;
            }
        }
    }
    [[nodiscard]] std::size_t Line() const { return mLine; }
    [[nodiscard]] std::size_t Column() const { return mColumn; }

private:
    std::string_view mText;
    std::size_t mOffset = 0;
    std::size_t mLine = 1;
    std::size_t mColumn = 1;
};

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
    CPlaces places(text);
    for (ChartLinks::CPackedChart& chart : ChartLinks::FindCharts(text)) {
        places.GoTo(chart.mOffset);
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
