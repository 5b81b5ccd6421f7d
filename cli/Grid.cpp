// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"
#include "cli/GridDatabase.h"
#include "cli/GridOptions.h"
#include "cli/NamingOptions.h"
#include "cli/Progress.h"
#include "cli/TypedChords.h"
#include "cli/TypedSymbols.h"

#include "brindle/chords/NameNotes.h"
#include "brindle/platform/Ascii.h"
#include "brindle/present/GridsJson.h"
#include "brindle/present/GridsSvg.h"
#include "brindle/present/GridsText.h"

#include <fmt/format.h>

#include <memory>
#include <variant>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kGridHelp{
    "grid",
    "Name the chord of a guitar fingering, or show the fingerings of a chord",
    "  brindle grid x32010\n"
    "  brindle grid x-10-12-12-11-10 --capo 2\n"
    "  brindle grid 000232 --tuning DADGAD\n"
    "  brindle grid Am7 F --format svg >grids.svg\n"
    "  brindle grid C13 --find --most 3 --dots intervals\n"
    "  brindle grid G7 --tuning ukulele --left\n"
    "  brindle grid 224442 Bm --german --h-for-b\n"
    "\n"
    "A fingering has a fret for each string from the lowest one; x is a muted string,\n"
    "0 an open one. Frets of two digits need a - between the strings. A chord is looked\n"
    "up in the package; where that has none, and with --find, fingerings are searched.\n"
    "Tunings are standard, drop-d, dadgad, open-g, open-d, half-step-down, 7-string,\n"
    "bass, ukulele, ukulele-low-g, baritone-ukulele, mandolin, banjo, cavaquinho and\n"
    "some more, or any list of notes.\n",
};

constexpr int kMostCapo = 24;

struct CGridOptions {
    std::vector<std::string> mWords;
    std::string mTuning = "EADGBE";
    int mCapo = 0;
    std::string mPackage;
    bool mIsFound = false;
    CFingeringOptionsOfUser mFingering;
    CTypedChords mReading;
    CNamingOptions mNaming;
    CFormatOptions mFormat;
};

/// The grids of one word, or the status of an error that has been printed.
using TGrids = std::variant<TStatus, std::vector<CChordGrid>>;

TGrids GridsOfFrets(const std::string& word, const std::vector<int>& frets,
                    const GChShortTuning& tuning, const CGridOptions& options) {
    const auto strings = static_cast<std::size_t>(GChNumberOfStringsInShortTuning(tuning));
    if (frets.size() != strings) {
        const std::string_view unit = frets.size() == 1 ? "string" : "strings";
        return Fail(TStatus::BadInput,
                    fmt::format("{} has {} {}, the tuning {} has {}", word, frets.size(), unit,
                                TuningText(tuning), strings));
    }
    auto grid = GridOfFrets(word, frets, tuning, options.mCapo, options.mNaming.ToldPrefs());
    if (!grid)
        return Fail(TStatus::BadInput, word + ": a fingering has at most 15 fretted strings");
    return std::vector{std::move(*grid)};
}

/// Looks chords up; the packages are read when the first chord is asked for.
class CLookUp {
public:
    CLookUp(const CGridOptions& options, const GChShortTuning& tuning)
        : mOptions(options), mReading(options.mReading), mTuning(tuning) {
        if (options.mNaming.ReadsBAsBFlat()) mReading.UseBAsBFlat();
    }

    TGrids GridsOf(const std::string& word) {
        const std::string symbol = Printable(Ascii::Trimmed(word));
        const bool beginsAsFrets = word.find_first_of("0123456789") == 0;
        const auto chord = beginsAsFrets ? CChordLite() : mReading.ReadSymbol(word);
        if (!chord) return TStatus::BadInput;
        if (chord->IsUndef()) {
            return Fail(TStatus::BadInput, symbol + " is neither a fingering nor a chord symbol");
        }
        CFingeringOptions fingering = mOptions.mFingering.Options();
        fingering.mCapo = mOptions.mCapo;
        if (!mOptions.mIsFound && mDatabase == nullptr) {
            mDatabase = ReadGrids(mOptions.mPackage);
            if (mDatabase == nullptr) return TStatus::BadInput;
        }
        auto grids = mOptions.mIsFound
                         ? FoundGrids(symbol, *chord, mTuning, fingering)
                         : GridsForChord(*mDatabase, symbol, *chord, mTuning, fingering);
        if (const auto style = mOptions.mNaming.ToldPrefs()) {
            const std::string name = Printable(ChordSymbolInStyle(*chord, *style));
            for (CChordGrid& grid : grids) {
                grid.mName = name;
                grid.mStyle = style;
            }
        }
        if (!grids.empty()) return grids;
        return FailWithoutFingering(symbol, mTuning);
    }

private:
    const CGridOptions& mOptions;
    CTypedChords mReading;
    GChShortTuning mTuning;
    std::unique_ptr<GChDatabase> mDatabase;
};

TStatus Present(const std::vector<CChordGrid>& grids, const CGridOptions& options) {
    const CGridStyle style = options.mFingering.Style();
    if (options.mFormat.Format() == TFormat::Json) return Print(GridsJson(grids, style));
    if (options.mFormat.Format() == TFormat::Text) {
        return Print(GridsText(grids, PaintOfOutput(), style));
    }
    return Print(
        GridsSvg(grids, Printable(fmt::format("{}", fmt::join(options.mWords, " "))), style));
}

TStatus Grid(const CGridOptions& options) {
    const auto tuning = ReadTuningOption(options.mTuning);
    if (!tuning) return TStatus::BadUsage;
    const auto words = TypedSymbols(options.mWords);
    if (!words) return TStatus::BadInput;
    CLookUp lookUp(options, *tuning);
    CProgress progress(words->size());
    std::vector<CChordGrid> grids;
    auto status = TStatus::Success;
    for (const std::string& word : *words) {
        progress.Step(word);
        const auto frets = ReadFrets(word);
        TGrids found = frets ? GridsOfFrets(word, *frets, *tuning, options) : lookUp.GridsOf(word);
        if (found.index() == 0) {
            status = std::get<0>(found);
            continue;
        }
        for (CChordGrid& grid : std::get<1>(found)) grids.push_back(std::move(grid));
    }
    if (grids.empty() && status != TStatus::Success) return status;
    const TStatus shown = Present(grids, options);
    return status == TStatus::Success ? shown : status;
}

}  // namespace

void AddGrid(CCommand& program) {
    CCommand& command = program.AddCommand(kGridHelp);
    const auto options = std::make_shared<CGridOptions>();
    command
        .AddArgument("GRID", options->mWords, "Fingerings or chord symbols; - reads standard input")
        .Required();
    command.AddOption("--tuning", "TUNING", options->mTuning,
                      "Name or open strings (default: EADGBE)");
    command.AddOption("--capo", "N", options->mCapo, "Fret of the capodaster (default: 0)")
        .InRange(0, kMostCapo);
    command.AddOption("--package", "PATH", options->mPackage, "Package to look chords up in");
    command.AddFlag("--find", options->mIsFound, "Search fingerings rather than look them up");
    options->mFingering.AddTo(command);
    options->mReading.AddTo(command);
    options->mFormat.AddTo(command, {"text", "json", "svg"});
    options->mNaming.AddSymbolsTo(command);
    command.OnCall([options] { return Grid(*options); });
}

}  // namespace brindle::cli
