// SPDX-License-Identifier: MIT
#include "cli/Output.h"

#include "brindle/platform/Utf8.h"

#include <fmt/format.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <cstring>

namespace brindle::cli {
namespace {

constexpr std::string_view kReplacement = "\xEF\xBF\xBD";  // U+FFFD

bool IsControl(std::string_view character) {
    const auto lead = static_cast<unsigned char>(character[0]);
    if (character.size() == 1) return lead < 0x20 || lead == 0x7F;
    // U+0080 to U+009F, which some terminals obey.
    if (lead == 0xC2) return static_cast<unsigned char>(character[1]) < 0xA0;
    // U+FFFE and U+FFFF, which XML does not allow.
    return character == "\xEF\xBF\xBE" || character == "\xEF\xBF\xBF";
}

bool BeginsCharacter(char c) {
    return (static_cast<unsigned char>(c) & 0xC0) != 0x80;
}

// A message may repeat what was typed, and have several lines.
std::string PrintableLines(std::string_view message) {
    std::string printable;
    while (true) {
        const std::size_t end = message.find('\n');
        printable += Printable(message.substr(0, end));
        if (end == message.npos) return printable;
        printable += '\n';
        message.remove_prefix(end + 1);
    }
}

bool WantsColor() {
    const char* const noColor = std::getenv("NO_COLOR");
    if (noColor != nullptr && *noColor != '\0') return false;
    const char* const terminal = std::getenv("TERM");
    if (terminal != nullptr && std::string_view(terminal) == "dumb") return false;
    return isatty(STDOUT_FILENO) == 1;
}

}  // namespace

TStatus Fail(TStatus status, std::string_view message) {
    fmt::print(stderr, "brindle: {}\n", PrintableLines(message));
    return status;
}

TStatus FailAt(TStatus status, std::string_view message, std::string_view input,
               std::size_t column) {
    const std::string before = Printable(input.substr(0, column));
    fmt::print(stderr, "brindle: {}\n  {}\n  {}^\n", PrintableLines(message), Printable(input),
               std::string(Width(before), ' '));
    return status;
}

TStatus FailAtCharacter(TStatus status, std::string_view message, std::string_view input,
                        std::size_t column) {
    constexpr std::size_t kShownBefore = 60;
    constexpr std::size_t kShownBehind = 40;
    const std::size_t before = column > 0 ? column - 1 : 0;
    const std::size_t hidden = before > kShownBefore ? before - kShownBefore : 0;
    input.remove_prefix(FirstCharacters(input, hidden).size());
    const std::string shown = FirstCharacters(input, before - hidden + kShownBehind);
    return FailAt(status, message, shown, FirstCharacters(shown, before - hidden).size());
}

TStatus Print(std::string_view text) {
    const bool written = std::fwrite(text.data(), 1, text.size(), stdout) == text.size();
    if (written && std::fflush(stdout) == 0) return TStatus::Success;
    return Fail(TStatus::BadInput,
                fmt::format("the output cannot be written: {}", std::strerror(errno)));
}

std::string Printable(std::string_view text) {
    std::string printable;
    printable.reserve(text.size());
    while (!text.empty()) {
        const std::size_t length = Utf8Length(text);
        const std::string_view character = text.substr(0, length == 0 ? 1 : length);
        const bool isFine = length > 0 && !IsControl(character);
        printable += isFine ? character : kReplacement;
        text.remove_prefix(character.size());
    }
    return printable;
}

std::size_t Width(std::string_view text) {
    return static_cast<std::size_t>(std::count_if(text.begin(), text.end(), BeginsCharacter));
}

std::string FirstCharacters(std::string_view text, std::size_t count) {
    std::size_t begun = 0;
    const auto* const end = std::find_if(text.begin(), text.end(), [&](char c) {
        begun += BeginsCharacter(c);
        return begun > count;
    });
    return {text.begin(), end};
}

std::string PadRight(std::string_view text, std::size_t width) {
    const std::size_t used = Width(text);
    return std::string(text) + std::string(used < width ? width - used : 0, ' ');
}

std::string PadLeft(std::string_view text, std::size_t width) {
    const std::size_t used = Width(text);
    return std::string(used < width ? width - used : 0, ' ') + std::string(text);
}

std::string ShortNumber(double number) {
    std::string text = fmt::format("{:.3f}", number);
    text.erase(text.find_last_not_of('0') + 1);
    if (!text.empty() && text.back() == '.') text.pop_back();
    return text;
}

CPaint::CPaint() : mColored(WantsColor()) {}

std::string CPaint::Strong(std::string_view text) const {
    return Wrapped("1", text);
}

std::string CPaint::Accent(std::string_view text) const {
    return Wrapped("36", text);
}

std::string CPaint::Faint(std::string_view text) const {
    return Wrapped("2", text);
}

std::string CPaint::Wrapped(std::string_view code, std::string_view text) const {
    if (!mColored) return std::string(text);
    return fmt::format("\x1B[{}m{}\x1B[0m", code, text);
}

}  // namespace brindle::cli
