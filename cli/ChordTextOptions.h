// SPDX-License-Identifier: MIT
#pragma once

#include "cli/TypedChords.h"

#include <initializer_list>
#include <optional>
#include <string>
#include <vector>

namespace brindle::cli {

class CCommand;

/// Adds TEXT and --file of a command that reads a chord text or a score.
void AddSongSource(CCommand& command, std::vector<std::string>& words, std::string& file);

/// What is wrong with a source and the beats of its bars and chords, if anything is.
[[nodiscard]] std::optional<std::string> FaultOfSource(const std::vector<std::string>& words,
                                                       const std::string& file,
                                                       std::initializer_list<double> beats);

/// Adds --beats-per-bar and --beats-per-chord.
void AddBeats(CCommand& command, double& beatsPerBar, double& beatsPerChord);

/// The options of a command that reads one chord text: TEXT, --file, the beats, and how it is read.
class CChordReadingOptions {
public:
    void AddTo(CCommand& command);

    /// What is wrong with options that are fine one by one.
    [[nodiscard]] std::optional<std::string> Contradiction() const;
    /// The song. Nothing when it cannot be read; then the error has been printed.
    [[nodiscard]] std::optional<CChordSong> ReadSong() const;

private:
    std::vector<std::string> mWords;
    std::string mFile;
    double mBeatsPerBar = 4.0;
    double mBeatsPerChord = 1.0;
    CTypedChords mReading;
};

}  // namespace brindle::cli
