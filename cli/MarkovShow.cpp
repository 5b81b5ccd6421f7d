// SPDX-License-Identifier: MIT
#include "cli/Markov.h"

#include "brindle/present/MarkovModelText.h"

#include <memory>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kMarkovShowHelp{
    "show",
    "Show what a model has learned: its size, how sure it is, and what follows a history",
    "  brindle markov learn --plain -o plain.json songs/\n"
    "  brindle markov show plain.json\n"
    "  brindle markov show plain.json --history \"(4,Dm7);(4,G7)\"\n",
};

struct CShowOptions {
    std::string mModel;
    std::string mHistory;
    std::uint64_t mTop = 10;
    CFormatOptions mFormat;
};

TStatus MarkovShow(const CShowOptions& options) {
    auto model = ReadModel(options.mModel);
    if (!model) return TStatus::BadInput;
    MarkovSequence history;
    if (options.mHistory.empty()) {
        model->Subvector(1, {}, history);
    } else {
        const auto symbols = ReadSymbols("--history", options.mHistory);
        if (!symbols) return TStatus::BadUsage;
        history = model->IteratorSequenceForObjects(*symbols);
    }
    auto continuations = MarkovContinuations(*model, history);
    if (history.empty()) {
        return Fail(TStatus::BadInput, "the model does not know the last chord of --history");
    }
    if (options.mTop < continuations.size()) {
        continuations.resize(static_cast<std::size_t>(options.mTop));
    }
    return Print(options.mFormat.Format() == TFormat::Json
                     ? MarkovModelJson(*model, history, continuations)
                     : MarkovModelText(*model, history, continuations, PaintOfOutput()));
}

}  // namespace

void AddMarkovShow(CCommand& markov) {
    CCommand& command = markov.AddCommand(kMarkovShowHelp);
    const auto options = std::make_shared<CShowOptions>();
    command.AddArgument("MODEL", options->mModel, "Plain model; - reads standard input").Required();
    command.AddOption("--history", "CHORDS", options->mHistory,
                      "Show what follows these chords (default: the start of a sequence)");
    command.AddOption("--top", "N", options->mTop, "Continuations to show (default: 10)");
    options->mFormat.AddTo(command, {"text", "json"});
    command.OnCall([options] { return MarkovShow(*options); });
}

}  // namespace brindle::cli
