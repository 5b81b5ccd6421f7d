// SPDX-License-Identifier: MIT
#include "brindle/song/ReadSong.h"

#include "brindle/platform/AtomicFile.h"
#include "brindle/platform/Utf16.h"
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

/// The byte-order mark that UTF-16 has or, by where its first letters have zeros, should have.
std::string_view MarkOfUtf16(std::string_view bytes) {
    constexpr std::string_view bigEndian = "\xFE\xFF";
    constexpr std::string_view littleEndian = "\xFF\xFE";
    if (bytes.size() < 4) return {};
    const auto isZero = [&](std::size_t index) { return bytes[index] == '\0'; };
    if (bytes.starts_with(bigEndian) || (isZero(0) && !isZero(1) && isZero(2) && !isZero(3))) {
        return bigEndian;
    }
    const bool isLittle = !isZero(0) && isZero(1) && !isZero(2) && isZero(3);
    return bytes.starts_with(littleEndian) || isLittle ? littleEndian : std::string_view();
}

bool IsControl(char c) {
    constexpr std::string_view ofTexts = "\t\n\v\f\r\x1A\x1B";
    return static_cast<unsigned char>(c) < ' ' && ofTexts.find(c) == ofTexts.npos;
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

bool HasNoText(std::string_view bytes) {
    constexpr std::size_t looked = 4096;
    constexpr std::size_t fewest = 64;
    bytes = bytes.substr(0, looked);
    // Letters of old encodings are text, and a few controls get into some.
    const auto controls =
        static_cast<std::size_t>(std::count_if(bytes.begin(), bytes.end(), IsControl));
    return bytes.size() >= fewest && controls > bytes.size() / 20;
}

std::optional<std::string> SongTextFromUtf16(std::string_view bytes) {
    const std::string_view mark = MarkOfUtf16(bytes);
    if (mark.empty()) return std::nullopt;
    auto text = Utf8FromUtf16(bytes.starts_with(mark) ? std::string(bytes)
                                                      : std::string(mark).append(bytes));
    if (text && SongFormatOf(*text) == TSongFormat_MusicXml) return std::nullopt;
    return text;
}

std::vector<CSong> ReadSongs(std::string_view bytes, const CSongOptions& prefs) {
    if (const auto text = SongTextFromUtf16(bytes)) return ReadSongs(*text, prefs);
    const TSongFormat format =
        prefs.mFormat == TSongFormat_Auto ? SongFormatOf(bytes) : prefs.mFormat;
    if (SongReaders::HoldsCharts(bytes, format)) {
        return SongReaders::ReadChartLinks(bytes, format, prefs);
    }
    if (!IsScore(format) && HasNoText(bytes)) {
        return OneSong(FailedSong(format, "this is neither a text nor a score in MusicXML"));
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
