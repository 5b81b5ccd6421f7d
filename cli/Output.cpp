// SPDX-License-Identifier: MIT
#include "cli/Output.h"

#include "cli/Message.h"

#include <fmt/format.h>
#include <sys/ioctl.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <cstring>

namespace brindle::cli {
namespace {

constinit bool isProgressShown = false;

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

void ShowProgress(std::string_view line) {
    fmt::print(stderr, "\r\x1B[K{}", line);
    std::fflush(stderr);
    isProgressShown = true;
}

void HideProgress() {
    if (isProgressShown) fmt::print(stderr, "\r\x1B[K");
    isProgressShown = false;
}

TStatus Fail(TStatus status, std::string_view message) {
    HideProgress();
    fmt::print(stderr, "brindle: {}\n", PrintableLines(message));
    return status;
}

TStatus FailAt(TStatus status, std::string_view message, std::string_view input,
               std::size_t column) {
    if (input.find_first_not_of(" \t\r\n") == input.npos) return Fail(status, message);
    HideProgress();
    const std::string before = Printable(input.substr(0, column));
    fmt::print(stderr, "brindle: {}\n  {}\n  {}^\n", PrintableLines(message), Printable(input),
               std::string(CountCharacters(before), ' '));
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
    if (isatty(STDOUT_FILENO) == 1) HideProgress();
    const bool written = std::fwrite(text.data(), 1, text.size(), stdout) == text.size();
    if (written && std::fflush(stdout) == 0) return TStatus::Success;
    return Fail(TStatus::BadInput, Message("the output cannot be written: {reason}",
                                           {{"reason", std::strerror(errno)}}));
}

TStatus FailToWrite(const std::string& path) {
    const int reason = errno;
    return Fail(TStatus::BadInput,
                Message("{name} cannot be written: {reason}",
                        {{"name", Printable(path)}, {"reason", std::strerror(reason)}}));
}

CPaint PaintOfOutput() {
    return CPaint(WantsColor());
}

std::size_t WidthOfOutput() {
    constexpr std::size_t usual = 80;
    winsize size{};
    if (isatty(STDOUT_FILENO) != 1) return usual;
    if (ioctl(STDOUT_FILENO, TIOCGWINSZ, &size) != 0 || size.ws_col == 0) return usual;
    return size.ws_col;
}

}  // namespace brindle::cli
