// SPDX-License-Identifier: MIT
#pragma once

#include "cli/CCommand.h"
#include "cli/Output.h"

#include <string>
#include <vector>

namespace brindle {
struct CNumeralOptions;
}

namespace brindle::cli {

/// The options --format and --json.
class CFormatOptions {
public:
    /// `formats` are those that the command has, of text, json, native, svg and chords.
    void AddTo(CCommand& command, const std::vector<std::string>& formats);

    [[nodiscard]] TFormat Format() const;

private:
    std::string mFormat = "text";
    bool mJson = false;
};

/// Adds the options that tell how numerals are written.
void AddNumeralOptions(CCommand& command, CNumeralOptions& options);

// The subcommands.

void AddAnalyse(CCommand& program);
void AddChord(CCommand& program);
void AddScale(CCommand& program);
void AddKey(CCommand& program);
void AddGrid(CCommand& program);
void AddGrids(CCommand& program);
void AddMarkov(CCommand& program);
void AddName(CCommand& program);
void AddFunction(CCommand& program);
void AddTypes(CCommand& program);
void AddNet(CCommand& program);
void AddCopies(CCommand& program);
void AddCorpus(CCommand& program);
void AddVector(CCommand& program);
void AddKeys(CCommand& program);
void AddNumerals(CCommand& program);
void AddHarmonies(CCommand& program);
void AddImport(CCommand& program);
void AddCompletion(CCommand& program);
void AddManual(CCommand& program);

}  // namespace brindle::cli
