// SPDX-License-Identifier: MIT
#include "cli/ChordTextOptions.h"
#include "cli/CommandLine.h"

#include "brindle/present/CopiesText.h"
#include "brindle/present/MakeSongCopies.h"

#include <memory>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kCopiesHelp{
    "copies",
    "Find the passages of a song that repeat earlier ones, chord for chord",
    "  brindle copies --beats-per-chord 4 \"C Am F G C Am F G\"\n"
    "  brindle copies --file song.txt --beats-per-bar 3\n"
    "  cat song.txt | brindle copies - --json\n"
    "\n"
    "A chord text has chord symbols between white space; | goes on to the next bar\n"
    "line, and . holds the chord before it for one more step.\n",
};

struct CCopiesOptions {
    CChordReadingOptions mText;
    CFormatOptions mFormat;
};

TStatus Copies(const CCopiesOptions& options) {
    if (const auto contradiction = options.mText.Contradiction()) {
        return Fail(TStatus::BadUsage, *contradiction);
    }
    auto song = options.mText.ReadSong();
    if (!song) return TStatus::BadInput;
    CHarmonicAnalyse chordsOnly;
    chordsOnly.mChords = std::move(song->mChords);
    const std::vector<CShownCopy> copies = MakeSongCopies(chordsOnly, song->mSymbols);
    return Print(options.mFormat.Format() == TFormat::Json
                     ? CopiesJson(copies)
                     : CopiesText(copies, song->mBeatsPerBar, PaintOfOutput()));
}

}  // namespace

void AddCopies(CCommand& program) {
    CCommand& command = program.AddCommand(kCopiesHelp);
    const auto options = std::make_shared<CCopiesOptions>();
    options->mText.AddTo(command);
    options->mFormat.AddTo(command, {"text", "json"});
    command.OnCall([options] { return Copies(*options); });
}

}  // namespace brindle::cli
