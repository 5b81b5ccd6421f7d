// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/TChordStringParse.h"

#include <CLI/CLI.hpp>
#include <optional>
#include <string>
#include <vector>

namespace brindle::cli {

/// The options of a command that reads one chord text: TEXT, --file and the beats.
class CChordTextOptions {
public:
    void AddTo(CLI::App& command);

    /// What is wrong with options that are fine one by one.
    [[nodiscard]] std::optional<std::string> Contradiction() const;
    /// The text as the user wrote it. Nothing when it cannot be read; then the error has been
    /// printed.
    [[nodiscard]] std::optional<std::string> Read() const;
    [[nodiscard]] TChordStringParse Parse() const;
    [[nodiscard]] double BeatsPerBar() const { return mBeatsPerBar; }

private:
    std::vector<std::string> mWords;
    std::string mFile;
    double mBeatsPerBar = 4.0;
    double mBeatsPerChord = 1.0;
};

}  // namespace brindle::cli
