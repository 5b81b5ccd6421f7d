// SPDX-License-Identifier: MIT
#pragma once

#include "cli/CCommand.h"
#include "cli/CommandLine.h"

#include "brindle/song/CSongModel.h"

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

/// What the commands of `brindle markov` share that work with models of songs.
namespace brindle::cli {

/// Stands for the built-in model where a model file is wanted.
inline constexpr const char* kBuiltInName = "built-in";

/// A model of songs: the file, or the built-in one for no file or for its name. With a style, only
/// the songs of that. Nothing when there is none; then the error has been printed.
[[nodiscard]] std::optional<CSongModel> ReadSongModelFile(const std::string& path,
                                                          const std::string& style);

/// The options of `generate` that are about songs.
struct CWriteOptions {
    std::string mModel;
    std::string mStyle;
    std::string mKey = "C major";
    std::string mForm;
    std::uint64_t mBars = 0;
    std::string mSheet;
    std::string mBegins;
    std::string mEnds;
    std::string mContains;
    std::string mNever;
    double mMostQuoted = 4.0;
    bool mShowQuotes = false;

    /// Whether one of them was told, the model apart.
    [[nodiscard]] bool AreTold() const;
    void AddTo(CCommand& command);
};

/// What `generate` needs beside them.
struct CWriteSettings {
    std::uint64_t mOrder = CSongModel::kLongestHistory;
    int mBeatsPerBar = 4;
    std::optional<std::uint64_t> mSeed;
    std::optional<std::string> mMidi;
    double mTempo = 100.0;
    TFormat mFormat = TFormat::Text;
};

/// Writes a song and prints it.
[[nodiscard]] TStatus MarkovWrite(const CWriteOptions& options, const CWriteSettings& settings);

/// Learns songs into a file.
struct CLearnSongsOptions {
    std::vector<std::string> mFiles;
    std::string mModel;
    double mBeatsPerBar = 4.0;
    bool mWithBuiltIn = false;
    bool mJson = false;
};
[[nodiscard]] TStatus MarkovLearnSongs(const CLearnSongsOptions& options);

/// Songs of files and folders as a model learns them. Files that cannot be read are told, and are
/// an error if they were named.
struct CTaughtFiles {
    std::vector<CTaughtSong> mSongs;
    std::size_t mFiles = 0;
    bool mIsNamedFileUnread = false;
};
[[nodiscard]] CTaughtFiles TeachFiles(const std::vector<std::string>& paths, double beatsPerBar);

void AddMarkovNext(CCommand& markov);
void AddMarkovScore(CCommand& markov);
void AddMarkovListSongs(CCommand& markov);

}  // namespace brindle::cli
