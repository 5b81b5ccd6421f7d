// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"
#include "cli/GridDatabase.h"
#include "cli/GridsFor.h"
#include "cli/Input.h"
#include "cli/Json.h"

#include "brindle/platform/JsonString.h"
#include "brindle/present/GridLibrariesText.h"
#include "brindle/present/GridPackageJson.h"
#include "brindle/present/GridsJson.h"
#include "brindle/present/GridsSvg.h"
#include "brindle/present/GridsText.h"

#include <memory>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kGridPackagesHelp{
    "grids",
    "List, show, export and import packages of fingerings, or choose those of a song",
    "  brindle grids list\n"
    "  brindle grids show my.gchdb --format svg >grids.svg\n"
    "  brindle grids export my.gchdb >grids.json\n"
    "  brindle grids import my.gchdb <grids.json\n"
    "  brindle grids for \"Bb F | Gm Eb\"\n"
    "\n"
    "A package is a folder with one file for each library. Without a PATH it is the\n"
    "package that comes with the program, together with the user's own.\n",
};

struct CPackageOptions {
    std::string mPath;
    std::string mFile = "-";
    CFormatOptions mFormat;
};

TStatus List(const CPackageOptions& options) {
    const auto database = ReadGrids(options.mPath);
    if (database == nullptr) return TStatus::BadInput;
    return Print(options.mFormat.Format() == TFormat::Json
                     ? GridLibrariesJson(*database)
                     : GridLibrariesText(*database, PaintOfOutput()));
}

TStatus Show(const CPackageOptions& options) {
    const auto database = ReadGrids(options.mPath);
    if (database == nullptr) return TStatus::BadInput;
    const std::vector<CChordGrid> grids = AllGridsOf(*database);
    if (options.mFormat.Format() == TFormat::Json) return Print(GridsJson(grids));
    if (options.mFormat.Format() == TFormat::Svg) return Print(GridsSvg(grids, "Chord grids"));
    return Print(GridsText(grids, PaintOfOutput()));
}

TStatus Export(const CPackageOptions& options) {
    const auto database = ReadGrids(options.mPath);
    if (database == nullptr) return TStatus::BadInput;
    return Print(JsonText(DatabaseToJson(*database)));
}

TStatus Import(const CPackageOptions& options) {
    const auto text = ReadInput(options.mFile);
    if (!text) return TStatus::BadInput;
    const std::string from =
        options.mFile == "-" ? std::string("standard input") : Printable(options.mFile);
    const Json json = ParseJson(*text);
    if (json.is_discarded()) return Fail(TStatus::BadInput, from + " is no JSON");
    GChDatabase database;
    std::string fault = ReadDatabase(json, database);
    if (fault.empty() && !CanPackageKeep(database)) {
        fault =
            "a package cannot keep all of it; a fingering has 1 to 15 elements, these lie within "
            "8 frets, and of more than 8 strings the upper ones are muted together";
    }
    if (!fault.empty()) return Fail(TStatus::BadInput, from + ": " + fault);
    if (GChDatabase::writeLibraries(database.allLibrariesForAnyTuning(), options.mPath)) {
        return TStatus::Success;
    }
    return Fail(
        TStatus::BadInput,
        Printable(options.mPath) + " cannot be written, or holds something else than a package");
}

using TAction = TStatus (*)(const CPackageOptions&);

/// Adds "grids <name>"; `formats` are none for an action that has only one.
CCommand& AddAction(CCommand& grids, const char* name, const char* purpose, TAction action,
                    const std::vector<std::string>& formats,
                    const std::shared_ptr<CPackageOptions>& options) {
    CCommand& command = grids.AddCommand({name, purpose, nullptr});
    command.AddArgument("PATH", options->mPath, "The package");
    if (!formats.empty()) options->mFormat.AddTo(command, formats);
    command.OnCall([options, action] { return action(*options); });
    return command;
}

}  // namespace

void AddGrids(CCommand& program) {
    CCommand& command = program.AddCommand(kGridPackagesHelp);
    const auto options = [] { return std::make_shared<CPackageOptions>(); };
    AddAction(command, "list", "Show the libraries", List, {"text", "json"}, options());
    AddAction(command, "show", "Draw all fingerings", Show, {"text", "json", "svg"}, options());
    AddAction(command, "export", "Print a package as JSON", Export, {}, options());
    const auto importOptions = options();
    CCommand& importing = AddAction(command, "import", "Replace a package by what JSON holds",
                                    Import, {}, importOptions);
    importing.Option("PATH").Required();
    importing.AddOption("--from", "FILE", importOptions->mFile,
                        "The JSON (default: standard input)");
    AddGridsFor(command);
}

}  // namespace brindle::cli
