// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"
#include "cli/KeyText.h"
#include "cli/LineByLine.h"

#include "brindle/present/ShownNames.h"
#include "brindle/theory/CScaleLite.h"

#include <fmt/format.h>

#include <memory>
#include <sstream>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kScaleHelp{
    "scale",
    "Read a scale: its notes as they are spelled, mask, type and signs",
    "  brindle scale \"D dorian\"\n"
    "  brindle scale Bb blues minor --json\n"
    "  cat scales.txt | brindle scale -\n",
};

std::string TypeName(TScaleType type) {
    std::ostringstream name;
    name << type;
    return name.str();
}

// In the language of the user; empty for a scale without a type.
std::string LocalizedName(TScaleType type) {
    return CScaleHeavy::LocalizedNameForScaleType(type).value_or(std::string());
}

std::string_view NameOf(const CScaleHeavy& scale) {
    return scale.ScaleType() == st_custom ? "Custom" : scale.ScaleRow().mName;
}

Json ScaleToJson(const CScaleHeavy& scale) {
    const CSemitones semitones = CScaleLite(scale).mSemitones;
    return {{"Name", fmt::format("{} {}", KeyName(scale.RootKeyEnh()), NameOf(scale))},
            {"CKeyEnh", KeyEnhToJson(scale.RootKeyEnh())},
            {"Type", TypeName(scale.ScaleType())},
            {"TypeName", LocalizedName(scale.ScaleType())},
            {"Semitones", semitones.Mask()},
            {"Intervals", IntervalsToJson(semitones)},
            {"Notes", KeyEnhsToJson(KeysOf(scale))},
            {"SignsCount", scale.SignsCount()}};
}

std::string TypeText(TScaleType type) {
    return fmt::format("{} ({})", LocalizedName(type), TypeName(type));
}

std::string ScaleText(const CScaleHeavy& scale, const CPaint& paint) {
    const CSemitones semitones = CScaleLite(scale).mSemitones;
    return fmt::format(
        "{}\n"
        "  notes      {}\n"
        "  semitones  {}\n"
        "  mask       {}\n"
        "  type       {}\n"
        "  signs      {}\n",
        paint.Strong(fmt::format("{} {}", KeyName(scale.RootKeyEnh()), NameOf(scale))),
        NotesText(KeysOf(scale)), SemitonesText(semitones), semitones.Mask(),
        TypeText(scale.ScaleType()), SignsText(scale.SignsCount()));
}

TStatus Scale(const CLineOptions& options) {
    return PrintLineByLine(
        options, "Scales", ReadScaleText,
        [](const CScaleText& read) { return ScaleToJson(read.mScale); },
        [](const CScaleText& read) { return ScaleText(read.mScale, PaintOfOutput()); });
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
