// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"
#include "cli/LineByLine.h"

#include "brindle/present/ScalesText.h"
#include "brindle/theory/ReadKeyText.h"

#include <memory>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kScaleHelp{
    "scale",
    "Read a scale: its notes as they are spelled, mask, type and signs",
    "  brindle scale \"D dorian\"\n"
    "  brindle scale Bb blues minor --json\n"
    "  cat scales.txt | brindle scale -\n",
};

TStatus Scale(const CLineOptions& options) {
    const auto scales = ReadLines(options.mWords, ReadScaleText, &CScaleText::mScale);
    if (scales.index() == 0) return std::get<0>(scales);
    return Print(options.mFormat.Format() == TFormat::Json
                     ? ScalesJson(std::get<1>(scales))
                     : ScalesText(std::get<1>(scales), PaintOfOutput()));
}

}  // namespace

void AddScale(CCommand& program) {
    CCommand& command = program.AddCommand(kScaleHelp);
    const auto options = std::make_shared<CLineOptions>();
    command
        .AddArgument("SCALE", options->mWords, "A key and the name of a scale; - reads one a line")
        .Required();
    options->mFormat.AddTo(command, {"text", "json"});
    command.OnCall([options] { return Scale(*options); });
}

}  // namespace brindle::cli
