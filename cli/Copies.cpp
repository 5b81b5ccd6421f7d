// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"
#include "cli/TypedChords.h"
#include "cli/TypedSongs.h"

#include "brindle/present/AnalysisSvg.h"
#include "brindle/present/CChordSymbols.h"
#include "brindle/present/CopiesText.h"
#include "brindle/present/MakeSongCopies.h"

#include <memory>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kCopiesHelp{
    "copies",
    "Find the passages of a song that repeat earlier ones, chord for chord",
    "  brindle copies --beats-per-chord 4 \"C Am F G C Am F G\"\n"
    "  brindle copies song.txt --beats-per-bar 3\n"
    "  brindle copies song.musicxml --format svg >copies.svg\n"
    "  cat song.txt | brindle copies - --json\n"
    "\n"
    "A chord text has chord symbols between white space; | goes on to the next bar\n"
    "line, and . holds the chord before it for one more step. The text shows the longest\n"
    "passages of whole bars; JSON and the picture have the copies that the library finds,\n"
    "which may begin and end within bars.\n",
};

struct CCopiesOptions {
    CTypedSongs mSongs;
    CTypedChords mReading;
    CFormatOptions mFormat;
};

TSongOutput CopiesOf(const CTypedSong& typed, const CCopiesOptions& options) {
    const auto song = options.mReading.ReadSongOrFail(typed);
    if (!song) return TStatus::BadInput;
    const TFormat format = options.mFormat.Format();
    if (format == TFormat::Text) return RepeatsText(*song, PaintOfOutput());
    CHarmonicAnalyse chordsOnly;
    chordsOnly.mChords = song->mChords;
    const CChordSymbols symbols(song->mSymbols, song->mChords);
    std::vector<CShownCopy> copies = MakeSongCopies(chordsOnly, symbols);
    if (format == TFormat::Json) return CopiesJson(copies, *song);
    CShownSong shown = MakeSong(chordsOnly, nullptr, symbols, song->mBeatsPerBar);
    shown.mCopies = std::move(copies);
    return AnalysisSvg(shown);
}

TStatus Copies(const CCopiesOptions& options) {
    auto contradiction = options.mSongs.Contradiction(options.mFormat.Format());
    if (!contradiction) contradiction = options.mReading.BeatsContradiction();
    if (contradiction) return Fail(TStatus::BadUsage, *contradiction);
    return options.mSongs.Print(options.mFormat.Format(),
                                [&](const CTypedSong& song) { return CopiesOf(song, options); });
}

}  // namespace

void AddCopies(CCommand& program) {
    CCommand& command = program.AddCommand(kCopiesHelp);
    const auto options = std::make_shared<CCopiesOptions>();
    options->mSongs.AddTo(command);
    options->mReading.AddBeatsTo(command);
    options->mReading.AddTo(command, "In what form the chord text is written");
    options->mFormat.AddTo(command, {"text", "json", "svg"});
    command.OnCall([options] { return Copies(*options); });
}

}  // namespace brindle::cli
