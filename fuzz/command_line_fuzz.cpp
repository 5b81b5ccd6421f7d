// SPDX-License-Identifier: MIT
// Lines up to an empty one are the words of a command line, the rest is its standard input. A call
// that fails says so, no message holds control characters of the input, and JSON is JSON. No file
// is read or written: the process stands in a folder that is no longer there, and words that lead
// elsewhere are left out.

#include "cli/Program.h"

#include <stdlib.h>
#include <unistd.h>

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <nlohmann/json.hpp>
#include <string>
#include <string_view>
#include <vector>

namespace {

using brindle::cli::TStatus;

constexpr std::size_t kMostBytes = 1024;

void Require(bool holds) {
    if (!holds) std::abort();
}

// There no file can be found or made, also not by the user who may do everything.
bool LeaveAllFolders() {
    char folder[] = "/tmp/brindle-fuzz-XXXXXX";
    Require(mkdtemp(folder) != nullptr && chdir(folder) == 0 && rmdir(folder) == 0);
    for (const char* const name : {"HOME", "TMPDIR"}) Require(setenv(name, "/dev/null/no", 1) == 0);
    return setenv("LC_ALL", "C", 1) == 0;
}

// A word that may lead to a file from there, or that ends early.
bool IsLeftOut(std::string_view word) {
    if (word.find("..") != word.npos || word.find('\0') != word.npos) return true;
    return word.find('/') != word.npos && (word.front() == '/' || word.front() == '-');
}

/// What a stream of the C library gets meanwhile.
class CCapture {
public:
    explicit CCapture(std::FILE*& stream)
        : mStream(stream), mBefore(stream), mFile(open_memstream(&mBytes, &mSize)) {
        Require(mFile != nullptr);
        stream = mFile;
    }
    ~CCapture() {
        mStream = mBefore;
        std::fclose(mFile);
        std::free(mBytes);
    }
    CCapture(const CCapture&) = delete;
    CCapture& operator=(const CCapture&) = delete;

    std::string_view Text() {
        std::fflush(mFile);
        return {mBytes, mSize};
    }

private:
    std::FILE*& mStream;
    std::FILE* mBefore;
    char* mBytes = nullptr;
    std::size_t mSize = 0;
    std::FILE* mFile;
};

/// Standard input with these bytes and the end of a line.
class CInput {
public:
    explicit CInput(std::string_view bytes) : mBytes(bytes), mBefore(stdin) {
        mBytes += '\n';  // there is no stream of no bytes
        stdin = fmemopen(mBytes.data(), mBytes.size(), "r");
        Require(stdin != nullptr);
    }
    ~CInput() {
        std::fclose(stdin);
        stdin = mBefore;
    }
    CInput(const CInput&) = delete;
    CInput& operator=(const CInput&) = delete;

private:
    std::string mBytes;
    std::FILE* mBefore;
};

bool HasControls(std::string_view text) {
    return std::any_of(text.begin(), text.end(), [](char c) {
        return (static_cast<unsigned char>(c) < 0x20 && c != '\n' && c != '\t') || c == 0x7F;
    });
}

// One text, or one on each line.
bool IsJson(std::string_view text) {
    using nlohmann::json;
    if (json::accept(text)) return true;
    while (!text.empty()) {
        const std::size_t end = std::min(text.find('\n'), text.size());
        if (!json::accept(text.substr(0, end))) return false;
        text.remove_prefix(std::min(end + 1, text.size()));
    }
    return true;
}

bool AsksForJson(const std::vector<std::string>& words) {
    const auto has = [&](const char* word) {
        return std::find(words.begin(), words.end(), word) != words.end();
    };
    return has("--json") && !has("--") && !has("--help") && !has("-h") && !has("--version");
}

void Run(std::vector<std::string>& words, std::string_view bytes) {
    std::vector<char*> arguments;
    for (std::string& word : words) arguments.push_back(word.data());
    arguments.push_back(nullptr);
    const CInput input(bytes);
    CCapture output(stdout);
    CCapture errors(stderr);
    const TStatus status =
        brindle::cli::RunProgram(static_cast<int>(words.size()), arguments.data());
    const bool isDone = status == TStatus::Success;
    Require(isDone || errors.Text().starts_with("brindle: "));
    Require(!HasControls(errors.Text()));
    Require(!isDone || !AsksForJson(words) || IsJson(output.Text()));
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size > kMostBytes) return 0;
    static const bool isAway = LeaveAllFolders();
    Require(isAway);
    std::vector<std::string> words{"brindle"};
    std::string_view rest(reinterpret_cast<const char*>(data), size);
    while (!rest.empty() && rest.front() != '\n') {
        const std::string_view word = rest.substr(0, rest.find('\n'));
        if (IsLeftOut(word)) return 0;
        words.emplace_back(word);
        rest.remove_prefix(std::min(rest.size(), word.size() + 1));
    }
    Run(words, rest.substr(std::min<std::size_t>(rest.size(), 1)));
    return 0;
}
