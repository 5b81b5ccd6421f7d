// SPDX-License-Identifier: MIT
#include "cli/ChordSources.h"
#include "cli/Json.h"
#include "cli/Markov.h"
#include "cli/MarkovSongs.h"
#include "cli/Progress.h"

#include "brindle/present/ShownNames.h"
#include "brindle/song/FindSongFiles.h"
#include "brindle/song/LearnSong.h"

#include <fmt/format.h>

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

/// What was read and learned.
struct CLearned {
    std::size_t mFiles = 0;
    std::size_t mChords = 0;
    /// Names of files and what is wrong with them.
    std::vector<std::pair<std::string, std::string>> mUnread;
    bool mIsNamedFileUnread = false;
};

void SimplifyChords(CHarmAnlsChordsWithLength& chords) {
    for (CHarmAnlsChordWithLength& chord : chords) chord.SimplifyChord();
}

CLearned LearnFiles(VariableLengthMarkovModel& model, const CLearnOptions& options) {
    TChordStringParse parse;
    parse.mBeatsPerBar = options.mBeatsPerBar;
    parse.mChordNamePrefs = NamePrefs();
    const std::vector<CFoundFile> files = FindSongFiles(options.mFiles);
    CLearned learned;
    CProgress progress(files.size());
    for (const CFoundFile& file : files) {
        progress.Step(file.mPath);
        const CChordSource source = ReadChordSource(file.mPath, parse, options.mReading);
        if (!source.mError.empty()) {
            learned.mUnread.emplace_back(file.mPath, source.mError);
            learned.mIsNamedFileUnread = learned.mIsNamedFileUnread || file.mIsNamed;
            continue;
        }
        ++learned.mFiles;
        for (CHarmAnlsChordsWithLength chords : source.mSequences) {
            if (options.mSimplify) SimplifyChords(chords);
            LearnChords(model, chords);
            learned.mChords += chords.size();
        }
    }
    return learned;
}

std::string LearnedJson(const CLearned& learned, const VariableLengthMarkovModel& model) {
    Json unread = Json::array();
    for (const auto& [name, error] : learned.mUnread) {
        unread.push_back({{"File", Printable(name)}, {"Error", Printable(error)}});
    }
    return JsonText({{"Files", learned.mFiles},
                     {"Chords", learned.mChords},
                     {"MaxHistoryLength", model.mMaxHistoryLength},
                     {"Symbols", model.mObjects.size()},
                     {"Histories", model.mTransitionMap.size()},
                     {"Unread", unread}});
}

std::string Plural(std::size_t count, std::string_view one, std::string_view many) {
    return fmt::format("{} {}", count, count == 1 ? one : many);
}

std::string LearnedText(const CLearned& learned, const VariableLengthMarkovModel& model) {
    return fmt::format("learned {} from {}: {}, {}\n", Plural(learned.mChords, "chord", "chords"),
                       Plural(learned.mFiles, "file", "files"),
                       Plural(model.mObjects.size(), "symbol", "symbols"),
                       Plural(model.mTransitionMap.size(), "history", "histories"));
}

void ReportUnread(const CLearned& learned) {
    for (const auto& [name, error] : learned.mUnread) {
        Fail(TStatus::BadInput,
             fmt::format("{} was left out: {}", Printable(name), Printable(error)));
    }
}

TStatus MarkovLearn(const CLearnOptions& options) {
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
    ReportUnread(learned);
    if (learned.mFiles == 0) return Fail(TStatus::BadInput, "there was nothing to learn");
    if (!model.SaveToFile(options.mModel)) {
        return Fail(TStatus::BadInput,
                    fmt::format("{} cannot be written", Printable(options.mModel)));
    }
    const TStatus printed =
        Print(options.mFormat.Format() == TFormat::Json ? LearnedJson(learned, model)
                                                        : LearnedText(learned, model));
    return learned.mIsNamedFileUnread ? TStatus::BadInput : printed;
}

}  // namespace

void AddMarkovLearn(CCommand& markov) {
    CCommand& command = markov.AddCommand(kMarkovLearnHelp);
    const auto options = std::make_shared<CLearnOptions>();
    command.AddArgument("FILES", options->mFiles, "Files and folders").Required();
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
