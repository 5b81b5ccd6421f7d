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

/// What the program knows of the library's sentences on faults, as they stand in the source.
std::set<std::string> KnownFaults() {
    static const std::regex sentence(R"re(\n    "((?:[^"\\]|\\.)*)",)re");
    return AllOf(ReadFile(kSource + "/cli/FaultMessage.cpp"), sentence);
}

/// The sentences that the readers of chords and songs have, with names for their places.
std::set<std::string> FaultsOfTheLibrary() {
    static const std::regex row(R"re(\{TFault::\w+,\s*R"\((.*)\)"(?:, true)?\},)re");
    static const std::regex call(R"re(Add(?:Fault|Note)\([^"]*"((?:[^"\\]|\\.)*)"\))re");
    std::set<std::string> faults;
    const std::string rows = ReadFile(kSource + "/brindle/chords/internal/FaultsOfChordText.cpp");
    for (std::string text : AllOf(rows, row)) {
        text = std::regex_replace(text, std::regex("\""), "\\\"");
        text = std::regex_replace(text, std::regex("\\{0\\}"), "{text}");
        faults.insert(std::regex_replace(text, std::regex("\\{1\\}"), "{place}"));
    }
    for (const auto& entry : fs::directory_iterator(kSource + "/brindle/song/internal")) {
        faults.merge(AllOf(ReadFile(entry.path().string()), call));
    }
    return faults;
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
    static const std::regex word("[A-Za-z]");
    auto messages = EnglishMessages();
    messages.merge(KnownFaults());
    CHECK(messages.size() > 90);
    for (const char* const language : {"de", "fr", "es"}) {
        const auto texts = Translations(language);
        for (const std::string& message : messages) {
            CAPTURE(language);
            CAPTURE(message);
            const auto found = texts.find(message);
            REQUIRE(found != texts.end());
            const bool hasWords = std::regex_search(std::regex_replace(message, place, ""), word);
            if (hasWords) CHECK(found->second != message);
            CHECK(AllOf(found->second, place) == AllOf(message, place));
        }
    }
}

TEST_CASE("The program knows what the library says of faults") {
    const auto known = KnownFaults();
    const auto faults = FaultsOfTheLibrary();
    CHECK(faults.size() > 20);
    for (const std::string& fault : faults) {
        CAPTURE(fault);
        const bool isBracket = fault.find("\\\" has no \\\"") != fault.npos;
        CHECK((isBracket || known.count(fault) == 1));
    }
}

TEST_CASE("Faults and ranges are told in the language of the user") {
    const struct {
        const char* mTyped;
        const char* mTold;
    } rows[] = {
        {"chord Cxyz", "\"yz\" an Stelle 3 ist nicht zu verstehen\n  Cxyz\n    ^"},
        {"analyse 'C | Q'",
         "Q: ein Akkord beginnt mit einem Ton von A bis H, \"Q\" an Stelle 1 ist keiner\n"
         "  C | Q\n      ^"},
        {"analyse '[C]la [G'", "hinter \"[\" fehlt \"]\"\n  [C]la [G\n        ^"},
        {"numerals 'ii7 Q7' --key C", "dies ist keine Stufe\n  ii7 Q7\n      ^"},
        {"key Q",
         "eine Tonart beginnt mit einem Buchstaben von A bis H, wie \"Bb minor\"\n  Q\n  ^"},
        {"name C99", "C99 liegt außerhalb der Töne 0 bis 127\n  C99\n  ^"},
        {"keys C --beats-per-bar 0",
         "--beats-per-bar und --beats-per-chord nehmen 1/1024 bis 1024 Schläge"},
        {"grid C --capo 99", "--capo: 99 liegt nicht zwischen 0 und 24; siehe brindle grid --help"},
        {"grid C --capo 1.5", "--capo: 1.5 ist keine ganze Zahl; siehe brindle grid --help"},
        {"types maj7", "maj7 steht hier zu viel; siehe brindle types --help"},
        {"key C --json --format text",
         "--format und --json schließen sich aus; siehe brindle key --help"},
        {"markov generate --form AQ7 --bars 8",
         "eine Form sind Buchstaben von A bis Z, die sich 8 Takte gleichmäßig teilen"},
    };
    std::string script =
        "mkdir locales && cp -r /usr/lib/locale/C.utf8 locales/de_DE.utf8; exec 2>&1; "
        "export LOCPATH=$PWD/locales LANG=de_DE.UTF-8 LC_ALL=";
    std::string told;
    for (const auto& row : rows) {
        script += std::string("; brindle ") + row.mTyped;
        told += std::string("brindle: ") + row.mTold + '\n';
    }
    CHECK(RunCommand(script + "; true").mShown == told);
}

}  // namespace
}  // namespace brindle::test
