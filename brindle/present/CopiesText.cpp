// SPDX-License-Identifier: MIT
#include "brindle/present/CopiesText.h"

#include "brindle/present/CBars.h"
#include "brindle/present/CTable.h"
#include "brindle/present/JsonValues.h"
#include "brindle/present/ShownText.h"

#include <nlohmann/json.hpp>

namespace brindle {

namespace {

std::string LengthText(double bars) {
    return ShortNumber(bars) + (bars == 1.0 ? " bar" : " bars");
}

Json RangeToJson(const CTimeRange& range) {
    return {{"Position", NumberToJson(range.mBegin)}, {"End", NumberToJson(range.mEnd)}};
}

}  // namespace

std::string CopiesJson(const std::vector<CShownCopy>& copies) {
    Json list = Json::array();
    for (const CShownCopy& shown : copies) {
        list.push_back({{"TargetPos", NumberToJson(shown.mCopy.mTargetPos)},
                        {"SourceOffsetBars", shown.mCopy.mSourceOffsetBars},
                        {"LengthBars", shown.mCopy.mLengthBars},
                        {"Source", RangeToJson(shown.mSource)},
                        {"Target", RangeToJson(shown.mTarget)},
                        {"Symbols", shown.mSymbols}});
    }
    return JsonText({{"HarmCopies", list}});
}

std::string CopiesText(const std::vector<CShownCopy>& copies, double beatsPerBar,
                       const CPaint& paint) {
    if (copies.empty()) return "no passage is repeated\n";
    const CBars bars(beatsPerBar);
    CTable table({"source", "target", "length", "chords"});
    for (const CShownCopy& shown : copies) {
        table.AddRow({BarsOf(shown.mSource, bars), BarsOf(shown.mTarget, bars),
                      LengthText((shown.mTarget.mEnd - shown.mTarget.mBegin) / beatsPerBar),
                      FirstAndLast(shown.mSymbols)});
    }
    return table.Text(paint);
}

}  // namespace brindle
