// SPDX-License-Identifier: MIT
#include "cli/ChordSources.h"
#include "cli/FaultMessage.h"
#include "cli/Input.h"
#include "cli/Markov.h"
#include "cli/MarkovSongs.h"
#include "cli/Message.h"
#include "cli/Progress.h"

#include "brindle/present/LearnedText.h"
#include "brindle/song/FindSongFiles.h"
#include "brindle/song/LearnSong.h"

#include <filesystem>
#include <memory>
#include <utility>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kMarkovLearnHelp{
    "learn",
    "Learn which chord follows which in lead sheets, chord strings and chord texts",
    "  brindle markov learn -o model.json song.musicxml songs/\n"
    "  brindle markov learn --with-built-in -o model.json songs/\n"
    "  brindle markov learn --plain --order 2 --simplify -o plain.json songs/\n"
    "\n"
    "A model of songs has its chords by key and bar. A plain one has chords with lengths in\n"
    "beats, in the keys that they were written in, and is for generate, fill and show.\n"
    "Lead sheets are read as they are played. A chord string has lengths in beats,\n"
    "(4,C);(2,F);(2,G7); a chord text has a | before each bar and a . for a beat that a\n"
    "chord is held on. Folders are walked for .xml, .musicxml, .mxl and .txt.\n",
};

constexpr std::uint64_t kUsualOrder = 3;

struct CLearnOptions {
    std::vector<std::string> mFiles;
    std::string mModel;
    std::uint64_t mOrder = kUsualOrder;
    bool mSimplify = false;
    bool mIsPlain = false;
    bool mWithBuiltIn = false;
    double mBeatsPerBar = 4.0;
    CTypedChords mReading;
    CFormatOptions mFormat;
};

/// What was learned of files.
struct CLearned {
    CLearnReport mReport;
    bool mIsNamedFileUnread = false;
};

void SimplifyChords(CHarmAnlsChordsWithLength& chords) {
    for (CHarmAnlsChordWithLength& chord : chords) chord.SimplifyChord();
}

CLearned LearnFiles(VariableLengthMarkovModel& model, const CLearnOptions& options) {
    CTypedChords reading = options.mReading;
    reading.UseBeatsPerBar(options.mBeatsPerBar);
    const std::vector<CFoundFile> files = FindSongFiles(options.mFiles);
    CLearned learned;
    CProgress progress(files.size());
    for (const CFoundFile& file : files) {
        progress.Step(file.mPath);
        const CChordSource source = ReadChordSource(file.mPath, reading);
        if (!source.mError.empty()) {
            learned.mReport.mUnread.emplace_back(file.mPath, source.mError);
            learned.mIsNamedFileUnread = learned.mIsNamedFileUnread || file.mIsNamed;
            continue;
        }
        ++learned.mReport.mFiles;
        for (CHarmAnlsChordsWithLength chords : source.mSequences) {
            if (options.mSimplify) SimplifyChords(chords);
            LearnChords(model, chords);
            learned.mReport.mChords += chords.size();
        }
    }
    return learned;
}

void ReportUnread(const CLearnReport& report) {
    for (const auto& [name, error] : report.mUnread) {
        Fail(TStatus::BadInput,
             Message("{name} was left out: {reason}",
                     {{"name", InputName(name)}, {"reason", Printable(FaultMessage(error))}}));
    }
}

TStatus MarkovLearn(const CLearnOptions& options) {
    if (options.mModel.empty()) {
        return Fail(TStatus::BadUsage, "--output needs the name of a file, and it is empty");
    }
    if (!options.mIsPlain) {
        if (options.mSimplify || options.mOrder != kUsualOrder) {
            return Fail(TStatus::BadUsage, "--order and --simplify are for --plain");
        }
        return MarkovLearnSongs({options.mFiles, options.mModel, options.mBeatsPerBar,
                                 options.mWithBuiltIn, options.mFormat.Format() == TFormat::Json});
    }
    if (options.mWithBuiltIn) return Fail(TStatus::BadUsage, "--with-built-in is not for --plain");
    VariableLengthMarkovModel model(options.mOrder);
    const CLearned learned = LearnFiles(model, options);
    ReportUnread(learned.mReport);
    if (learned.mReport.mFiles == 0)
        return Fail(TStatus::BadInput, Message("there was nothing to learn"));
    if (!model.SaveToFile(options.mModel)) {
        return FailToWrite(options.mModel);
    }
    const TStatus printed =
        Print(options.mFormat.Format() == TFormat::Json ? LearnedJson(learned.mReport, model)
                                                        : LearnedText(learned.mReport, model));
    return learned.mIsNamedFileUnread ? TStatus::BadInput : printed;
}

}  // namespace

void AddMarkovLearn(CCommand& markov) {
    CCommand& command = markov.AddCommand(kMarkovLearnHelp);
    const auto options = std::make_shared<CLearnOptions>();
    command.AddArgument("FILES", options->mFiles, "Files and folders; - reads standard input")
        .Required();
    command.AddOption("-o,--output", "MODEL", options->mModel, "The model file that is written")
        .Required();
    command.AddFlag("--with-built-in", options->mWithBuiltIn, "Learn the built-in songs, too");
    command.AddFlag("--plain", options->mIsPlain,
                    "Make a plain model, of chords with lengths and without keys");
    command
        .AddOption("--order", "N", options->mOrder,
                   "Longest history of a plain model, in chords (default: 3)")
        .InRange(std::uint64_t{1}, kLongestOrder);
    command.AddFlag("--simplify", options->mSimplify,
                    "For a plain model, make each chord a triad without bass that lasts 4 beats");
    command
        .AddOption("--beats-per-bar", "BEATS", options->mBeatsPerBar,
                   "Length of a bar of chord texts in beats (default: 4)")
        .InRange(1.0, 64.0);
    options->mReading.AddTo(command, "In what form chord texts are written");
    options->mFormat.AddTo(command, {"text", "json"});
    command.OnCall([options] { return MarkovLearn(*options); });
}

}  // namespace brindle::cli
