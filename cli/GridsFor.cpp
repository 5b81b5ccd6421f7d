// SPDX-License-Identifier: MIT
#include "cli/GridsFor.h"

#include "cli/CommandLine.h"
#include "cli/GridOptions.h"
#include "cli/TypedChords.h"
#include "cli/TypedSongs.h"

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
    "  brindle grids for song.cho --capo 0 --format svg >song.svg\n"
    "  brindle grids for \"C Am F G\" --tuning ukulele\n",
};

constexpr int kEasiestCapo = -1;
constexpr int kLastCapo = 12;

struct CGridsForOptions {
    CTypedSongs mSongs;
    CTypedChords mReading;
    std::string mTuning = "EADGBE";
    int mCapo = kEasiestCapo;
    int mHighestCapo = 7;
    CFingeringOptionsOfUser mFingering;
    CFormatOptions mFormat;
};

CShownSongGrids ChosenGrids(const CSong& song, const GChShortTuning& tuning,
                            const CGridsForOptions& options) {
    CSongFingeringOptions choice;
    choice.mFingering = options.mFingering.Options();
    choice.mHighestCapo = options.mHighestCapo;
    const bool isTold = options.mCapo != kEasiestCapo;
    if (isTold) choice.mFingering.mCapo = options.mCapo;
    return MakeSongGrids(song, tuning, choice, isTold ? TSongCapo::Told : TSongCapo::Easiest);
}

TSongOutput GridsOf(const CTypedSong& typed, const GChShortTuning& tuning,
                    const CGridsForOptions& options) {
    const auto song = options.mReading.ReadSongOrFail(typed);
    if (!song) return TStatus::BadInput;
    const CShownSongGrids shown = ChosenGrids(*song, tuning, options);
    const CGridStyle style = options.mFingering.Style();
    switch (options.mFormat.Format()) {
        case TFormat::Json:
            return SongGridsJson(shown, style);
        case TFormat::Svg:
            return SongGridsSvg(shown, "Chord grids", style);
        default:
            return SongGridsText(shown, PaintOfOutput(), style);
    }
}

TStatus GridsFor(const CGridsForOptions& options) {
    auto contradiction = options.mSongs.Contradiction(options.mFormat.Format());
    if (!contradiction) contradiction = options.mReading.BeatsContradiction();
    if (contradiction) return Fail(TStatus::BadUsage, *contradiction);
    const auto tuning = ReadTuningOption(options.mTuning);
    if (!tuning) return TStatus::BadUsage;
    if (GChNumberOfStringsInShortTuning(*tuning) > kFingeringMostStrings) {
        return FailWithoutFingering("a song", *tuning);
    }
    return options.mSongs.Print(options.mFormat.Format(), [&](const CTypedSong& song) {
        return GridsOf(song, *tuning, options);
    });
}

}  // namespace

void AddGridsFor(CCommand& grids) {
    CCommand& command = grids.AddCommand(kGridsForHelp);
    const auto options = std::make_shared<CGridsForOptions>();
    options->mSongs.AddTo(command);
    options->mReading.AddBeatsTo(command);
    options->mReading.AddTo(command, "In what form the song is written");
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
