// SPDX-License-Identifier: MIT
#include "cli/CDoneSongs.h"

#include "cli/Output.h"

#include "brindle/platform/JsonString.h"

#include <fmt/format.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <functional>
#include <limits>
#include <nlohmann/json.hpp>
#include <tuple>
#include <utility>

namespace brindle::cli {
namespace {

/// A file that is read line by line, with one line in memory.
class CLineFile {
public:
    explicit CLineFile(std::FILE* file) : mFile(file) {}
    CLineFile(const CLineFile&) = delete;
    CLineFile& operator=(const CLineFile&) = delete;
    ~CLineFile() {
        std::free(mText);
        std::fclose(mFile);
    }

    /// A whole line without its end.
    std::optional<std::string_view> NextLine() {
        const ssize_t length = getline(&mText, &mRoom, mFile);
        if (length < 0) return std::nullopt;
        const std::string_view line(mText, static_cast<std::size_t>(length));
        mHasHalfLine = !line.ends_with('\n');
        if (mHasHalfLine) return std::nullopt;
        mWholeBytes += length;
        return line.substr(0, line.size() - 1);
    }
    [[nodiscard]] bool HasFailed() const { return std::ferror(mFile) != 0; }
    [[nodiscard]] bool HasHalfLine() const { return mHasHalfLine; }
    [[nodiscard]] off_t WholeBytes() const { return mWholeBytes; }
    [[nodiscard]] bool IsStandardOutput() const {
        struct stat read {};
        struct stat written {};
        return fstat(fileno(mFile), &read) == 0 && fstat(STDOUT_FILENO, &written) == 0 &&
               read.st_dev == written.st_dev && read.st_ino == written.st_ino;
    }

private:
    std::FILE* mFile;
    char* mText = nullptr;
    std::size_t mRoom = 0;
    off_t mWholeBytes = 0;
    bool mHasHalfLine = false;
};

// As its line tells it: no text of JSON has an end of line in it, or bytes that are no UTF-8.
std::uint64_t KeyOfSource(std::string_view path, std::string_view member) {
    return std::hash<std::string>{}(JsonString(path) + '\n' + JsonString(member));
}

// What a line has in front of the song, and no more of it: most of the line are its chords.
nlohmann::json HeadOfLine(std::string_view line) {
    const std::size_t end = line.find(",\"Title\":");
    if (end == line.npos || !line.ends_with('}')) return nullptr;
    return ParseJson(std::string(line.substr(0, end)) + '}');
}

/// A whole number from 1; 0 where there is none.
std::uint32_t PlaceIn(const nlohmann::json& head, const char* name) {
    const auto value = head.value(name, nlohmann::json());
    if (!value.is_number_unsigned()) return 0;
    const auto number = value.get<std::uint64_t>();
    return number <= std::numeric_limits<std::uint32_t>::max() ? static_cast<std::uint32_t>(number)
                                                               : 0;
}

std::optional<CDoneSongs> Refused(const std::string& path, std::string_view reason) {
    Fail(TStatus::BadInput, fmt::format("--skip-done: {} {}", Printable(path), reason));
    return std::nullopt;
}

}  // namespace

std::optional<CDoneSongs> CDoneSongs::Read(const std::string& path) {
    std::FILE* const opened = std::fopen(path.c_str(), "rb");
    if (opened == nullptr) {
        return Refused(path, fmt::format("cannot be read: {}", std::strerror(errno)));
    }
    CLineFile file(opened);
    CDoneSongs done;
    while (const auto line = file.NextLine()) {
        if (!done.AddLine(*line)) return Refused(path, "is no output of brindle corpus");
    }
    if (file.HasFailed()) {
        return Refused(path, fmt::format("cannot be read: {}", std::strerror(errno)));
    }
    if (file.HasHalfLine() && file.IsStandardOutput()) {
        if (ftruncate(STDOUT_FILENO, file.WholeBytes()) != 0) {
            return Refused(path, "ends in the midst of a line that cannot be cut off");
        }
    } else if (file.HasHalfLine()) {
        (void)Refused(path, "ends in the midst of a line; that song is analysed again");
    }
    done.Sort();
    return done;
}

void CDoneSongs::Sort() {
    std::stable_sort(mSongs.begin(), mSongs.end(), [](const CSongKey& a, const CSongKey& b) {
        return std::tie(a.mSource, a.mNumber) < std::tie(b.mSource, b.mNumber);
    });
}

bool CDoneSongs::AddLine(std::string_view line) {
    const nlohmann::json head = HeadOfLine(line);
    if (!head.is_object()) return false;
    const auto path = head.value("Path", nlohmann::json());
    const auto member = head.value("Member", nlohmann::json());
    const std::uint32_t number = PlaceIn(head, "Number");
    const std::uint32_t count = PlaceIn(head, "Songs");
    const bool isMember = member.is_string();
    if (!path.is_string() || !(isMember || member.is_null()) || number == 0 || count == 0) {
        return false;
    }
    mSongs.push_back(
        {KeyOfSource(path.get<std::string>(), isMember ? member.get<std::string>() : std::string()),
         number, count});
    return true;
}

CDoneSongs::CSongKey* CDoneSongs::Find(std::uint64_t source, std::size_t number) {
    const auto isBefore = [&](const CSongKey& key, std::size_t wanted) {
        return key.mSource != source ? key.mSource < source : key.mNumber < wanted;
    };
    auto song = std::lower_bound(mSongs.begin(), mSongs.end(), number, isBefore);
    for (; song != mSongs.end() && song->mSource == source && song->mNumber == number; ++song) {
        if (song->mCount > 0) return &*song;
    }
    return nullptr;
}

std::size_t CDoneSongs::TakeAll(std::string_view path, std::string_view member) {
    const std::uint64_t source = KeyOfSource(path, member);
    const CSongKey* const first = Find(source, 1);
    if (first == nullptr) return 0;
    const std::size_t count = first->mCount;
    for (std::size_t number = 2; number <= count; ++number) {
        if (Find(source, number) == nullptr) return 0;
    }
    for (std::size_t number = 1; number <= count; ++number) Find(source, number)->mCount = 0;
    return count;
}

bool CDoneSongs::Take(std::string_view path, std::string_view member, std::size_t number) {
    CSongKey* const song = Find(KeyOfSource(path, member), number);
    if (song == nullptr) return false;
    song->mCount = 0;
    return true;
}

}  // namespace brindle::cli
