// SPDX-License-Identifier: MIT
#include "Catalogue.h"

#include <fstream>

namespace brindle::test {
namespace {

// What stands between the first and the last quote of a line.
std::string Quoted(const std::string& line) {
    const std::size_t open = line.find('"');
    const std::size_t close = line.rfind('"');
    return open == line.npos || close <= open ? "" : line.substr(open + 1, close - open - 1);
}

}  // namespace

std::map<std::string, std::string> ReadCatalogue(const std::string& language) {
    std::ifstream file(BRINDLE_SOURCE_DIR "/data/locale/" + language + ".po");
    std::map<std::string, std::string> texts;
    std::string key;
    for (std::string line; std::getline(file, line);) {
        if (line.rfind("msgid ", 0) == 0) key = Quoted(line);
        if (line.rfind("msgstr ", 0) == 0 && !key.empty()) texts[key] = Quoted(line);
    }
    return texts;
}

}  // namespace brindle::test
