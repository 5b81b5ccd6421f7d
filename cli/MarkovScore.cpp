// SPDX-License-Identifier: MIT
#include "cli/MarkovSongs.h"

#include "brindle/present/SongScoresText.h"

#include <memory>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kScoreHelp{
    "score",
    "Measure in bits per chord how well a model foretells songs",
    "  brindle markov score model.json song.musicxml songs/\n"
    "  brindle markov score built-in songs/\n"
    "\n"
    "Songs that the model has learned are foretold without them. Fewer bits are better;\n"
    "the table compares histories of 1 to 5 chords, chords told by their keys and not.\n",
};

struct CScoreOptions {
    std::string mModel;
    std::vector<std::string> mFiles;
    std::string mStyle;
    double mBeatsPerBar = 4.0;
    CFormatOptions mFormat;
};

TStatus MarkovScore(const CScoreOptions& options) {
    const auto model = ReadSongModelFile(options.mModel, options.mStyle);
    if (!model) return TStatus::BadInput;
    // Without songs those of the model itself.
    CTaughtFiles taught = TeachFiles(options.mFiles, options.mBeatsPerBar);
    if (options.mFiles.empty()) taught.mSongs = model->Songs();
    if (taught.mSongs.empty()) return Fail(TStatus::BadInput, "there is no song to foretell");
    const std::vector<COrderScores> scores = ScoresByOrder(*model, taught.mSongs);
    const std::size_t songs = taught.mSongs.size();
    const TStatus printed = Print(options.mFormat.Format() == TFormat::Json
                                      ? SongScoresJson(scores, songs)
                                      : SongScoresText(scores, songs, PaintOfOutput()));
    return taught.mIsNamedFileUnread ? TStatus::BadInput : printed;
}

}  // namespace

void AddMarkovScore(CCommand& markov) {
    CCommand& command = markov.AddCommand(kScoreHelp);
    const auto options = std::make_shared<CScoreOptions>();
    command.AddArgument("MODEL", options->mModel, "Model file of songs, or built-in").Required();
    command.AddArgument("SONGS", options->mFiles,
                        "Files and folders (default: the songs of the model)");
    command.AddOption("--style", "STYLE", options->mStyle, "Only the songs of this style learned");
    command
        .AddOption("--beats-per-bar", "BEATS", options->mBeatsPerBar,
                   "Length of a bar of chord texts in beats (default: 4)")
        .InRange(1.0, 64.0);
    options->mFormat.AddTo(command, {"text", "json"});
    command.OnCall([options] { return MarkovScore(*options); });
}

}  // namespace brindle::cli
