// SPDX-License-Identifier: MIT
#include "brindle/present/ShownText.h"

#include "brindle/platform/Utf8.h"

#include <fmt/format.h>

#include <algorithm>

namespace brindle {
namespace {

constexpr std::string_view kReplacement = "\xEF\xBF\xBD";  // U+FFFD

}  // namespace

std::string Printable(std::string_view text) {
    std::string printable;
    printable.reserve(text.size());
    while (!text.empty()) {
        const std::size_t length = Utf8Length(text);
        const std::string_view character = text.substr(0, length == 0 ? 1 : length);
        const bool isFine = length > 0 && !IsUnprintable(character);
        printable += isFine ? character : kReplacement;
        text.remove_prefix(character.size());
    }
    return printable;
}

std::size_t CountCharacters(std::string_view text) {
    return static_cast<std::size_t>(std::count_if(text.begin(), text.end(), BeginsUtf8Character));
}

std::string FirstCharacters(std::string_view text, std::size_t count) {
    std::size_t begun = 0;
    const auto* const end = std::find_if(text.begin(), text.end(), [&](char c) {
        begun += BeginsUtf8Character(c);
        return begun > count;
    });
    return {text.begin(), end};
}

std::string PadRight(std::string_view text, std::size_t width) {
    const std::size_t used = CountCharacters(text);
    return std::string(text) + std::string(used < width ? width - used : 0, ' ');
}

std::string PadLeft(std::string_view text, std::size_t width) {
    const std::size_t used = CountCharacters(text);
    return std::string(used < width ? width - used : 0, ' ') + std::string(text);
}

std::string ShortNumber(double number) {
    std::string text = fmt::format("{:.3f}", number);
    text.erase(text.find_last_not_of('0') + 1);
    if (!text.empty() && text.back() == '.') text.pop_back();
    return text;
}

std::string FirstAndLast(const std::vector<std::string>& words) {
    constexpr std::size_t shown = 4;
    std::string text;
    for (std::size_t i = 0; i < words.size(); ++i) {
        if (words.size() > 2 * shown && i == shown) {
            text += " ...";
            i = words.size() - shown;
        }
        if (!text.empty()) text += ' ';
        text += words[i];
    }
    return text;
}

std::vector<std::string> InLines(const std::vector<std::string>& words, std::size_t width) {
    std::vector<std::string> lines;
    std::size_t used = 0;
    for (const std::string& word : words) {
        const std::size_t length = CountCharacters(word);
        const bool fits = !lines.empty() && used + 1 + length <= width;
        if (fits) {
            lines.back() += ' ' + word;
            used += 1 + length;
        } else {
            lines.push_back(word);
            used = length;
        }
    }
    return lines;
}

}  // namespace brindle
