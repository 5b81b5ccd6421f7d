// SPDX-License-Identifier: MIT
#include "cli/ChordTextOptions.h"
#include "cli/CommandLine.h"
#include "cli/Json.h"

#include "brindle/present/CBars.h"
#include "brindle/present/CChordSymbols.h"
#include "brindle/present/CTable.h"
#include "brindle/present/MakeSongCopies.h"

#include <memory>

namespace brindle::cli {
namespace {

constexpr TCommandHelp kHelp{
    "copies",
    "Find the passages of a song that repeat earlier ones, chord for chord",
    "  brindle copies --beats-per-chord 4 \"C Am F G C Am F G\"\n"
    "  brindle copies --file song.txt --beats-per-bar 3\n"
    "  cat song.txt | brindle copies - --json\n"
    "\n"
    "A chord text has chord symbols between white space; | goes on to the next bar\n"
    "line, and . holds the chord before it for one more step.\n",
};

struct TCopiesOptions {
    CChordTextOptions mText;
    CFormatOptions mFormat;
};

Json RangeToJson(const CTimeRange& range) {
    return {{"Position", NumberToJson(range.mBegin)}, {"End", NumberToJson(range.mEnd)}};
}

std::string CopiesJson(const std::vector<CShownCopy>& copies) {
    Json list = Json::array();
    for (const CShownCopy& shown : copies) {
        list.push_back({{"TargetPos", NumberToJson(shown.mCopy.mTargetPos)},
                        {"SourceOffsetBars", shown.mCopy.mSourceOffsetBars},
                        {"LengthBars", shown.mCopy.mLengthBars},
                        {"Source", RangeToJson(shown.mSource)},
                        {"Target", RangeToJson(shown.mTarget)},
                        {"Symbols", shown.mSymbols}});
    }
    return JsonText({{"HarmCopies", list}});
}

std::string LengthText(double bars) {
    return ShortNumber(bars) + (bars == 1.0 ? " bar" : " bars");
}

std::string CopiesText(const std::vector<CShownCopy>& copies, double beatsPerBar,
                       const CPaint& paint) {
    if (copies.empty()) return "no passage is repeated\n";
    const CBars bars(beatsPerBar);
    CTable table({"source", "target", "length", "chords"});
    for (const CShownCopy& shown : copies) {
        table.AddRow({BarsOf(shown.mSource, bars), BarsOf(shown.mTarget, bars),
                      LengthText((shown.mTarget.mEnd - shown.mTarget.mBegin) / beatsPerBar),
                      FirstAndLast(shown.mSymbols)});
    }
    return table.Text(paint);
}

TStatus Copies(const TCopiesOptions& options) {
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
    CCommand& command = program.AddCommand(kHelp);
    const auto options = std::make_shared<TCopiesOptions>();
    options->mText.AddTo(command);
    options->mFormat.AddTo(command, {"text", "json"});
    command.OnCall([options] { return Copies(*options); });
}

}  // namespace brindle::cli
