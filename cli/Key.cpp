// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"
#include "cli/LineByLine.h"

#include "brindle/present/TonalitiesText.h"
#include "brindle/theory/ReadKeyText.h"

#include <memory>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kKeyHelp{
    "key",
    "Read a key: its signs, notes, relative key and one-byte code",
    "  brindle key \"F# minor\"\n"
    "  brindle key Bb --json\n"
    "  cat keys.txt | brindle key -\n",
};

TStatus Key(const CLineOptions& options) {
    const auto keys = ReadLines(options.mWords, ReadKeyText, &CKeyText::mSignKey);
    if (keys.index() == 0) return std::get<0>(keys);
    return Print(options.mFormat.Format() == TFormat::Json
                     ? TonalitiesJson(std::get<1>(keys))
                     : TonalitiesText(std::get<1>(keys), PaintOfOutput()));
}

}  // namespace

void AddKey(CCommand& program) {
    CCommand& command = program.AddCommand(kKeyHelp);
    const auto options = std::make_shared<CLineOptions>();
    command.AddArgument("KEY", options->mWords, "A key, major or minor; - reads one a line")
        .Required();
    options->mFormat.AddTo(command, {"text", "json"});
    command.OnCall([options] { return Key(*options); });
}

}  // namespace brindle::cli
