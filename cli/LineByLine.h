// SPDX-License-Identifier: MIT
#pragma once

#include "cli/CommandLine.h"
#include "cli/Input.h"
#include "cli/Json.h"
#include "cli/Output.h"

#include <string>
#include <vector>

namespace brindle::cli {

/// The options of a command that reads one thing a line.
struct TLineOptions {
    std::vector<std::string> mWords;
    CFormatOptions mFormat;
};

/// Reads each typed line and prints what the lines mean: one JSON list of that name, or texts with
/// a blank line between. The first line with a fault ends it. `read` gives a record with `mError`
/// and `mColumn`, which `toJson` and `toText` take.
template <class Read, class ToJson, class ToText>
TStatus PrintLineByLine(const TLineOptions& options, const char* listName, Read read, ToJson toJson,
                        ToText toText) {
    const auto lines = TypedLines(options.mWords);
    if (!lines) return TStatus::BadInput;
    const bool isJson = options.mFormat.Format() == TFormat::Json;
    Json list = Json::array();
    std::string text;
    for (const std::string& line : *lines) {
        const std::string typed = FoldAccidentals(line);
        const auto reading = read(typed);
        if (!reading.mError.empty()) {
            return FailAt(TStatus::BadInput, reading.mError, typed, reading.mColumn);
        }
        if (isJson) {
            list.push_back(toJson(reading));
        } else {
            text += (text.empty() ? "" : "\n") + toText(reading);
        }
    }
    return Print(isJson ? JsonText({{listName, list}}) : text);
}

}  // namespace brindle::cli
