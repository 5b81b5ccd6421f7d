// SPDX-License-Identifier: MIT
#include "cli/Markov.h"
#include "cli/MarkovSongs.h"

#include "brindle/platform/AtomicFile.h"
#include "brindle/present/MarkovMidi.h"
#include "brindle/present/MarkovSequencesText.h"
#include "brindle/song/SongModelFile.h"

#include <fmt/format.h>

#include <memory>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kMarkovGenerateHelp{
    "generate",
    "Write a song in the manner of others; with a plain model, make a chord sequence",
    "  brindle markov generate\n"
    "  brindle markov generate --style hymn --key \"Eb major\" --bars 16 --beats-per-bar 3\n"
    "  brindle markov generate model.json --form blues --key F --show-quotes\n"
    "  brindle markov generate --sheet \"C | _ | _ | G7 | _ | _ | G7 | C\" --format svg\n"
    "  brindle markov generate --contains \"ii-V-I of F\" --never \"Bdim\" --ends Am\n"
    "\n"
    "With a plain model:\n"
    "  brindle markov generate plain.json --beats 32\n"
    "  brindle markov generate plain.json --template \"(4,C);(8,U);(4,C)\" --seed 1\n"
    "  brindle markov generate plain.json --beats 64 --order 2 --midi song.mid\n"
    "\n"
    "In a template the U are gaps, to be filled with chords of their length together.\n",
};

constexpr double kMostBeatsOfSequence = 10000.0;
// A second or two of search.
constexpr std::uint64_t kMostSteps = 1'000'000;
constexpr std::uint64_t kShortestOrder = 1;
constexpr std::uint64_t kMostAttempts = 10'000'000;

struct CGenerateOptions {
    CWriteOptions mSong;
    std::string mModel;
    double mBeats = 0.0;
    std::string mTemplate;
    std::uint64_t mSamples = 10;
    std::optional<std::uint64_t> mSeed;
    std::uint64_t mOrder = kLongestOrder;
    std::uint64_t mMinOrder = 1;
    std::uint64_t mEvidence = 1;
    double mMinEntropy = 0.0;
    bool mIsStrict = false;
    double mAllEqualFactor = 1.0;
    std::uint64_t mAttempts = 10000;
    std::uint64_t mOthers = 3;
    int mBeatsPerBar = 4;
    std::optional<std::string> mMidi;
    double mTempo = 100.0;
    bool mIsPlain = false;
    CFormatOptions mFormat;
};

std::optional<std::string> Contradiction(const CGenerateOptions& options) {
    if (options.mTemplate.empty() == (options.mBeats == 0.0)) {
        return "either --beats or --template is needed";
    }
    return std::nullopt;
}

/// Nothing if the template cannot be read; then the error has been printed.
std::optional<TMarkovGenerateOptions> UsualWay(VariableLengthMarkovModel& model,
                                               const CGenerateOptions& options) {
    if (options.mTemplate.empty()) return UsualGenerateOptions(model, options.mBeats);
    const auto wanted = ReadSymbols("--template", options.mTemplate);
    if (!wanted) return std::nullopt;
    return UsualGenerateOptions(model, *wanted);
}

std::optional<TMarkovGenerateOptions> ToldWay(VariableLengthMarkovModel& model,
                                              const CGenerateOptions& options) {
    auto usual = UsualWay(model, options);
    if (!usual) return std::nullopt;
    TMarkovGenerateOptions& generate = *usual;
    generate.mMaxHistoryLength = options.mOrder;
    generate.mMinHistoryLength = options.mMinOrder;
    generate.mEvidenceHistoryLength = options.mEvidence;
    generate.mAcceptAtMinHistory = !options.mIsStrict;
    generate.mAcceptExactFill = !options.mIsStrict;
    generate.mMinNormalizedEntropy = options.mMinEntropy;
    generate.mAllEqualFactor = options.mAllEqualFactor;
    generate.mSampleCount = options.mSamples;
    generate.Validate(model);
    return usual;
}

/// Whether the file is a plain model: what makes sequences and writes no songs.
bool IsPlainModel(const std::string& path) {
    if (path.empty() || path == kBuiltInName) return false;
    const auto text = ReadWholeFile(path);
    return text && !LooksLikeSongModel(*text);
}

bool ArePlainOptionsTold(const CGenerateOptions& options) {
    const CGenerateOptions none;
    return options.mBeats != none.mBeats || !options.mTemplate.empty() ||
           options.mSamples != none.mSamples || options.mMinOrder != none.mMinOrder ||
           options.mEvidence != none.mEvidence || options.mMinEntropy != none.mMinEntropy ||
           options.mIsStrict || options.mAllEqualFactor != none.mAllEqualFactor ||
           options.mAttempts != none.mAttempts || options.mOthers != none.mOthers;
}

TStatus WriteSongOf(const CGenerateOptions& options) {
    if (ArePlainOptionsTold(options)) {
        return Fail(TStatus::BadUsage,
                    "these options are for a plain model; brindle markov learn --plain makes one");
    }
    if (options.mMidi == "") return Fail(TStatus::BadUsage, "--midi needs the name of a file");
    CWriteOptions song = options.mSong;
    song.mModel = options.mModel;
    return MarkovWrite(song, {options.mOrder, options.mBeatsPerBar, options.mSeed, options.mMidi,
                              options.mTempo, options.mFormat.Format()});
}

TStatus MarkovGenerate(const CGenerateOptions& options) {
    if (!options.mIsPlain && !IsPlainModel(options.mModel)) return WriteSongOf(options);
    if (options.mSong.AreTold() || options.mFormat.Format() == TFormat::Svg) {
        return Fail(TStatus::BadUsage, "options for songs have no effect with a plain model");
    }
    if (options.mModel.empty()) return Fail(TStatus::BadUsage, "--plain needs a model file");
    if (options.mMidi == "") return Fail(TStatus::BadUsage, "--midi needs the name of a file");
    auto model = ReadModel(options.mModel);
    if (!model) return TStatus::BadInput;
    if (const auto contradiction = Contradiction(options)) {
        return Fail(TStatus::BadUsage, *contradiction);
    }
    SetSeed(*model, options.mSeed);
    model->SetSearchLimits({options.mAttempts, kMostSteps});
    const auto generateOptions = ToldWay(*model, options);
    if (!generateOptions) return TStatus::BadUsage;
    const CMarkovDraws draws = DrawMarkovSequences(*model, *generateOptions);
    if (draws.mSequences.empty()) {
        return Fail(
            TStatus::BadInput,
            "the model finds no such sequence: each chord, and the end, must have been learned "
            "behind the one before it");
    }
    if (options.mMidi &&
        !WriteFileAtomically(*options.mMidi,
                             MidiFileBytes(MidiPieceOf(draws.mChosen.mSymbols, options.mTempo,
                                                       options.mBeatsPerBar)))) {
        return FailToWrite(*options.mMidi);
    }
    return Print(
        options.mFormat.Format() == TFormat::Json
            ? DrawnSequencesJson(draws)
            : DrawnSequencesText(draws, options.mBeatsPerBar, options.mOthers, PaintOfOutput()));
}

void AddHistoryOptions(CCommand& command, CGenerateOptions& options) {
    command
        .AddOption("--order", "N", options.mOrder, "Longest history (default: that of the model)")
        .InRange(kShortestOrder, kLongestOrder);
    command.AddOption("--min-order", "N", options.mMinOrder, "Shortest history (default: 1)")
        .InRange(kShortestOrder, kLongestOrder);
    command
        .AddOption("--evidence", "N", options.mEvidence,
                   "History behind which fixed chords must be known (default: 1)")
        .InRange(kShortestOrder, kLongestOrder);
    command
        .AddOption("--min-entropy", "H", options.mMinEntropy,
                   "How varied the chords behind a history must be for it to be used, 0 to 1 "
                   "(default: 0)")
        .InRange(0.0, 1.0);
    command.AddFlag("--strict", options.mIsStrict,
                    "Hold --min-entropy at the shortest history and at the end of gaps, too");
    command
        .AddOption("--all-equal-factor", "F", options.mAllEqualFactor,
                   "Weight of a sequence of one and the same chord (default: 1)")
        .InRange(0.0, 1.0);
}

}  // namespace

void AddMarkovGenerate(CCommand& markov) {
    CCommand& command = markov.AddCommand(kMarkovGenerateHelp);
    const auto options = std::make_shared<CGenerateOptions>();
    command.AddArgument("MODEL", options->mModel,
                        "Model file; - reads standard input (default: the built-in songs)");
    options->mSong.AddTo(command);
    command.AddFlag("--plain", options->mIsPlain,
                    "Take the model for a plain one, which its file tells if it is no -");
    command.AddOption("--beats", "BEATS", options->mBeats, "Length of the sequence")
        .InRange(1.0, kMostBeatsOfSequence);
    command.AddOption("--template", "CHORDS", options->mTemplate,
                      "Chords that are fixed, and gaps");
    command.AddOption("--samples", "N", options->mSamples, "Sequences to choose from (default: 10)")
        .InRange(std::uint64_t{1}, std::uint64_t{100000});
    command.AddOption("--seed", "S", options->mSeed, "Repeats a run exactly");
    AddHistoryOptions(command, *options);
    command
        .AddOption("--attempts", "N", options->mAttempts,
                   "Give up after so many attempts (default: 10000)")
        .InRange(std::uint64_t{1}, kMostAttempts);
    command.AddOption("--others", "N", options->mOthers, "Other sequences to show (default: 3)");
    command
        .AddOption("--beats-per-bar", "BEATS", options->mBeatsPerBar, "Beats of a bar (default: 4)")
        .InRange(1, 64);
    command.AddOption("--midi", "PATH", options->mMidi, "Write the sequence as a MIDI file");
    command.AddOption("--tempo", "BPM", options->mTempo, "Beats per minute of that (default: 100)")
        .InRange(10.0, 1000.0);
    options->mFormat.AddTo(command, {"text", "json", "svg"});
    command.OnCall([options] { return MarkovGenerate(*options); });
}

}  // namespace brindle::cli
