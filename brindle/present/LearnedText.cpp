// SPDX-License-Identifier: MIT
#include "brindle/present/LearnedText.h"

#include "brindle/present/JsonValues.h"
#include "brindle/present/ShownText.h"

#include <fmt/format.h>

#include <nlohmann/json.hpp>
#include <string_view>

namespace brindle {
namespace {

std::string Plural(std::size_t count, std::string_view one, std::string_view many) {
    return fmt::format("{} {}", count, count == 1 ? one : many);
}

}  // namespace

std::string LearnedText(const CLearnReport& report, const VariableLengthMarkovModel& model) {
    return fmt::format("learned {} from {}: {}, {}\n", Plural(report.mChords, "chord", "chords"),
                       Plural(report.mFiles, "file", "files"),
                       Plural(model.mObjects.size(), "symbol", "symbols"),
                       Plural(model.mTransitionMap.size(), "history", "histories"));
}

std::string LearnedJson(const CLearnReport& report, const VariableLengthMarkovModel& model) {
    Json unread = Json::array();
    for (const auto& [name, error] : report.mUnread) {
        unread.push_back({{"File", Printable(name)}, {"Error", Printable(error)}});
    }
    return JsonText({{"Files", report.mFiles},
                     {"Chords", report.mChords},
                     {"MaxHistoryLength", model.mMaxHistoryLength},
                     {"Symbols", model.mObjects.size()},
                     {"Histories", model.mTransitionMap.size()},
                     {"Unread", unread}});
}

std::string LearnedSongsText(const CSongModel& model, std::size_t files) {
    return fmt::format("learned {} from {}: {} chords, {} different ones\n",
                       Plural(model.Songs().size(), "song", "songs"),
                       Plural(files, "file", "files"), model.ChordCount(), model.VocabularySize());
}

std::string LearnedSongsJson(const CSongModel& model, std::size_t files) {
    return JsonText({{"Files", files},
                     {"Songs", model.Songs().size()},
                     {"Chords", model.ChordCount()},
                     {"DifferentChords", model.VocabularySize()}});
}

}  // namespace brindle
