// SPDX-License-Identifier: MIT
#include "Layers.h"

#include <doctest/doctest.h>

#include <filesystem>
#include <fstream>
#include <iterator>

namespace brindle::test {
namespace {

namespace fs = std::filesystem;

struct CFile {
    std::string mPath;  // relative to the source tree
    std::string mText;
};

std::string ReadFile(const fs::path& path) {
    std::ifstream file(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(file), {}};
}

// All headers and sources of the library and the program.
std::vector<CFile> SourceFiles() {
    const fs::path root = BRINDLE_SOURCE_DIR;
    std::vector<CFile> files;
    for (const char* folder : {"brindle", "cli"}) {
        for (const auto& entry : fs::recursive_directory_iterator(root / folder)) {
            const auto extension = entry.path().extension();
            if (extension != ".h" && extension != ".cpp") continue;
            files.push_back(
                {entry.path().lexically_relative(root).generic_string(), ReadFile(entry.path())});
        }
    }
    return files;
}

TEST_CASE("No arrow of the house points up") {
    const auto files = SourceFiles();
    CHECK(files.size() > 20);
    for (const auto& file : files) {
        for (const auto& fault : IncludeFaults(file.mPath, file.mText)) FAIL_CHECK(fault);
    }
}

TEST_CASE("A source includes its own header first, so that the header stands on its own") {
    const fs::path root = BRINDLE_SOURCE_DIR;
    for (const auto& file : SourceFiles()) {
        fs::path own = file.mPath;
        if (own.extension() != ".cpp") continue;
        own.replace_extension(".h");
        if (!fs::exists(root / own)) continue;
        INFO(file.mPath);
        CHECK(FirstInclude(file.mText) == own.generic_string());
    }
}

TEST_CASE("The checker finds what is planted") {
    struct CCase {
        const char* mPath;
        const char* mText;
        bool mIsFault;
    };
    const CCase cases[] = {
        {"brindle/theory/A.h", "#include \"brindle/theory/CKeyEnh.h\"", false},
        {"brindle/theory/A.cpp", "#include \"brindle/platform/Localization.h\"", false},
        {"brindle/musicxml/A.cpp", "#include \"brindle/analysis/CHarmonicAnalyse.h\"", false},
        {"brindle/theory/A.h", "#include \"brindle/chords/CChordLite.h\"", true},
        {"brindle/analysis/A.cpp", "int a;\n  #  include \"brindle/musicxml/Doc.h\"", true},
        {"brindle/chords/A.cpp", "#include \"brindle/brindle.h\"", true},
        {"brindle/chords/A.cpp", "#include \"cli/Output.h\"", true},
        {"brindle/chords/A.cpp", "#include \"brindle/cellar/A.h\"", true},
        {"brindle/cellar/A.cpp", "", true},
        {"brindle/platform/A.cpp", "#include \"brindle/theory/CNote.h\"", true},
        {"brindle/platform/A.cpp", "#include <libxml/parser.h>", false},
        {"brindle/musicxml/A.cpp", "#include <libxml/parser.h>", true},
        {"brindle/chords/A.cpp", "#include <nlohmann/json.hpp>", false},
        {"brindle/chords/A.h", "#include <nlohmann/json.hpp>", true},
        {"brindle/chords/A.h", "#include <nlohmann/json_fwd.hpp>", false},
        {"cli/CCommand.cpp", "#include \"brindle/musicxml/Doc.h\"\n#include <CLI/CLI.hpp>", false},
        {"cli/Analyse.cpp", "#include <CLI/CLI.hpp>", true},
        {"cli/CCommand.h", "#include <CLI/App.hpp>", true},
        {"brindle/present/A.cpp", "#include <CLI/CLI.hpp>", true},
    };
    for (const auto& [path, text, isFault] : cases) {
        const std::string logged = std::string(path) + " with " + std::string(text);
        INFO(logged);
        CHECK(IncludeFaults(path, text).empty() == !isFault);
    }
}

}  // namespace
}  // namespace brindle::test
