// SPDX-License-Identifier: MIT
#pragma once

#include "cli/CArchive.h"
#include "cli/CDoneSongs.h"
#include "cli/CorpusFiles.h"

#include "brindle/present/SongLines.h"

#include <cstddef>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace brindle::cli {

/// All songs of files, of folders and of archives in them, one by one, not yet read.
class CCorpusSongs {
public:
    /// `isEndAsked` is called before each file, and several times a second as long as a stream is
    /// waited for.
    CCorpusSongs(CCorpusFiles files, CSongOptions reading, std::optional<CDoneSongs> done,
                 bool takesAll, std::function<bool()> isEndAsked);

    /// The next song, or what cannot be read; nothing at the end, or when that was asked for.
    [[nodiscard]] std::optional<CSourceOfSong> Next();

    /// Songs that were done before.
    [[nodiscard]] std::size_t Skipped() const { return mSkipped; }
    /// Files and members that were left out, since their names are not those of songs.
    [[nodiscard]] std::size_t PassedOver() const { return mFiles.PassedOver() + mPassedOver; }

private:
    /// An archive that is being read, and its name inside the one around it.
    struct COpenArchive {
        std::unique_ptr<CArchive> mArchive;
        std::string mPrefix;
    };

    void OpenFile(const CCorpusFile& file);
    void OpenMember();
    [[nodiscard]] bool IsDone(const std::string& member);
    void Take(std::string bytes, const std::string& member);
    void TakeArchive(std::string bytes, const std::string& member);
    void TakeFault(std::string fault, const std::string& member);
    void TakeSong(CSourceOfSong song);

    CCorpusFiles mFiles;
    CSongOptions mReading;
    std::optional<CDoneSongs> mDone;
    bool mTakesAll;
    std::function<bool()> mIsEndAsked;
    std::string mPath;  // of the file that is being read
    std::vector<COpenArchive> mArchives;
    std::vector<CSourceOfSong> mSongs;  // the next one last
    std::size_t mSkipped = 0;
    std::size_t mPassedOver = 0;
};

}  // namespace brindle::cli
