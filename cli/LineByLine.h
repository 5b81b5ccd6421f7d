// SPDX-License-Identifier: MIT
#pragma once

#include "cli/CommandLine.h"
#include "cli/FaultMessage.h"
#include "cli/Input.h"

#include <string>
#include <string_view>
#include <variant>
#include <vector>

namespace brindle::cli {

/// The options of a command that reads one thing a line.
struct CLineOptions {
    std::vector<std::string> mWords;
    CFormatOptions mFormat;
};

/// What each typed line means: the member `value` of what `read` gives, a record that also has
/// `mError` and `mColumn`. The first line with a fault, or with nothing to read, gives an error
/// status instead.
template <class Reading, class Value>
std::variant<TStatus, std::vector<Value>> ReadLines(const std::vector<std::string>& words,
                                                    Reading (*read)(std::string_view),
                                                    Value Reading::*value) {
    const auto lines = TypedLines(words);
    if (!lines) return TStatus::BadInput;
    std::vector<Value> values;
    for (const std::string& typed : *lines) {
        const Reading reading = read(typed);
        if (!reading.mError.empty()) {
            return FailAt(TStatus::BadInput, FaultMessage(reading.mError), typed, reading.mColumn);
        }
        values.push_back(reading.*value);
    }
    return values;
}

}  // namespace brindle::cli
