// SPDX-License-Identifier: MIT
#include "brindle/platform/Utf16.h"

#include <doctest/doctest.h>

using namespace brindle;

namespace {

std::string Bytes(std::string_view text) {
    return std::string(text);
}

}  // namespace

TEST_CASE("Text is turned into UTF-16 and back") {
    const std::string text = "A\xC3\xA9\xE2\x99\xAF\xF0\x9D\x84\x9E";  // A, e acute, sharp, clef
    const std::string utf16("\xFE\xFF\0A\0\xE9\x26\x6F\xD8\x34\xDD\x1E", 12);
    CHECK(Utf16FromUtf8(text) == utf16);
    CHECK(Utf8FromUtf16(utf16) == text);
    CHECK(Utf8FromUtf16(utf16.substr(2)) == text);
    CHECK(Utf8FromUtf16(std::string("\xFF\xFE\x41\0\x6F\x26", 6)) == "A\xE2\x99\xAF");
    CHECK(Utf8FromUtf16("") == "");
    CHECK(Utf8FromUtf16("\xFE\xFF") == "");
}

TEST_CASE("Half a character is no text") {
    for (const std::string& bytes :
         {Bytes("A"), Bytes("\xD8\x34"), Bytes("\xD8\x34\xD8\x34"), Bytes("\xDD\x1E"),
          std::string("\xD8\x34\0A", 4), Bytes("\xFE\xFF\xD8")}) {
        CHECK_FALSE(Utf8FromUtf16(bytes).has_value());
    }
    for (const char* text : {"\xFF", "\xC3", "\xED\xA0\x80", "A\xF0\x9D\x84"}) {
        CHECK_FALSE(Utf16FromUtf8(text).has_value());
    }
}
