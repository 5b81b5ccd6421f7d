// SPDX-License-Identifier: MIT
#include "cli/ChordTextOptions.h"

#include "cli/Input.h"
#include "cli/Names.h"

#include "brindle/analysis/TChordStringParse.h"

namespace brindle::cli {
namespace {

// A step or a bar this short or long is a slip of the finger.
constexpr double kShortest = 1.0 / 1024;
constexpr double kLongest = 1024.0;

}  // namespace

void AddSongSource(CLI::App& command, std::vector<std::string>& words, std::string& file) {
    command.add_option("TEXT", words, "Chord text, or the name of a score; - reads standard input")
        ->option_text("...");
    command.add_option("--file", file, "Read the chord text or the score from a file")
        ->option_text("PATH");
}

void AddBeats(CLI::App& command, double& beatsPerBar, double& beatsPerChord) {
    command.add_option("--beats-per-bar", beatsPerBar, "Length of a bar in beats (default: 4)")
        ->option_text("BEATS");
    command
        .add_option("--beats-per-chord", beatsPerChord, "Length of a chord in beats (default: 1)")
        ->option_text("BEATS");
}

void CChordTextOptions::AddTo(CLI::App& command) {
    command.add_option("TEXT", mWords, "Chord text; - reads standard input")->option_text("...");
    command.add_option("--file", mFile, "Read the chord text from a file")->option_text("PATH");
    AddBeats(command, mBeatsPerBar, mBeatsPerChord);
    mReading.AddTo(command, "In what form the chord text is written");
}

std::optional<std::string> CChordTextOptions::Contradiction() const {
    if (mWords.empty() && mFile.empty()) {
        return "a chord text is needed: a TEXT, --file PATH, or - for standard input";
    }
    if (!mWords.empty() && !mFile.empty()) {
        return "a TEXT and --file PATH are two songs, one is needed";
    }
    for (const double beats : {mBeatsPerBar, mBeatsPerChord}) {
        if (beats >= kShortest && beats <= kLongest) continue;
        return "--beats-per-bar and --beats-per-chord take 1/1024 to 1024 beats";
    }
    return std::nullopt;
}

std::optional<TChordSong> CChordTextOptions::ReadSong() const {
    const auto typed = mFile.empty() ? TextFromWords(mWords) : ReadInput(mFile);
    if (!typed) return std::nullopt;
    TChordStringParse parse;
    parse.mBeatsPerBar = mBeatsPerBar;
    parse.mBeatsPerChord = mBeatsPerChord;
    parse.mChordNamePrefs = NamePrefs();
    return mReading.ReadSongOrFail(*typed, parse);
}

}  // namespace brindle::cli
