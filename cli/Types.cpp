// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"

#include "brindle/chords/CChordTypes.h"
#include "brindle/present/ChordTypesText.h"

#include <memory>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kTypesHelp{
    "types",
    "List the catalogue of chord types: id, name, intervals, and the name on C",
    "  brindle types\n"
    "  brindle types --json\n",
};

TStatus Types(const CFormatOptions& format) {
    const CChordTypeVec& types = _s_chordTypes().BuiltIn();
    return Print(format.Format() == TFormat::Json ? ChordTypesJson(types)
                                                  : ChordTypesText(types, PaintOfOutput()));
}

}  // namespace

void AddTypes(CCommand& program) {
    CCommand& command = program.AddCommand(kTypesHelp);
    const auto format = std::make_shared<CFormatOptions>();
    format->AddTo(command, {"text", "json"});
    command.OnCall([format] { return Types(*format); });
}

}  // namespace brindle::cli
