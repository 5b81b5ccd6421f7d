// SPDX-License-Identifier: MIT
#include "cli/MarkovSongs.h"

#include "brindle/present/ModelSongsText.h"

#include <memory>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kListSongsHelp{
    "songs",
    "List the songs that a model was made of, with the makers of those that are built in",
    "  brindle markov songs\n"
    "  brindle markov songs --style \"early jazz\"\n"
    "  brindle markov songs model.json --json\n",
};

struct CListSongsOptions {
    std::string mModel;
    std::string mStyle;
    CFormatOptions mFormat;
};

TStatus MarkovListSongs(const CListSongsOptions& options) {
    const auto model = ReadSongModelFile(options.mModel, options.mStyle);
    if (!model) return TStatus::BadInput;
    return Print(options.mFormat.Format() == TFormat::Json
                     ? ModelSongsJson(*model)
                     : ModelSongsText(*model, PaintOfOutput()));
}

}  // namespace

void AddMarkovListSongs(CCommand& markov) {
    CCommand& command = markov.AddCommand(kListSongsHelp);
    const auto options = std::make_shared<CListSongsOptions>();
    command.AddArgument("MODEL", options->mModel,
                        "Model file of songs; - reads standard input (default: the built-in one)");
    command.AddOption("--style", "STYLE", options->mStyle, "Only the songs of this style");
    options->mFormat.AddTo(command, {"text", "json"});
    command.OnCall([options] { return MarkovListSongs(*options); });
}

}  // namespace brindle::cli
