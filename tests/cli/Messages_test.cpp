// SPDX-License-Identifier: MIT
// What the program tells is told in every language that has a catalogue.

#include "tests/support/Transcript.h"

#include <doctest/doctest.h>

#include <filesystem>
#include <map>
#include <regex>
#include <set>
#include <string>

namespace brindle::test {
namespace {

namespace fs = std::filesystem;

const std::string kSource = BRINDLE_SOURCE_DIR;

/// All that a pattern finds in a text, by its first group.
std::set<std::string> AllOf(const std::string& text, const std::regex& pattern) {
    std::set<std::string> found;
    for (std::sregex_iterator match(text.begin(), text.end(), pattern), end; match != end;
         ++match) {
        found.insert((*match)[1]);
    }
    return found;
}

/// The English messages of the program, whose literals may be broken into several.
std::set<std::string> EnglishMessages() {
    static const std::regex call(R"re(\bMessage\(\s*"((?:[^"]|"\s*")*)")re");
    static const std::regex joint("\"\\s*\"");
    std::set<std::string> messages;
    for (const auto& entry : fs::directory_iterator(kSource + "/cli")) {
        if (entry.path().extension() != ".cpp") continue;
        for (const std::string& text : AllOf(ReadFile(entry.path().string()), call)) {
            messages.insert(std::regex_replace(text, joint, ""));
        }
    }
    return messages;
}

std::map<std::string, std::string> Translations(const std::string& language) {
    static const std::regex entry("msgid \"(.*)\"\nmsgstr \"(.*)\"\n");
    const std::string catalogue = ReadFile(kSource + "/data/locale/" + language + ".po");
    std::map<std::string, std::string> texts;
    for (std::sregex_iterator match(catalogue.begin(), catalogue.end(), entry), end; match != end;
         ++match) {
        texts[(*match)[1]] = (*match)[2];
    }
    return texts;
}

TEST_CASE("Every message of the program is in each catalogue, with the same places to fill") {
    static const std::regex place("\\{([a-z]+)\\}");
    const auto messages = EnglishMessages();
    CHECK(messages.size() > 25);
    for (const char* const language : {"de", "fr", "es"}) {
        const auto texts = Translations(language);
        for (const std::string& message : messages) {
            CAPTURE(language);
            CAPTURE(message);
            const auto found = texts.find(message);
            REQUIRE(found != texts.end());
            CHECK(found->second != message);
            CHECK(AllOf(found->second, place) == AllOf(message, place));
        }
    }
}

}  // namespace
}  // namespace brindle::test
