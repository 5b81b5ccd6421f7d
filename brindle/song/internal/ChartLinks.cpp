// SPDX-License-Identifier: MIT
#include "brindle/song/internal/ChartLinks.h"

#include "brindle/platform/ReadNumber.h"
#include "brindle/song/internal/SongWords.h"
#include "brindle/song/internal/StatedKey.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <utility>

namespace brindle::ChartLinks {

namespace {

using SongText::Lower;
using SongText::Trimmed;

constexpr std::string_view kScrambledLink = "irealb://";
constexpr std::string_view kPlainLink = "irealbook://";
constexpr std::string_view kMarkOfChart = "1r34LbKcu7";
constexpr std::size_t kPlainFields = 6;
constexpr std::size_t kBlock = 50;

struct CShortForm {
    std::string_view mShort;
    std::string_view mMeant;
};

constexpr auto kShortForms =
    std::to_array<CShortForm>({{"XyQ", "   "}, {"LZ", " |"}, {"Kcl", "| x"}});
constexpr auto kEntities = std::to_array<CShortForm>({{"&quot;", "\""},
                                                      {"&#39;", "'"},
                                                      {"&apos;", "'"},
                                                      {"&lt;", "<"},
                                                      {"&gt;", ">"},
                                                      {"&amp;", "&"}});

/// In one pass from left to right; the first form that fits counts.
template <std::size_t N>
std::string Replaced(std::string_view text, const std::array<CShortForm, N>& forms) {
    std::string replaced;
    while (!text.empty()) {
        const auto form = std::find_if(forms.begin(), forms.end(), [&](const CShortForm& f) {
            return text.starts_with(f.mShort);
        });
        const bool isForm = form != forms.end();
        replaced += isForm ? form->mMeant : text.substr(0, 1);
        text.remove_prefix(isForm ? form->mShort.size() : 1);
    }
    return replaced;
}

int HexDigit(char c) {
    if (c >= '0' && c <= '9') return c - '0';
    if (c >= 'a' && c <= 'f') return c - 'a' + 10;
    return c >= 'A' && c <= 'F' ? c - 'A' + 10 : -1;
}

/// `%20` is a blank; what is no escape stays.
std::string Unescaped(std::string_view text) {
    std::string unescaped;
    for (std::size_t i = 0; i < text.size(); ++i) {
        const bool isEscape = text[i] == '%' && i + 2 < text.size() && HexDigit(text[i + 1]) >= 0 &&
                              HexDigit(text[i + 2]) >= 0;
        if (!isEscape) {
            unescaped += text[i];
            continue;
        }
        unescaped += static_cast<char>(HexDigit(text[i + 1]) * 16 + HexDigit(text[i + 2]));
        i += 2;
    }
    return unescaped;
}

std::vector<std::string_view> Split(std::string_view text, std::string_view separator) {
    std::vector<std::string_view> pieces;
    while (true) {
        const std::size_t end = text.find(separator);
        pieces.push_back(text.substr(0, end));
        if (end == text.npos) return pieces;
        text.remove_prefix(end + separator.size());
    }
}

/// What stands between the composer and the chart: style, key, and numbers.
void TakeStyleAndKey(std::string_view field, CPackedChart& chart) {
    if (field.empty()) return;
    if (chart.mStyle.empty()) {
        chart.mStyle = field;
    } else if (chart.mKey.empty() && ReadStatedKey(field)) {
        chart.mKey = field;
    }
}

/// Without a mark of a chart there is none.
CPackedChart ScrambledChart(std::string_view song) {
    const std::vector<std::string_view> fields = Split(song, "=");
    const auto mark = std::find_if(fields.begin(), fields.end(), [](std::string_view field) {
        return field.starts_with(kMarkOfChart);
    });
    CPackedChart chart;
    chart.mTitle = Trimmed(fields[0]);
    if (mark == fields.end()) return chart;
    const auto index = static_cast<std::size_t>(mark - fields.begin());
    if (index > 1) chart.mMakers = Trimmed(fields[1]);
    for (std::size_t i = 2; i < index; ++i) TakeStyleAndKey(Trimmed(fields[i]), chart);
    chart.mChart = Replaced(Unscrambled(mark->substr(kMarkOfChart.size())), kShortForms);
    if (index + 2 < fields.size()) chart.mTempo = ReadDecimal(fields[index + 2]);
    if (!std::isfinite(chart.mTempo)) chart.mTempo = 0.0;
    return chart;
}

std::vector<CPackedChart> ScrambledCharts(std::string_view link) {
    std::vector<CPackedChart> charts;
    std::string listName;
    for (const std::string_view song : Split(link, "===")) {
        CPackedChart chart = ScrambledChart(song);
        if (!chart.mChart.empty()) {
            charts.push_back(std::move(chart));
        } else {
            listName = chart.mTitle;
        }
    }
    for (CPackedChart& chart : charts) chart.mListName = listName;
    return charts;
}

std::vector<CPackedChart> PlainCharts(std::string_view link) {
    const std::vector<std::string_view> fields = Split(link, "=");
    std::vector<CPackedChart> charts;
    for (std::size_t i = 0; i + kPlainFields <= fields.size(); i += kPlainFields) {
        CPackedChart& chart = charts.emplace_back();
        chart.mTitle = Trimmed(fields[i]);
        chart.mMakers = Trimmed(fields[i + 1]);
        chart.mStyle = Trimmed(fields[i + 2]);
        chart.mKey = Trimmed(fields[i + 3]);
        chart.mChart = fields[i + 5];
    }
    const bool hasName = fields.size() % kPlainFields == 1;
    for (CPackedChart& chart : charts) chart.mListName = hasName ? Trimmed(fields.back()) : "";
    return charts;
}

}  // namespace

std::string Unscrambled(std::string_view chart) {
    std::string text(chart);
    // What is left behind the last block is as it was, and so is a block with next to nothing
    // behind it.
    for (std::size_t begin = 0; begin + kBlock + 2 <= text.size(); begin += kBlock) {
        const auto swap = [&](std::size_t from, std::size_t to) {
            for (std::size_t i = from; i < to; ++i) {
                std::swap(text[begin + i], text[begin + kBlock - 1 - i]);
            }
        };
        swap(0, 5);
        swap(10, 24);
    }
    return text;
}

bool BeginsWithLink(std::string_view text) {
    const std::string begin = Lower(text.substr(0, kPlainLink.size()));
    return begin.starts_with(kScrambledLink) || begin.starts_with(kPlainLink);
}

std::vector<CPackedChart> FindCharts(std::string_view text) {
    const std::string lower = Lower(text);
    std::vector<CPackedChart> charts;
    for (std::size_t begin = lower.find("ireal"); begin != lower.npos;
         begin = lower.find("ireal", begin + 1)) {
        const std::string_view rest = std::string_view(lower).substr(begin);
        const bool isScrambled = rest.starts_with(kScrambledLink);
        if (!isScrambled && !rest.starts_with(kPlainLink)) continue;
        const std::size_t from = begin + (isScrambled ? kScrambledLink : kPlainLink).size();
        const std::size_t end = std::min(text.find_first_of("\"'<>\r\n", from), text.size());
        const std::string link = Unescaped(Replaced(text.substr(from, end - from), kEntities));
        for (CPackedChart& chart : isScrambled ? ScrambledCharts(link) : PlainCharts(link)) {
            chart.mOffset = begin;
            charts.push_back(std::move(chart));
        }
        begin = end - 1;
    }
    return charts;
}

}  // namespace brindle::ChartLinks
