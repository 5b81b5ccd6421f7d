// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

/// Links that hold packed charts.
///
/// `irealbook://` holds URL-escaped fields `Title=Composer=Style=Key=n=Chart`, for many songs one
/// behind the other. `irealb://` holds such fields with more in between and behind them, songs
/// parted by `===`; its charts begin with a mark, are scrambled in blocks of 50 characters, and
/// have short forms for common signs. A list of songs ends with its name.
namespace brindle::ChartLinks {

/// One chart of a link, not scrambled.
struct CPackedChart {
    std::string mTitle;
    std::string mMakers;
    std::string mStyle;
    std::string mKey;
    /// Quarters a minute, 0 for none.
    double mTempo = 0.0;
    /// Of the list that it is in.
    std::string mListName;
    std::string mChart;
    /// The byte of the source where its link begins.
    std::size_t mOffset = 0;
};

[[nodiscard]] bool BeginsWithLink(std::string_view text);

/// The charts of all links in a text or a page, in their order.
[[nodiscard]] std::vector<CPackedChart> FindCharts(std::string_view text);

/// Undoes the scrambling, which is its own opposite.
[[nodiscard]] std::string Unscrambled(std::string_view chart);

}  // namespace brindle::ChartLinks
