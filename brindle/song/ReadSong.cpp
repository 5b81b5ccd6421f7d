// SPDX-License-Identifier: MIT
#include "brindle/song/ReadSong.h"

#include "brindle/platform/AtomicFile.h"
#include "brindle/song/internal/SongReaders.h"

#include <algorithm>
#include <filesystem>
#include <optional>
#include <utility>

namespace brindle {

namespace {

constexpr std::size_t kMostFileBytes = std::size_t{256} << 20;

CSong FailedSong(TSongFormat format, std::string reason) {
    CSong song;
    if (format != TSongFormat_Auto) song.mFormat = format;
    song.mFaults.push_back({.mText = std::move(reason)});
    return song;
}

std::vector<CSong> OneSong(CSong song) {
    std::vector<CSong> songs;
    songs.push_back(std::move(song));
    return songs;
}

CSong ReadOneSong(std::string_view bytes, TSongFormat format, const CSongOptions& prefs) {
    switch (format) {
        case TSongFormat_MusicXml:
        case TSongFormat_CompressedMusicXml:
            return SongReaders::ReadScoreSong(bytes, format);
        case TSongFormat_RomanText:
            return SongReaders::ReadRomanSong(bytes, prefs);
        case TSongFormat_ChordText:
        case TSongFormat_EvenText:
        case TSongFormat_ChordsAboveLyrics:
        case TSongFormat_ChordPro:
        case TSongFormat_Chart:
        case TSongFormat_ChordStrings:
        case TSongFormat_ChartLink:
        case TSongFormat_ChartPage:
        case TSongFormat_Auto:
            return SongReaders::ReadSheet(bytes, format, prefs);
    }
    return FailedSong(format, "this is no form of a song");
}

std::optional<std::string> BytesOf(const std::string& path, std::string& reason) {
    std::error_code error;
    if (!std::filesystem::exists(path, error)) {
        reason = "there is no such file";
    } else if (auto bytes = ReadWholeFile(path, kMostFileBytes)) {
        return bytes;
    } else {
        reason = "the file cannot be read, or is larger than 256 MiB";
    }
    return std::nullopt;
}

std::string CountOfOthers(std::size_t count) {
    if (count == 1) return "one more song of this source is left out";
    return std::to_string(count) + " more songs of this source are left out";
}

}  // namespace

bool CSong::HasFault() const {
    return std::any_of(mFaults.begin(), mFaults.end(),
                       [](const CSongFault& fault) { return !fault.mIsNote; });
}

std::vector<CSong> ReadSongs(std::string_view bytes, const CSongOptions& prefs) {
    const TSongFormat format =
        prefs.mFormat == TSongFormat_Auto ? SongFormatOf(bytes) : prefs.mFormat;
    if (SongReaders::HoldsCharts(bytes, format)) {
        return SongReaders::ReadChartLinks(bytes, format, prefs);
    }
    if (format != TSongFormat_ChordPro) return OneSong(ReadOneSong(bytes, format, prefs));
    std::vector<CSong> songs;
    for (const SongReaders::CPartOfText& part : SongReaders::SongsOfChordPro(bytes)) {
        songs.push_back(SongReaders::ReadChordProSong(part, prefs));
    }
    return songs;
}

CSong ReadSong(std::string_view bytes, const CSongOptions& prefs) {
    std::vector<CSong> songs = ReadSongs(bytes, prefs);
    CSong song = std::move(songs.front());
    if (const std::size_t others = songs.size() - 1; others > 0) {
        song.mFaults.push_back({.mText = CountOfOthers(others), .mIsNote = true});
    }
    return song;
}

std::vector<CSong> ReadSongsFile(const std::string& path, const CSongOptions& prefs) {
    std::string reason;
    const auto bytes = BytesOf(path, reason);
    return bytes ? ReadSongs(*bytes, prefs) : OneSong(FailedSong(prefs.mFormat, reason));
}

CSong ReadSongFile(const std::string& path, const CSongOptions& prefs) {
    std::string reason;
    const auto bytes = BytesOf(path, reason);
    return bytes ? ReadSong(*bytes, prefs) : FailedSong(prefs.mFormat, reason);
}

}  // namespace brindle
