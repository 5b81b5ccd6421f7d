// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/MusicXmlParser.h"
#include "brindle/musicxml/MuxmlJsonLines.h"

#include <memory>
#include <nlohmann/json.hpp>
#include <string>
#include <vector>

namespace brindle::test {

/// All calls of an import in their order, enumerations by number.
struct CEventLog {
    std::vector<nlohmann::json> mCalls;
    bool mOk = false;
    Error mError;

    /// The calls of one method.
    [[nodiscard]] std::vector<nlohmann::json> Of(const std::string& call) const {
        std::vector<nlohmann::json> found;
        for (const nlohmann::json& entry : mCalls) {
            if (entry.at("call") == call) found.push_back(entry);
        }
        return found;
    }
};

/// A host that writes all calls to a log.
inline std::shared_ptr<MusicXmlParserDelegate> HostFor(CEventLog& log) {
    return std::make_shared<MusicXmlParserDelegate>(MuxmlJsonLines(
        TMuxmlEnumForm_Number,
        [&log](const std::string& line) { log.mCalls.push_back(nlohmann::json::parse(line)); }));
}

inline CEventLog ImportFile(const std::string& path) {
    CEventLog log;
    log.mOk = MusicXmlParser().parseURL(path, HostFor(log), &log.mError);
    return log;
}

inline CEventLog ImportText(const std::string& text) {
    CEventLog log;
    log.mOk = MusicXmlParser().parseBytes(text, HostFor(log), &log.mError);
    return log;
}

}  // namespace brindle::test
