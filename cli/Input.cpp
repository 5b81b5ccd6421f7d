// SPDX-License-Identifier: MIT
#include "cli/Input.h"

#include "brindle/chords/ReadChordText.h"
#include "brindle/platform/FileNames.h"
#include "brindle/theory/KeyNames.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <cstdio>
#include <cstring>
#include <filesystem>
#include <memory>
#include <system_error>

namespace brindle::cli {
namespace {

// A song has a few kilobytes; what is larger than this is no chord text but a mistake.
constexpr std::size_t kMaxInputBytes = std::size_t{64} << 20;

constexpr std::string_view kWhiteSpace = " \t\n\v\f\r";

struct CCloser {
    void operator()(std::FILE* file) const { std::fclose(file); }
};

std::optional<std::string> Unreadable(const std::string& name, std::string_view reason) {
    Fail(TStatus::BadInput, fmt::format("{} cannot be read: {}", Printable(name), reason));
    return std::nullopt;
}

std::optional<std::string> ReadAll(std::FILE* file, const std::string& name) {
    std::string content;
    std::array<char, 1 << 16> buffer;
    while (const std::size_t count = std::fread(buffer.data(), 1, buffer.size(), file)) {
        content.append(buffer.data(), count);
        if (content.size() > kMaxInputBytes) return Unreadable(name, "it is larger than 64 MiB");
    }
    if (std::ferror(file) != 0) return Unreadable(name, std::strerror(errno));
    return content;
}

std::vector<std::string> Split(std::string_view text, std::string_view separators) {
    std::vector<std::string> pieces;
    while (true) {
        const std::size_t begin = text.find_first_not_of(separators);
        if (begin == text.npos) return pieces;
        text.remove_prefix(begin);
        pieces.emplace_back(text.substr(0, text.find_first_of(separators)));
        text.remove_prefix(pieces.back().size());
    }
}

std::vector<std::string> TrimmedLines(std::string_view text) {
    std::vector<std::string> lines;
    for (const std::string& line : Split(text, "\n")) {
        const std::size_t begin = line.find_first_not_of(kWhiteSpace);
        if (begin == line.npos) continue;
        lines.push_back(line.substr(begin, line.find_last_not_of(kWhiteSpace) + 1 - begin));
    }
    return lines;
}

// Of a command that takes no songs: a file there may have the name of a chord.
bool IsNoChordButAFile(const std::string& word) {
    return LooksLikeFileName(word) && !ReadChordText(word).mFault.empty();
}

// What a song has between its symbols, and what is no symbol itself.
bool IsBarLineOrHold(const std::string& word) {
    return !word.empty() && (word == "." || word.find_first_not_of("|:") == word.npos);
}

std::optional<std::string> ReadInputs(const std::vector<std::string>& names) {
    std::string all;
    for (const std::string& name : names) {
        const auto text = ReadInput(name);
        if (!text) return std::nullopt;
        all += *text + '\n';
    }
    return all;
}

}  // namespace

bool IsFileName(const std::string& word) {
    std::error_code error;
    if (std::filesystem::is_regular_file(word, error)) return true;
    return IsNoChordButAFile(word);
}

bool AreInputs(const std::vector<std::string>& words) {
    if (words.size() == 1 && words.front() == "-") return true;
    return !words.empty() && std::all_of(words.begin(), words.end(), IsNoChordButAFile);
}

std::string InputName(const std::string& path) {
    return path == "-" ? "standard input" : Printable(path);
}

std::optional<std::string> ReadInput(const std::string& path) {
    if (path == "-") return ReadAll(stdin, InputName(path));
    const std::unique_ptr<std::FILE, CCloser> file(std::fopen(path.c_str(), "rb"));
    if (file == nullptr) return Unreadable(path, std::strerror(errno));
    return ReadAll(file.get(), path);
}

std::optional<std::string> TextFromWords(const std::vector<std::string>& words) {
    if (AreInputs(words)) return ReadInputs(words);
    return fmt::format("{}", fmt::join(words, " "));
}

std::string FoldAccidentals(std::string_view text) {
    std::string folded(text);
    ConvertUtf8SharpAndFlatToAscii(folded);
    return folded;
}

std::optional<std::vector<std::string>> TypedLines(const std::vector<std::string>& words) {
    const auto text = TextFromWords(words);
    if (!text) return std::nullopt;
    return AreInputs(words) ? TrimmedLines(*text) : std::vector<std::string>{*text};
}

std::optional<std::vector<std::string>> TypedSongLines(const std::vector<std::string>& words) {
    if (words.size() != 1 || !IsFileName(words.front())) return TypedLines(words);
    const auto text = ReadInput(words.front());
    if (!text) return std::nullopt;
    return TrimmedLines(*text);
}

std::vector<std::string> WordsOf(std::string_view text) {
    return Split(text, kWhiteSpace);
}

std::optional<std::vector<std::string>> TypedSymbols(const std::vector<std::string>& words) {
    std::vector<std::string> symbols = words;
    if (AreInputs(words)) {
        const auto text = ReadInputs(words);
        if (!text) return std::nullopt;
        symbols = WordsOf(*text);
    }
    std::erase_if(symbols, IsBarLineOrHold);
    if (!symbols.empty()) return symbols;
    const bool isOneFile = words.size() == 1 && AreInputs(words);
    Fail(TStatus::BadInput,
         fmt::format("{} no chord symbols",
                     isOneFile ? InputName(words.front()) + " has" : std::string("there are")));
    return std::nullopt;
}

}  // namespace brindle::cli
