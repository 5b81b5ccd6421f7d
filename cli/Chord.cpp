// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"
#include "cli/NamingOptions.h"
#include "cli/TypedChords.h"
#include "cli/TypedSymbols.h"

#include "brindle/chords/CChordLite.h"
#include "brindle/present/ChordsText.h"

#include <memory>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kChordHelp{
    "chord",
    "Read chord symbols: root, bass, semitones, basic chord and hash code",
    "  brindle chord F#m7/C# Bb13\n"
    "  brindle chord \"C maj 7\" --json\n"
    "  brindle chord CΔ Co7 \"F♯m7♭5\" C7alt Ab:min/b3\n"
    "  brindle chord F#m7/C# Bbmaj7 --german\n"
    "  cat symbols.txt | brindle chord -\n",
};

struct CChordOptions {
    std::vector<std::string> mSymbols;
    CTypedChords mReading;
    CNamingOptions mNaming;
    CFormatOptions mFormat;
};

TStatus Chord(const CChordOptions& options) {
    const auto symbols = TypedSymbols(options.mSymbols);
    if (!symbols) return TStatus::BadInput;
    CTypedChords reading = options.mReading;
    if (options.mNaming.ReadsBAsBFlat()) reading.UseBAsBFlat();
    const auto read = reading.ReadSymbols(*symbols);
    if (!read) return TStatus::BadInput;
    std::vector<CReadChord> chords;
    for (std::size_t i = 0; i < symbols->size(); ++i) {
        chords.push_back({Printable((*symbols)[i]), (*read)[i]});
    }
    const auto style = options.mNaming.ToldPrefs();
    return Print(options.mFormat.Format() == TFormat::Json
                     ? ChordsJson(chords, style)
                     : ChordsText(chords, PaintOfOutput(), style));
}

}  // namespace

void AddChord(CCommand& program) {
    CCommand& command = program.AddCommand(kChordHelp);
    const auto options = std::make_shared<CChordOptions>();
    command.AddArgument("SYMBOL", options->mSymbols, "Chord symbols; - reads standard input")
        .Required();
    options->mReading.AddTo(command);
    options->mFormat.AddTo(command, {"text", "json"});
    options->mNaming.AddSymbolsTo(command);
    command.OnCall([options] { return Chord(*options); });
}

}  // namespace brindle::cli
