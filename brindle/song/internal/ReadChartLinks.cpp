// SPDX-License-Identifier: MIT
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
            } else if ((static_cast<unsigned char>(mText[mOffset]) & 0xC0) != 0x80) {
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

}  // namespace

std::vector<CSong> ReadChartLinks(std::string_view text, TSongFormat format,
                                  const CSongOptions& prefs) {
    std::vector<CSong> songs;
    CPlaces places(text);
    for (const ChartLinks::CPackedChart& chart : ChartLinks::FindCharts(text)) {
        places.GoTo(chart.mOffset);
        CSong& song = songs.emplace_back(ReadChart(chart, format, prefs));
        // The text of a link is packed: a fault stands where the link does.
        for (CSongFault& fault : song.mFaults) {
            fault.mText = chart.mTitle + ", character " + std::to_string(fault.mColumn) +
                          " of the chart: " + fault.mText;
            fault.mLine = places.Line();
            fault.mColumn = places.Column();
        }
    }
    if (!songs.empty()) return songs;
    songs.emplace_back().mFormat = format;
    songs.back().mFaults.push_back({1, 1, "no chart stands here"});
    return songs;
}

}  // namespace brindle::SongReaders
