// SPDX-License-Identifier: MIT
#include "cli/Analysis.h"
#include "cli/ChordSymbols.h"
#include "cli/CommandLine.h"
#include "cli/Input.h"
#include "cli/KeyText.h"
#include "cli/Names.h"

#include "brindle/analysis/CAnalyseHarmCenterAlternatives.h"
#include "brindle/analysis/TChordStringParse.h"

#include <fmt/format.h>

#include <memory>
#include <optional>
#include <sstream>

namespace brindle::cli {
namespace {

constexpr TCommandHelp kHelp{
    "analyse",
    "Find the keys, the harmonic centers and the function of each chord of a song",
    "  brindle analyse \"Dm7 G7 | C\"\n"
    "  brindle analyse --key \"A minor\" --readings \"Am Dm | E7 Am\"\n"
    "  brindle analyse --file song.txt --beats-per-bar 3 --format svg >song.svg\n"
    "  cat song.txt | brindle analyse - --json\n"
    "\n"
    "A chord text has chord symbols between white space; | goes on to the next bar\n"
    "line, and . holds the chord before it for one more step.\n",
};

// A step or a bar this short or long is a slip of the finger.
constexpr double kShortest = 1.0 / 1024;
constexpr double kLongest = 1024.0;

struct TAnalyseOptions {
    std::vector<std::string> mWords;
    std::string mFile;
    std::string mRoute = "tonic";
    std::string mKey;
    double mBeatsPerBar = 4.0;
    double mBeatsPerChord = 1.0;
    bool mReadings = false;
    CFormatOptions mFormat;
};

TAnalyse RouteOf(const std::string& name) {
    if (name == "tonic") return TAnalyse_TonicProgressions;
    if (name == "cadence") return TAnalyse_CadenceProgressions;
    return name == "weights" ? TAnalyse_CenterWeights : TAnalyse_None;
}

// What is wrong with options that are fine one by one.
std::optional<std::string> Contradiction(const TAnalyseOptions& options) {
    if (options.mWords.empty() && options.mFile.empty()) {
        return "a chord text is needed: a TEXT, --file PATH, or - for standard input";
    }
    if (!options.mWords.empty() && !options.mFile.empty()) {
        return "a TEXT and --file PATH are two songs, one is needed";
    }
    for (const double beats : {options.mBeatsPerBar, options.mBeatsPerChord}) {
        if (beats >= kShortest && beats <= kLongest) continue;
        return "--beats-per-bar and --beats-per-chord take 1/1024 to 1024 beats";
    }
    if (options.mReadings && options.mFormat.Format() == TFormat::Native) {
        return "--readings has no native form; --format json shows them";
    }
    return std::nullopt;
}

std::string Present(const CHarmonicAnalyse& analyse, const CHarmAnlsCenters* readings,
                    const CChordSymbols& symbols, const TAnalyseOptions& options) {
    switch (options.mFormat.Format()) {
        case TFormat::Json:
            return AnalysisJson(analyse, readings, symbols);
        case TFormat::Native: {
            std::ostringstream native;
            analyse.AppendJSONString(native);
            return native.str();
        }
        case TFormat::Svg:
            return AnalysisSvg(MakeSong(analyse, readings, symbols, options.mBeatsPerBar));
        case TFormat::Text:
            break;
    }
    return AnalysisText(MakeSong(analyse, readings, symbols, options.mBeatsPerBar), CPaint());
}

TStatus Analyse(const TAnalyseOptions& options) {
    if (const auto contradiction = Contradiction(options)) {
        return Fail(TStatus::BadUsage, *contradiction);
    }
    CHarmAnlsSignKeys signKeys;
    if (!options.mKey.empty()) {
        CHarmAnlsSignKey given;
        given.mPosition = 0.0;
        const std::string typedKey = FoldAccidentals(options.mKey);
        const TKeyText key = ReadKeyText(typedKey);
        if (!key.mError.empty()) {
            return FailAt(TStatus::BadUsage, "--key: " + key.mError, typedKey, key.mColumn);
        }
        given.mSignKey = key.mSignKey;
        signKeys.push_back(given);
    }
    const auto typed =
        options.mFile.empty() ? TextFromWords(options.mWords) : ReadInput(options.mFile);
    if (!typed) return TStatus::BadInput;

    TChordStringParse parse;
    parse.mBeatsPerBar = options.mBeatsPerBar;
    parse.mBeatsPerChord = options.mBeatsPerChord;
    parse.mChordNamePrefs = NamePrefs();
    CHarmonicAnalyse analyse;
    analyse.AnalyseFromChordString(FoldAccidentals(*typed), signKeys, RouteOf(options.mRoute),
                                   parse);
    CHarmAnlsCenters readings;
    if (options.mReadings) {
        readings = CAnalyseHarmCenterAlternatives(analyse.mChords).BestResults();
    }
    const CChordSymbols symbols(*typed, parse, analyse.mChords);
    return Print(Present(analyse, options.mReadings ? &readings : nullptr, symbols, options));
}

}  // namespace

void AddAnalyse(CLI::App& program, TStatus& status) {
    CLI::App& command = AddCommand(program, kHelp);
    const auto options = std::make_shared<TAnalyseOptions>();
    command.add_option("TEXT", options->mWords, "Chord text; - reads standard input")
        ->option_text("...");
    command.add_option("--file", options->mFile, "Read the chord text from a file")
        ->option_text("PATH");
    AddChoice(command, "--route", options->mRoute, {"tonic", "cadence", "weights", "none"},
              "How centers are searched");
    command.add_option("--key", options->mKey, "The stated key, as in \"A minor\" or Bb")
        ->option_text("KEY");
    command
        .add_option("--beats-per-bar", options->mBeatsPerBar,
                    "Length of a bar in beats (default: 4)")
        ->option_text("BEATS");
    command
        .add_option("--beats-per-chord", options->mBeatsPerChord,
                    "Length of a chord in beats (default: 1)")
        ->option_text("BEATS");
    command.add_flag("--readings", options->mReadings,
                     "Show all readings that progressions to a tonic allow");
    options->mFormat.AddTo(command, {"text", "json", "native", "svg"});
    command.callback([options, &status] { status = Analyse(*options); });
}

}  // namespace brindle::cli
