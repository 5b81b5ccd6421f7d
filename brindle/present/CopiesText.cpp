// SPDX-License-Identifier: MIT
#include "brindle/present/CopiesText.h"

#include "brindle/present/CBars.h"
#include "brindle/present/JsonValues.h"
#include "brindle/present/internal/ReadingBars.h"

#include <nlohmann/json.hpp>

namespace brindle {

namespace {

Json RangeToJson(const CTimeRange& range) {
    return {{"Position", NumberToJson(range.mBegin)}, {"End", NumberToJson(range.mEnd)}};
}

std::vector<CRepeatedBars> RepeatsOf(const CSong& song) {
    const CBars bars = BarsOfSong(song);
    return RepeatedBarsOf(song, bars, ReadingBarsOf(song, bars), 1);
}

}  // namespace

std::string RepeatsText(const CSong& song, const CPaint& paint) {
    const auto repeats = RepeatsOf(song);
    if (repeats.empty()) return "no whole bars are repeated\n";
    std::string text = paint.Accent("Repeats") + '\n';
    for (const CRepeatedBars& repeat : repeats) text += "  " + RepeatText(repeat) + '\n';
    return text;
}

std::string CopiesJson(const std::vector<CShownCopy>& copies, const CSong& song) {
    Json list = Json::array();
    for (const CShownCopy& shown : copies) {
        list.push_back({{"TargetPos", NumberToJson(shown.mCopy.mTargetPos)},
                        {"SourceOffsetBars", shown.mCopy.mSourceOffsetBars},
                        {"LengthBars", shown.mCopy.mLengthBars},
                        {"Source", RangeToJson(shown.mSource)},
                        {"Target", RangeToJson(shown.mTarget)},
                        {"Symbols", shown.mSymbols}});
    }
    Json repeats = Json::array();
    for (const CRepeatedBars& repeat : RepeatsOf(song)) {
        repeats.push_back(
            {{"Bar", repeat.mFirst}, {"SourceBar", repeat.mSource}, {"BarCount", repeat.mCount}});
    }
    return JsonText({{"HarmCopies", list}, {"Repeats", repeats}});
}

}  // namespace brindle
