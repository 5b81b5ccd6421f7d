// SPDX-License-Identifier: MIT
#include "cli/Input.h"

#include "cli/Message.h"

#include "brindle/analysis/ReadNumerals.h"
#include "brindle/chords/ReadChordText.h"
#include "brindle/platform/Ascii.h"
#include "brindle/platform/FileNames.h"
#include "brindle/song/ReadSong.h"
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

constexpr std::string_view kWhiteSpace = " \t\n\v\f\r";
constexpr CSignKeyLite kCMajor(CKeyEnh{0, TEnh_n}, TSignKeyType_Major);

struct CCloser {
    void operator()(std::FILE* file) const { std::fclose(file); }
};

std::optional<std::string> Unreadable(const std::string& name, std::string_view reason) {
    Fail(TStatus::BadInput, Message("{name} cannot be read: {reason}",
                                    {{"name", InputName(name)}, {"reason", reason}}));
    return std::nullopt;
}

std::optional<std::string> ReadAll(std::FILE* file, const std::string& name,
                                   std::size_t mostBytes) {
    std::string content;
    std::array<char, 1 << 16> buffer;
    while (const std::size_t count = std::fread(buffer.data(), 1, buffer.size(), file)) {
        content.append(buffer.data(), count);
        if (content.size() > mostBytes) {
            return Unreadable(name, fmt::format("it is larger than {} MiB", mostBytes >> 20));
        }
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

bool IsFolder(const std::string& path) {
    std::error_code error;
    return std::filesystem::is_directory(path, error);
}

bool IsRegularFile(const std::string& path) {
    std::error_code error;
    return std::filesystem::is_regular_file(path, error);
}

// songs/one, which a chord over a bass (C/one) or a numeral (V7/one) may look like.
bool IsPathWithoutEnding(const std::string& word) {
    const std::size_t slash = word.rfind('/');
    if (slash == word.npos || word.find("://") != word.npos) return false;
    if (IsFolder(word.substr(0, slash))) return true;
    const std::string first = word.substr(0, word.find('/'));
    const bool isOneWord = word.find_first_of(kWhiteSpace) == word.npos;
    return isOneWord && !first.empty() && Ascii::IsLetter(first.front()) &&
           ReadChordText(first).mFaultPos == 1 && !BeginsWithNumeral(first, kCMajor);
}

bool IsWebLink(const std::string& word) {
    return word.starts_with("http://") || word.starts_with("https://");
}

// Of a command that takes no songs: a file there may have the name of a chord.
bool IsNoChordButAFile(const std::string& word) {
    const bool isFile = LooksLikeFileName(word) || IsRegularFile(word) || IsFolder(word) ||
                        IsPathWithoutEnding(word) || IsWebLink(word);
    return isFile && !ReadChordText(word).mFault.empty();
}

std::optional<std::string> ReadInputs(const std::vector<std::string>& names) {
    std::string all;
    for (const std::string& name : names) {
        const auto text = ReadTextInput(name);
        if (!text) return std::nullopt;
        if (IsScore(SongFormatOf(*text))) {
            Fail(TStatus::BadInput,
                 Message("{name} is a score; {call} lists its chords",
                         {{"name", InputName(name)}, {"call", "brindle harmonies"}}));
            return std::nullopt;
        }
        all += *text + '\n';
    }
    return all;
}

}  // namespace

bool IsFileName(const std::string& word) {
    return IsRegularFile(word) || IsNoChordButAFile(word);
}

bool AreInputs(const std::vector<std::string>& words) {
    if (words.size() == 1 && words.front() == "-") return true;
    return !words.empty() && std::all_of(words.begin(), words.end(), IsNoChordButAFile);
}

std::string InputName(const std::string& path) {
    if (path.empty()) return "\"\"";
    return path == "-" ? "standard input" : Printable(path);
}

std::optional<std::string> ReadInput(const std::string& path, std::size_t mostBytes) {
    if (path == "-") return ReadAll(stdin, path, mostBytes);
    if (IsFolder(path)) {
        const std::string name = Printable(path);
        Fail(TStatus::BadInput, Message("{name} is a folder; {call} reads the songs in it",
                                        {{"name", name}, {"call", "brindle corpus " + name}}));
        return std::nullopt;
    }
    if (IsWebLink(path)) {
        Fail(TStatus::BadInput,
             Message("{name} is on the web, where nothing is read; a saved page is",
                     {{"name", Printable(path)}}));
        return std::nullopt;
    }
    const std::unique_ptr<std::FILE, CCloser> file(std::fopen(path.c_str(), "rb"));
    if (file == nullptr) return Unreadable(path, std::strerror(errno));
    return ReadAll(file.get(), path, mostBytes);
}

std::optional<std::string> ReadTextInput(const std::string& path) {
    auto text = ReadInput(path);
    if (!text) return std::nullopt;
    if (auto decoded = SongTextFromUtf16(*text)) return decoded;
    if (IsScore(SongFormatOf(*text)) || !HasNoText(*text)) return text;
    Fail(TStatus::BadInput,
         Message("{name} is neither a text nor a score in MusicXML", {{"name", InputName(path)}}));
    return std::nullopt;
}

std::string FoldAccidentals(std::string_view text) {
    std::string folded(text);
    ConvertUtf8SharpAndFlatToAscii(folded);
    return folded;
}

std::optional<std::vector<std::string>> TypedLines(const std::vector<std::string>& words) {
    if (!AreInputs(words)) return std::vector{fmt::format("{}", fmt::join(words, " "))};
    const auto text = ReadInputs(words);
    if (!text) return std::nullopt;
    auto lines = TrimmedLines(*text);
    if (!lines.empty()) return lines;
    Fail(TStatus::BadInput, Message("{name} is empty", {{"name", InputName(words.front())}}));
    return std::nullopt;
}

std::vector<std::string> WordsOf(std::string_view text) {
    return Split(text, kWhiteSpace);
}

}  // namespace brindle::cli
