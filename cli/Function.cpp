// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"
#include "cli/KeyText.h"
#include "cli/TypedChords.h"
#include "cli/TypedSymbols.h"

#include "brindle/chords/CChordLite.h"
#include "brindle/present/FunctionsText.h"
#include "brindle/theory/CSignKeyHeavy.h"

#include <memory>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kFunctionHelp{
    "function",
    "Tell the function of chords in a key: Roman numerals and function letters",
    "  brindle function Dm7 G7 C --key C\n"
    "  brindle function E7 Am --key \"A minor\" --json\n"
    "  cat symbols.txt | brindle function - --key Eb\n",
};

struct CFunctionOptions {
    std::vector<std::string> mSymbols;
    std::string mKey;
    CTypedChords mReading;
    CFormatOptions mFormat;
};

TStatus Function(const CFunctionOptions& options) {
    const auto key = ReadKeyOption(options.mKey);
    if (!key) return TStatus::BadUsage;
    const auto symbols = TypedSymbols(options.mSymbols);
    if (!symbols) return TStatus::BadInput;
    const auto chords = options.mReading.ReadSymbols(*symbols);
    if (!chords) return TStatus::BadInput;
    const CSignKeyHeavy signKey = key->ToSignKeyHeavy();
    std::vector<CChordFunction> functions;
    for (std::size_t i = 0; i < symbols->size(); ++i) {
        functions.push_back(FunctionOf((*symbols)[i], (*chords)[i], signKey));
    }
    return Print(options.mFormat.Format() == TFormat::Json
                     ? FunctionsJson(*key, functions)
                     : FunctionsText(functions, PaintOfOutput()));
}

}  // namespace

void AddFunction(CCommand& program) {
    CCommand& command = program.AddCommand(kFunctionHelp);
    const auto options = std::make_shared<CFunctionOptions>();
    command.AddArgument("SYMBOL", options->mSymbols, "Chord symbols; - reads standard input")
        .Required();
    command.AddOption("--key", "KEY", options->mKey, "The key, as in \"A minor\" or Bb").Required();
    options->mReading.AddTo(command);
    options->mFormat.AddTo(command, {"text", "json"});
    command.OnCall([options] { return Function(*options); });
}

}  // namespace brindle::cli
