// SPDX-License-Identifier: MIT
#include "cli/CorpusSongs.h"

#include "cli/InputStream.h"

#include "brindle/platform/Ascii.h"
#include "brindle/platform/AtomicFile.h"

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <utility>

namespace brindle::cli {
namespace {

namespace fs = std::filesystem;

/// An archive in an archive in one; nobody packs songs more deeply.
constexpr std::size_t kMostArchives = 3;
constexpr const char* kTooLarge = "it cannot be read, or is larger than 64 MiB";

bool IsScoreByName(std::string_view path) {
    std::string ending(path.substr(path.size() - std::min<std::size_t>(4, path.size())));
    std::transform(ending.begin(), ending.end(), ending.begin(), Ascii::ToLower);
    return ending == ".mxl";
}

std::string BeginOf(const std::string& path) {
    constexpr std::size_t blockOfTar = 512;
    std::string begin(blockOfTar, '\0');
    std::ifstream file(path, std::ios::binary);
    file.read(begin.data(), blockOfTar);
    begin.resize(static_cast<std::size_t>(file.gcount()));
    return begin;
}

/// Whether bytes are too many for a typed song, of which each takes a hundred when it is read.
/// Scores, pages and links show what they are at their begin.
bool IsTooLongText(std::string_view bytes) {
    constexpr std::size_t mostBytes = std::size_t{1} << 20;
    const std::string_view begin = bytes.substr(0, 64);
    return bytes.size() > mostBytes && !begin.starts_with("PK") && begin.find('<') == begin.npos &&
           begin.find("://") == begin.npos;
}

/// Whether it is an archive of songs and no score in a container. `open` opens it.
template <class TOpen>
bool IsArchiveOfSongs(std::string_view path, std::string_view begin, const TOpen& open) {
    if (IsScoreByName(path) || !LooksLikeArchive(begin)) return false;
    return !begin.starts_with("PK") || !open()->IsScore();
}

std::shared_ptr<CUnpackingBudget> BudgetFor(std::uint64_t packedBytes) {
    return std::make_shared<CUnpackingBudget>(packedBytes);
}

}  // namespace

CCorpusSongs::CCorpusSongs(CCorpusFiles files, CSongOptions reading, std::optional<CDoneSongs> done,
                           bool takesAll, std::function<bool()> isEndAsked)
    : mFiles(std::move(files)),
      mReading(reading),
      mDone(std::move(done)),
      mTakesAll(takesAll),
      mIsEndAsked(std::move(isEndAsked)) {}

std::optional<CSourceOfSong> CCorpusSongs::Next() {
    while (mSongs.empty()) {
        if (mIsEndAsked()) return std::nullopt;
        if (!mArchives.empty()) {
            OpenMember();
        } else if (const auto file = mFiles.Next()) {
            mPath = file->mPath;
            OpenFile(*file);
        } else {
            return std::nullopt;
        }
    }
    CSourceOfSong song = std::move(mSongs.back());
    mSongs.pop_back();
    return song;
}

void CCorpusSongs::OpenFile(const CCorpusFile& file) {
    if (!file.mFault.empty()) return TakeFault(file.mFault, {});
    std::error_code error;
    const bool isFile = mPath != "-" && fs::is_regular_file(mPath, error);
    const auto open = [this, &error] {
        return std::make_unique<CArchive>(fs::path(mPath), BudgetFor(fs::file_size(mPath, error)));
    };
    if (isFile && IsArchiveOfSongs(mPath, BeginOf(mPath), open)) {
        mArchives.push_back({open(), {}});
        return;
    }
    if (IsDone({})) return;
    auto bytes = isFile ? ReadWholeFile(mPath, kMostBytesOfFile)
                        : ReadInputStream(mPath, kMostBytesOfFile, mIsEndAsked);
    // A stream that the user did not wait for has no fault.
    if (!bytes && mIsEndAsked()) return;
    bytes ? Take(std::move(*bytes), {}) : TakeFault(kTooLarge, {});
}

void CCorpusSongs::OpenMember() {
    COpenArchive& top = mArchives.back();
    CArchive& archive = *top.mArchive;
    if (!archive.Next()) {
        const std::string prefix = top.mPrefix;
        const std::string fault = archive.Fault();
        mArchives.pop_back();
        if (!fault.empty()) TakeFault(fault, prefix);
        return;
    }
    const std::string& name = archive.Name();
    const std::string member = top.mPrefix.empty() ? name : top.mPrefix + '/' + name;
    if (IsHiddenName(name)) return;
    if (!mTakesAll && !HasNameOfSongs(name)) {
        ++mPassedOver;
        return;
    }
    if (IsDone(member)) return;
    std::string reason;
    auto bytes = archive.Read(reason);
    bytes ? Take(std::move(*bytes), member) : TakeFault(reason, member);
}

bool CCorpusSongs::IsDone(const std::string& member) {
    const std::size_t count = mDone ? mDone->TakeAll(mPath, member) : 0;
    mSkipped += count;
    return count > 0;
}

void CCorpusSongs::TakeArchive(std::string bytes, const std::string& member) {
    if (mArchives.size() == kMostArchives) return TakeFault("archives lie too deep", member);
    const auto budget =
        mArchives.empty() ? BudgetFor(bytes.size()) : mArchives.back().mArchive->Budget();
    mArchives.push_back({std::make_unique<CArchive>(std::move(bytes), budget), member});
}

void CCorpusSongs::Take(std::string bytes, const std::string& member) {
    const auto open = [&bytes] {
        return std::make_unique<CArchive>(std::string(bytes), BudgetFor(bytes.size()));
    };
    if (IsArchiveOfSongs(member.empty() ? mPath : member, bytes, open)) {
        return TakeArchive(std::move(bytes), member);
    }
    if (IsTooLongText(bytes)) return TakeFault("it is no score, and larger than 1 MiB", member);
    std::vector<CUnreadSong> songs = SplitSongs(std::move(bytes), mReading);
    for (std::size_t number = songs.size(); number > 0; --number) {
        TakeSong({mPath, member, number, songs.size(), std::move(songs[number - 1]), {}});
    }
}

void CCorpusSongs::TakeFault(std::string fault, const std::string& member) {
    TakeSong({mPath, member, 1, 1, {}, std::move(fault)});
}

void CCorpusSongs::TakeSong(CSourceOfSong song) {
    if (mDone && mDone->Take(song.mPath, song.mMember, song.mNumber)) {
        ++mSkipped;
    } else {
        mSongs.push_back(std::move(song));
    }
}

}  // namespace brindle::cli
