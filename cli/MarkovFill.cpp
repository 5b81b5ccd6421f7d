// SPDX-License-Identifier: MIT
#include "cli/Markov.h"

#include "brindle/markov/FillMarkovGaps.h"
#include "brindle/present/MarkovSequencesText.h"

#include <memory>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kMarkovFillHelp{
    "fill",
    "Put a chord into each gap of a sequence, by what the model knows of its neighbours",
    "  brindle markov learn --plain -o plain.json songs/\n"
    "  brindle markov fill plain.json \"(4,C);(4,U);(4,G7);(4,C)\"\n"
    "  brindle markov fill plain.json \"(2,Dm);(2,U);(4,C)\" --seed 1 --json\n",
};

struct CFillOptions {
    std::string mModel;
    std::string mSequence;
    std::optional<std::uint64_t> mSeed;
    CFormatOptions mFormat;
};

TStatus MarkovFill(const CFillOptions& options) {
    auto model = ReadModel(options.mModel);
    if (!model) return TStatus::BadInput;
    const auto symbols = ReadSymbols("SEQUENCE", options.mSequence);
    if (!symbols) return TStatus::BadUsage;
    const MarkovSequence typed = model->IteratorSequenceForObjects(*symbols);
    SetSeed(*model, options.mSeed);
    const auto filled = FillMarkovGaps(*model, typed);
    if (!filled) {
        return Fail(TStatus::BadInput, "the model knows no chord between these neighbours");
    }
    return Print(options.mFormat.Format() == TFormat::Json
                     ? FilledSequenceJson(*filled, typed)
                     : ChordString(*filled, CMarkovSpelling(*filled)) + '\n');
}

}  // namespace

void AddMarkovFill(CCommand& markov) {
    CCommand& command = markov.AddCommand(kMarkovFillHelp);
    const auto options = std::make_shared<CFillOptions>();
    command.AddArgument("MODEL", options->mModel, "Plain model; - reads standard input").Required();
    command.AddArgument("SEQUENCE", options->mSequence, "Chords with their lengths; U is a gap")
        .Required();
    command.AddOption("--seed", "S", options->mSeed, "Repeats a run exactly");
    options->mFormat.AddTo(command, {"text", "json"});
    command.OnCall([options] { return MarkovFill(*options); });
}

}  // namespace brindle::cli
