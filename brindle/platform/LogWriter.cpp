// SPDX-License-Identifier: MIT
#include "brindle/platform/LogWriter.h"

#include <array>
#include <ctime>

namespace brindle {

namespace {

constexpr std::string_view kSeparator = "  \t\t\t\t\t\t\t\t\t| ";
constexpr std::size_t kRuleLength = 64;
constexpr std::size_t kAsctimeLength = 26;  // as POSIX tells, for years of four digits

}  // namespace

bool LogWriter::open(const std::string& path) {
    close();
    mFile.open(path, std::ios::out | std::ios::trunc);
    const std::string rule(kRuleLength, '-');
    append_plain(rule);
    append_plain("New log created on " + get_time());
    append_plain(rule);
    return mFile.good();
}

bool LogWriter::open_for_append(const std::string& path) {
    close();
    mFile.open(path, std::ios::out | std::ios::app);
    return mFile.good();
}

void LogWriter::close() {
    if (mFile.is_open()) mFile.close();
    mFile.clear();
}

void LogWriter::append(std::string_view text) {
    mFile << get_time() << kSeparator << text << std::endl;
}

void LogWriter::append_plain(std::string_view text) {
    mFile << text << std::endl;
}

void LogWriter::append_timestamp() {
    append_plain(get_time());
}

std::string LogWriter::get_time() {
    const std::time_t now = std::time(nullptr);
    std::tm local{};
    std::array<char, kAsctimeLength> buffer{};
    if (localtime_r(&now, &local) == nullptr || asctime_r(&local, buffer.data()) == nullptr) {
        return {};
    }
    std::string text = buffer.data();
    while (!text.empty() && text.back() == '\n') text.pop_back();
    return text;
}

}  // namespace brindle
