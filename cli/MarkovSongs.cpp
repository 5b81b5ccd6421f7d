// SPDX-License-Identifier: MIT
#include "cli/MarkovSongs.h"

#include "cli/FaultMessage.h"
#include "cli/Input.h"
#include "cli/Message.h"
#include "cli/Progress.h"

#include "brindle/platform/AtomicFile.h"
#include "brindle/present/LearnedText.h"
#include "brindle/song/BuiltInSongs.h"
#include "brindle/song/FindSongFiles.h"
#include "brindle/song/ReadSong.h"
#include "brindle/song/SongModelFile.h"
#include "brindle/song/SongStyles.h"

#include <fmt/format.h>

#include <algorithm>
#include <filesystem>

namespace brindle::cli {
namespace {

/// The songs of a style. Nothing when there are none; then it has been told what styles there are.
std::optional<CSongModel> OfStyle(const CSongModel& model, const std::string& style) {
    if (style.empty()) return model;
    auto ofStyle = ModelOfStyle(model, style);
    if (ofStyle) return ofStyle;
    const auto styles = StylesOf(model);
    Fail(TStatus::BadUsage,
         fmt::format("--style: the model has no songs of the style {}; it has {}", Printable(style),
                     styles.empty() ? "none" : fmt::format("{}", fmt::join(styles, ", "))));
    return std::nullopt;
}

/// A song without a title has the name of its file.
void TakeTitle(const std::string& path, CSong& song) {
    if (song.mTitle.empty()) song.mTitle = std::filesystem::path(path).stem().string();
}

/// The songs of a file, or of standard input for "-".
std::vector<CSong> SongsOf(const std::string& path, const CSongOptions& reading) {
    if (path != "-") return ReadSongsFile(path, reading);
    const auto bytes = ReadInput(path);
    return bytes ? ReadSongs(*bytes, reading) : std::vector<CSong>();
}

}  // namespace

std::optional<CSongModel> ReadSongModelFile(const std::string& path, const std::string& style) {
    if (path.empty() || path == kBuiltInName) return OfStyle(BuiltInSongModel(), style);
    const auto text = ReadInput(path);
    if (!text) return std::nullopt;
    CSongModelReading reading = ReadSongModel(*text);
    if (reading.mFault.empty()) return OfStyle(reading.mModel, style);
    Fail(TStatus::BadInput,
         fmt::format("{} {}; brindle markov learn makes one", InputName(path), reading.mFault));
    return std::nullopt;
}

CTaughtFiles TeachFiles(const std::vector<std::string>& paths, double beatsPerBar) {
    CTaughtFiles taught;
    CSongOptions reading;
    reading.mBeatsPerBar = beatsPerBar;
    const std::vector<CFoundFile> files = FindSongFiles(paths);
    CProgress progress(files.size());
    for (const CFoundFile& file : files) {
        progress.Step(file.mPath);
        std::size_t learned = 0;
        std::string fault = "there are no chords in it";
        for (CSong& song : SongsOf(file.mPath, reading)) {
            if (song.HasFault()) fault = song.mFaults.front().mText;
            TakeTitle(file.mPath, song);
            CTaughtSong one = TeachSong(song);
            if (song.HasFault() || one.mChords.empty()) continue;
            taught.mSongs.push_back(std::move(one));
            ++learned;
        }
        taught.mFiles += learned > 0 ? 1 : 0;
        if (learned > 0) continue;
        Fail(TStatus::BadInput, Message("{name} was left out: {reason}",
                                        {{"name", InputName(file.mPath)},
                                         {"reason", Printable(FaultMessage(fault))}}));
        taught.mIsNamedFileUnread = taught.mIsNamedFileUnread || file.mIsNamed;
    }
    return taught;
}

TStatus MarkovLearnSongs(const CLearnSongsOptions& options) {
    CTaughtFiles taught = TeachFiles(options.mFiles, options.mBeatsPerBar);
    if (taught.mSongs.empty())
        return Fail(TStatus::BadInput, Message("there was nothing to learn"));
    if (options.mWithBuiltIn) {
        for (const CSong& song : BuiltInSongs()) taught.mSongs.push_back(TeachSong(song));
    }
    const CSongModel model(std::move(taught.mSongs));
    if (!WriteFileAtomically(options.mModel, SongModelText(model))) {
        return FailToWrite(options.mModel);
    }
    const TStatus printed = Print(options.mJson ? LearnedSongsJson(model, taught.mFiles)
                                                : LearnedSongsText(model, taught.mFiles));
    return taught.mIsNamedFileUnread ? TStatus::BadInput : printed;
}

}  // namespace brindle::cli
