// SPDX-License-Identifier: MIT
#include "cli/GridsFor.h"

#include "cli/ChordTextOptions.h"
#include "cli/CommandLine.h"
#include "cli/GridOptions.h"

#include "brindle/present/GridsSvg.h"
#include "brindle/present/SongGrids.h"

#include <memory>
#include <string>
#include <vector>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kGridsForHelp{
    "for",
    "Choose the fingerings of a song, and the capo that makes it easiest",
    "  brindle grids for \"Bb F | Gm Eb\"\n"
    "  brindle grids for --file song.cho --capo 0 --format svg >song.svg\n"
    "  brindle grids for \"C Am F G\" --tuning ukulele\n",
};

constexpr int kEasiestCapo = -1;
constexpr int kLastCapo = 12;

struct CGridsForOptions {
    CChordReadingOptions mText;
    std::string mTuning = "EADGBE";
    int mCapo = kEasiestCapo;
    int mHighestCapo = 7;
    CFingeringOptionsOfUser mFingering;
    CFormatOptions mFormat;
};

std::vector<CSongFingerings> SongsOf(std::span<const CChordLite> chords,
                                     const GChShortTuning& tuning,
                                     const CGridsForOptions& options) {
    CSongFingeringOptions song;
    song.mFingering = options.mFingering.Options();
    song.mHighestCapo = options.mHighestCapo;
    if (options.mCapo == kEasiestCapo) return CompareCapos(chords, tuning, song);
    song.mFingering.mCapo = options.mCapo;
    return {ChooseFingerings(chords, tuning, song)};
}

TStatus GridsFor(const CGridsForOptions& options) {
    if (const auto contradiction = options.mText.Contradiction()) {
        return Fail(TStatus::BadUsage, *contradiction);
    }
    const auto tuning = ReadTuningOption(options.mTuning);
    if (!tuning) return TStatus::BadUsage;
    const auto song = options.mText.ReadSong();
    if (!song) return TStatus::BadInput;
    std::vector<CChordLite> chords;
    std::vector<std::string> symbols;
    for (std::size_t i = 0; i + 1 < song->mChords.size(); ++i) {
        chords.push_back(song->mChords[i]);
        symbols.push_back(song->mSymbols.SymbolOf(song->mChords[i]));
    }
    const CShownSongGrids shown = MakeSongGrids(chords, symbols, SongsOf(chords, *tuning, options));
    const CGridStyle style = options.mFingering.Style();
    switch (options.mFormat.Format()) {
        case TFormat::Json:
            return Print(SongGridsJson(shown));
        case TFormat::Svg:
            return Print(GridsSvg(shown.mGrids, "Chord grids", style));
        default:
            return Print(SongGridsText(shown, PaintOfOutput(), style));
    }
}

}  // namespace

void AddGridsFor(CCommand& grids) {
    CCommand& command = grids.AddCommand(kGridsForHelp);
    const auto options = std::make_shared<CGridsForOptions>();
    options->mText.AddTo(command);
    command.AddOption("--tuning", "TUNING", options->mTuning,
                      "Name or open strings (default: EADGBE)");
    command.AddOption("--capo", "N", options->mCapo, "Fret of the capodaster (default: easiest)")
        .InRange(0, kLastCapo);
    command
        .AddOption("--highest-capo", "N", options->mHighestCapo,
                   "Last fret that is tried (default: 7)")
        .InRange(0, kLastCapo);
    options->mFingering.AddTo(command);
    options->mFormat.AddTo(command, {"text", "json", "svg"});
    command.OnCall([options] { return GridsFor(*options); });
}

}  // namespace brindle::cli
