// SPDX-License-Identifier: MIT
// Lines up to an empty one are the words of a command line, the rest is its standard input. A call
// that fails says so, and no output holds control characters of the input.

#include "cli/Program.h"

#include <stdlib.h>
#include <unistd.h>

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <string>
#include <string_view>
#include <vector>

namespace {

using brindle::cli::TStatus;

void Require(bool holds) {
    if (!holds) std::abort();
}

// In a folder that is no longer there no file can be found or made.
bool LeaveAllFolders() {
    char folder[] = "/tmp/brindle-fuzz-XXXXXX";
    Require(mkdtemp(folder) != nullptr && chdir(folder) == 0 && rmdir(folder) == 0);
    return setenv("HOME", "/nonexistent", 1) == 0;
}

// A word that may lead to a file from there.
bool IsPath(std::string_view word) {
    if (word.find("..") != word.npos) return true;
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

bool HasControls(std::string_view text) {
    for (const char c : text) {
        if ((static_cast<unsigned char>(c) < 0x20 && c != '\n' && c != '\t') || c == 0x7F) {
            return true;
        }
    }
    return false;
}

void Run(std::vector<std::string>& words, std::string_view input) {
    std::vector<char*> arguments;
    for (std::string& word : words) arguments.push_back(word.data());
    arguments.push_back(nullptr);
    std::string bytes(input);
    bytes += '\n';  // there is no stream of no bytes
    std::FILE* const file = fmemopen(bytes.data(), bytes.size(), "r");
    std::FILE* const before = stdin;
    stdin = file;
    {
        CCapture output(stdout);
        CCapture errors(stderr);
        const TStatus status =
            brindle::cli::RunProgram(static_cast<int>(words.size()), arguments.data());
        if (status != TStatus::Success) Require(errors.Text().starts_with("brindle: "));
        Require(!HasControls(errors.Text()));
    }
    stdin = before;
    std::fclose(file);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    constexpr std::size_t kMostBytes = 1024;
    if (size > kMostBytes) return 0;
    static const bool isAway = LeaveAllFolders();
    std::vector<std::string> words{"brindle"};
    std::string_view rest(reinterpret_cast<const char*>(data), size);
    while (isAway && !rest.empty() && rest.front() != '\n') {
        const std::string_view word = rest.substr(0, rest.find('\n'));
        if (IsPath(word) || word.find('\0') != word.npos) return 0;
        words.emplace_back(word);
        rest.remove_prefix(std::min(rest.size(), word.size() + 1));
    }
    Run(words, rest.substr(std::min<std::size_t>(rest.size(), 1)));
    return 0;
}
