// SPDX-License-Identifier: MIT
#include "brindle/platform/JsonString.h"

#include "brindle/platform/Utf16.h"
#include "brindle/platform/Utf8.h"

#include <doctest/doctest.h>

#include <nlohmann/json.hpp>
#include <string>
#include <vector>

using namespace brindle;

namespace {

/// One character of the first 65,536, which is no half of another one.
std::string Character(unsigned code) {
    const std::string bytes{static_cast<char>(code >> 8), static_cast<char>(code & 0xFF)};
    return Utf8FromUtf16("\xFE\xFF" + bytes).value_or("");
}

/// All unprintable characters of a text, in hexadecimal digits.
std::vector<unsigned> Unprintable(std::string_view text) {
    std::vector<unsigned> found;
    while (!text.empty()) {
        const std::string_view character = text.substr(0, Utf8Length(text));
        REQUIRE_FALSE(character.empty());
        if (IsUnprintable(character)) found.push_back(CodePointOf(character));
        text.remove_prefix(character.size());
    }
    return found;
}

}  // namespace

TEST_CASE("Control characters and those that turn or end a line are unprintable") {
    struct CRow {
        unsigned mFirst;
        unsigned mLast;
    };
    const CRow rows[] = {
        {0x00, 0x1F}, {0x7F, 0x9F}, {0x2028, 0x202E}, {0x2066, 0x2069}, {0xFFFE, 0xFFFF}};
    for (const CRow& row : rows) {
        INFO(row.mFirst);
        CHECK(IsUnprintable(Character(row.mFirst)));
        CHECK(IsUnprintable(Character(row.mLast)));
        if (row.mFirst > 0) CHECK_FALSE(IsUnprintable(Character(row.mFirst - 1)));
        if (row.mLast < 0xFFFF) CHECK_FALSE(IsUnprintable(Character(row.mLast + 1)));
    }
    CHECK_FALSE(IsUnprintable("\xF0\x9D\x84\x9E"));
}

TEST_CASE("JSON is printable and gives back what it was made of") {
    std::string all = "\xF0\x9D\x84\x9E";
    for (unsigned code = 0; code <= 0xFFFF; ++code) all += Character(code);
    REQUIRE(Unprintable(all).size() > 60);

    const std::string quoted = JsonString(all);
    CHECK(Unprintable(quoted).empty());
    CHECK(nlohmann::json::parse(quoted) == all);
    const nlohmann::json value{{all, {1, all, nullptr}}};
    CHECK(Unprintable(DumpJson(value)).empty());
    CHECK(nlohmann::json::parse(DumpJson(value)) == value);

    CHECK(JsonString("a \"b\"\\\n\x7F\xC2\x9B\xE2\x80\xA8\xC3\xA9") ==
          "\"a \\\"b\\\"\\\\\\n\\u007f\\u009b\\u2028\xC3\xA9\"");
    CHECK(JsonString("\x9B\xC3") == "\"\xEF\xBF\xBD\xEF\xBF\xBD\"");
}
