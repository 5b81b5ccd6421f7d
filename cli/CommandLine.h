// SPDX-License-Identifier: MIT
#pragma once

#include "cli/Output.h"

#include <CLI/CLI.hpp>
#include <string>
#include <vector>

namespace brindle {
struct TNumeralOptions;
}

namespace brindle::cli {

/// What a subcommand is called, what it does, and calls of it that work.
struct TCommandHelp {
    const char* mName;
    const char* mPurpose;
    const char* mExamples;
};

/// Adds a subcommand whose help begins with its examples.
CLI::App& AddCommand(CLI::App& program, const TCommandHelp& help);

/// Puts examples at the top of the help.
void ShowExamplesFirst(CLI::App& app, const std::string& examples);

/// Adds an option that takes one of a few words; `value` holds the one that is taken if none is
/// told.
void AddChoice(CLI::App& command, const std::string& name, std::string& value,
               const std::vector<std::string>& choices, const std::string& purpose);

/// The options --format and --json.
class CFormatOptions {
public:
    /// `formats` are those that the command has, of text, json, native, svg and chords.
    void AddTo(CLI::App& command, const std::vector<std::string>& formats);

    [[nodiscard]] TFormat Format() const;

private:
    std::string mFormat = "text";
    bool mJson = false;
};

/// Adds the options that tell how numerals are written.
void AddNumeralOptions(CLI::App& command, TNumeralOptions& options);

// The subcommands. `status` receives the outcome when the command line asks for the command.

void AddAnalyse(CLI::App& program, TStatus& status);
void AddChord(CLI::App& program, TStatus& status);
void AddScale(CLI::App& program, TStatus& status);
void AddKey(CLI::App& program, TStatus& status);
void AddGrid(CLI::App& program, TStatus& status);
void AddGrids(CLI::App& program, TStatus& status);
void AddMarkov(CLI::App& program, TStatus& status);
void AddName(CLI::App& program, TStatus& status);
void AddFunction(CLI::App& program, TStatus& status);
void AddTypes(CLI::App& program, TStatus& status);
void AddNet(CLI::App& program, TStatus& status);
void AddCopies(CLI::App& program, TStatus& status);
void AddVector(CLI::App& program, TStatus& status);
void AddKeys(CLI::App& program, TStatus& status);
void AddNumerals(CLI::App& program, TStatus& status);
void AddHarmonies(CLI::App& program, TStatus& status);
void AddImport(CLI::App& program, TStatus& status);

}  // namespace brindle::cli
