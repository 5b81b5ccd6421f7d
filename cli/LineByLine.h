// SPDX-License-Identifier: MIT
#pragma once

#include "cli/CommandLine.h"
#include "cli/Input.h"
#include "cli/Json.h"
#include "cli/Output.h"

#include <string>
#include <type_traits>
#include <variant>
#include <vector>

namespace brindle::cli {

/// The options of a command that reads one thing a line.
struct CLineOptions {
    std::vector<std::string> mWords;
    CFormatOptions mFormat;
};

/// What each typed line means. The first line with a fault, or with nothing to read, gives an error
/// status instead. `read` gives a record with `mError` and `mColumn`.
template <class Read>
std::variant<TStatus, std::vector<std::invoke_result_t<Read, const std::string&>>> ReadLines(
    const std::vector<std::string>& words, Read read) {
    const auto lines = TypedLines(words);
    if (!lines) return TStatus::BadInput;
    std::vector<std::invoke_result_t<Read, const std::string&>> readings;
    for (const std::string& line : *lines) {
        const std::string typed = FoldAccidentals(line);
        readings.push_back(read(typed));
        if (readings.back().mError.empty()) continue;
        return FailAt(TStatus::BadInput, readings.back().mError, typed, readings.back().mColumn);
    }
    return readings;
}

/// Reads each typed line and prints what the lines mean: one JSON list of that name, or texts with
/// a blank line between. `read` is that of ReadLines; `toJson` and `toText` take its records.
template <class Read, class ToJson, class ToText>
TStatus PrintLineByLine(const CLineOptions& options, const char* listName, Read read, ToJson toJson,
                        ToText toText) {
    const auto lines = ReadLines(options.mWords, read);
    if (lines.index() == 0) return std::get<0>(lines);
    const bool isJson = options.mFormat.Format() == TFormat::Json;
    Json list = Json::array();
    std::string text;
    for (const auto& reading : std::get<1>(lines)) {
        if (isJson) {
            list.push_back(toJson(reading));
        } else {
            text += (text.empty() ? "" : "\n") + toText(reading);
        }
    }
    return Print(isJson ? JsonText({{listName, list}}) : text);
}

}  // namespace brindle::cli
