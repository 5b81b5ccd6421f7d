// SPDX-License-Identifier: MIT
#include "cli/CInterrupt.h"
#include "cli/CommandLine.h"
#include "cli/CorpusProgress.h"
#include "cli/CorpusSongs.h"

#include <fmt/format.h>

#include <memory>
#include <optional>
#include <utility>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kCorpusHelp{
    "corpus",
    "Analyse many songs, a line of JSON for each",
    "  brindle corpus songs >songs.jsonl\n"
    "  brindle corpus songs --skip-done songs.jsonl >>songs.jsonl\n"
    "  brindle corpus charts.html scores.zip more.tar.gz --jobs 4 >songs.jsonl\n"
    "  brindle corpus songs | jq -r '[.Path, .Reading.SignKey.Name] | @tsv'\n"
    "\n"
    "Folders are walked, archives (zip; tar, also compressed by gzip, bzip2, xz or\n"
    "zstd) are read without being unpacked. What cannot be read has a line with the\n"
    "fault; then the exit status is 1.\n",
};

constexpr std::uint64_t kMostJobs = 1024;

struct CCorpusOptions {
    std::vector<std::string> mPaths;
    std::uint64_t mJobs = 0;
    bool mIsUnordered = false;
    bool mIsLenient = false;
    bool mTakesAll = false;
    bool mIsJson = true;
    std::string mDoneFile;
};

CCorpusSongs SongsOf(const CCorpusOptions& options, std::optional<CDoneSongs> done,
                     const CInterrupt& interrupt) {
    CSongOptions reading;
    reading.mLenient = options.mIsLenient;
    return CCorpusSongs(CCorpusFiles(options.mPaths, options.mTakesAll), reading, std::move(done),
                        options.mTakesAll, [&interrupt] { return interrupt.IsAsked(); });
}

/// Writes the lines until there are no more, the output cannot be written or the user wants an end.
TStatus WriteLines(CCorpusSongs& songs, const CCorpusOptions& options, const CInterrupt& interrupt,
                   CCorpusProgress& progress) {
    TStatus written = TStatus::Success;
    CSongLineSteps steps;
    steps.mNext = [&] { return songs.Next(); };
    steps.mTake = [&](CSongLine&& line) {
        progress.CountSong(line.mHasFault);
        written = Print(line.mText);
        return written == TStatus::Success;
    };
    steps.mPulse = [&] {
        progress.Show();
        return !interrupt.IsAsked();
    };
    WriteSongLines(steps, {.mJobs = options.mJobs, .mIsInOrder = !options.mIsUnordered});
    return written;
}

TStatus ToldEnd(const CCorpusSongs& songs, const CCorpusProgress& progress) {
    const std::size_t all = progress.Songs() + songs.Skipped();
    if (songs.PassedOver() > 0 && (all == 0 || progress.IsOnTerminal())) {
        Fail(TStatus::Success,
             fmt::format("{} files were passed over by their names; --all-files reads them",
                         songs.PassedOver()));
    }
    if (all == 0) return Fail(TStatus::BadInput, "there are no songs");
    if (progress.IsOnTerminal()) fmt::print(stderr, "{}\n", progress.Summary());
    if (progress.Faults() == 0) return TStatus::Success;
    return Fail(TStatus::BadInput,
                fmt::format("{} of {} songs cannot be read; their lines tell why",
                            progress.Faults(), progress.Songs()));
}

TStatus Corpus(const CCorpusOptions& options) {
    std::optional<CDoneSongs> done;
    if (!options.mDoneFile.empty()) {
        done = CDoneSongs::Read(options.mDoneFile);
        if (!done) return TStatus::BadInput;
    }
    const CInterrupt interrupt;
    CCorpusSongs songs = SongsOf(options, std::move(done), interrupt);
    CCorpusProgress progress;
    const TStatus written = WriteLines(songs, options, interrupt, progress);
    HideProgress();
    interrupt.EndIfAsked();
    return written == TStatus::Success ? ToldEnd(songs, progress) : written;
}

}  // namespace

void AddCorpus(CCommand& program) {
    CCommand& command = program.AddCommand(kCorpusHelp);
    const auto options = std::make_shared<CCorpusOptions>();
    command
        .AddArgument("PATH", options->mPaths,
                     "Files with songs, folders and archives; - reads one from standard input")
        .Required();
    command.AddOption("--jobs", "N", options->mJobs, "Songs at a time (default: one a core)")
        .InRange(std::uint64_t{1}, kMostJobs);
    command.AddFlag("--unordered", options->mIsUnordered,
                    "Write each line as soon as it is ready, not in the order of the songs");
    command.AddOption("--skip-done", "FILE", options->mDoneFile,
                      "Leave out the songs that have a line in FILE, an earlier output");
    command.AddFlag("--all-files", options->mTakesAll,
                    "Read files of folders and archives whatever their endings");
    command.AddFlag("--lenient", options->mIsLenient,
                    "Go on with no chord where a symbol is not understood");
    command.AddFlag("--json", options->mIsJson, "As without: the output is JSON in any case");
    command.OnCall([options] { return Corpus(*options); });
}

}  // namespace brindle::cli
