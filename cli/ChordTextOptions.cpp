// SPDX-License-Identifier: MIT
#include "cli/ChordTextOptions.h"

#include "cli/CCommand.h"
#include "cli/Input.h"

#include "brindle/analysis/TChordStringParse.h"
#include "brindle/present/ShownNames.h"

namespace brindle::cli {
namespace {

// A step or a bar this short or long is a slip of the finger.
constexpr double kFewestBeats = 1.0 / 1024;
constexpr double kMostBeats = 1024.0;

}  // namespace

void AddSongSource(CCommand& command, std::vector<std::string>& words, std::string& file) {
    command.AddArgument("TEXT", words,
                        "Chord text, or the name of a score; - reads standard input");
    command.AddOption("--file", "PATH", file, "Read the chord text or the score from a file");
}

std::optional<std::string> FaultOfSource(const std::vector<std::string>& words,
                                         const std::string& file,
                                         std::initializer_list<double> beats) {
    if (words.empty() && file.empty()) {
        return "a chord text is needed: a TEXT, --file PATH, or - for standard input";
    }
    if (!words.empty() && !file.empty()) {
        return "a TEXT and --file PATH are two songs, one is needed";
    }
    for (const double count : beats) {
        if (count >= kFewestBeats && count <= kMostBeats) continue;
        return "--beats-per-bar and --beats-per-chord take 1/1024 to 1024 beats";
    }
    return std::nullopt;
}

void AddBeats(CCommand& command, double& beatsPerBar, double& beatsPerChord) {
    command.AddOption("--beats-per-bar", "BEATS", beatsPerBar,
                      "Length of a bar in beats (default: 4)");
    command.AddOption("--beats-per-chord", "BEATS", beatsPerChord,
                      "Length of a chord in beats (default: 1)");
}

void CChordReadingOptions::AddTo(CCommand& command) {
    command.AddArgument("TEXT", mWords, "Chord text; - reads standard input");
    command.AddOption("--file", "PATH", mFile, "Read the chord text from a file");
    AddBeats(command, mBeatsPerBar, mBeatsPerChord);
    mReading.AddTo(command, "In what form the chord text is written");
}

std::optional<std::string> CChordReadingOptions::Contradiction() const {
    return FaultOfSource(mWords, mFile, {mBeatsPerBar, mBeatsPerChord});
}

std::optional<CChordSong> CChordReadingOptions::ReadSong() const {
    const auto typed = mFile.empty() ? TextFromWords(mWords) : ReadInput(mFile);
    if (!typed) return std::nullopt;
    TChordStringParse parse;
    parse.mBeatsPerBar = mBeatsPerBar;
    parse.mBeatsPerChord = mBeatsPerChord;
    parse.mChordNamePrefs = NamePrefs();
    return mReading.ReadSongOrFail(*typed, parse);
}

}  // namespace brindle::cli
