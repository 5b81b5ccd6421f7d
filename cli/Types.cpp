// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"
#include "cli/Json.h"

#include "brindle/chords/CChordTypes.h"
#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/present/CTable.h"
#include "brindle/present/ShownNames.h"

#include <fmt/format.h>

#include <memory>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kTypesHelp{
    "types",
    "List the catalogue of chord types: id, name, intervals, and the name on C",
    "  brindle types\n"
    "  brindle types --json\n",
};

std::string NameOnC(const CChordType& type) {
    CSemitones semitones;
    for (const int intvl : type.mIntvls) semitones.AddIntvl(intvl % 12);
    return "C" + ChordSymbolSuffix(semitones);
}

std::string TypesJson(const CChordTypeVec& types) {
    Json list = Json::array();
    for (const CChordType& type : types) {
        list.push_back({{"Id", type.mId},
                        {"Name", type.mName},
                        {"Intervals", std::vector<int>(type.mIntvls.begin(), type.mIntvls.end())},
                        {"NameOnC", NameOnC(type)}});
    }
    return JsonText({{"ChordTypes", list}});
}

std::string TypesText(const CChordTypeVec& types, const CPaint& paint) {
    CTable table({" id", "name", "intervals", "on C"});
    for (const CChordType& type : types) {
        table.AddRow({fmt::format("{}", type.mId), type.mName,
                      fmt::format("{}", fmt::join(type.mIntvls, " ")), NameOnC(type)});
    }
    return table.Text(paint);
}

TStatus Types(const CFormatOptions& format) {
    const CChordTypeVec& types = _s_chordTypes().BuiltIn();
    return Print(format.Format() == TFormat::Json ? TypesJson(types)
                                                  : TypesText(types, PaintOfOutput()));
}

}  // namespace

void AddTypes(CCommand& program) {
    CCommand& command = program.AddCommand(kTypesHelp);
    const auto format = std::make_shared<CFormatOptions>();
    format->AddTo(command, {"text", "json"});
    command.OnCall([format] { return Types(*format); });
}

}  // namespace brindle::cli
