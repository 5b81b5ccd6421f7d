// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"
#include "cli/HarmoniesFromNotes.h"
#include "cli/KeyText.h"
#include "cli/TypedSong.h"
#include "cli/TypedSongs.h"

#include "brindle/present/HarmoniesText.h"
#include "brindle/song/SheetTimes.h"
#include "brindle/song/WriteChordText.h"

#include <fmt/format.h>

#include <iostream>
#include <memory>
#include <optional>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kHarmoniesHelp{
    "harmonies",
    "List the chords of a score in the order in which they are played",
    "  brindle harmonies song.musicxml\n"
    "  brindle harmonies song.mxl --json\n"
    "  brindle harmonies song.xml --format chords >song.txt\n"
    "  brindle harmonies --from-notes piano.musicxml\n"
    "  brindle harmonies --from-notes chorale.mxl --every beat --key \"G minor\"\n"
    "\n"
    "Repeats, endings and jumps are played through. Positions and lengths are quarter\n"
    "notes. With --from-notes the chords are named from what sounds, in the bars as they are\n"
    "written, for scores without chord symbols.\n",
};

struct CHarmoniesOptions {
    CTypedSongs mScores;
    std::string mTiming = "played";
    bool mIsFromNotes = false;
    std::string mEvery = "change";
    std::string mKey;
    CFormatOptions mFormat;
};

TSongOutput ChordText(const TMusicXMLDoc& sheet, const std::string& name) {
    if (!HasTimes(sheet)) {
        return Fail(TStatus::BadInput,
                    fmt::format("{}: some chords have no length", Printable(name)));
    }
    const auto chords = WriteChordText(sheet);
    if (!chords) {
        return Fail(TStatus::BadInput,
                    fmt::format("{}: too long for a chord text", Printable(name)));
    }
    if (chords->mBeatsPerBar != 4.0 || chords->mBeatsPerChord != 1.0) {
        std::cerr << fmt::format("brindle: read it with --beats-per-bar {} --beats-per-chord {}\n",
                                 chords->mBeatsPerBar, chords->mBeatsPerChord);
    }
    return chords->mText;
}

TChordEvery EveryOf(const std::string& word) {
    if (word == "bar") return TChordEvery::Bar;
    return word == "beat" ? TChordEvery::Beat : TChordEvery::Change;
}

TSongOutput HarmoniesOf(const CTypedSong& score, const CHarmoniesOptions& options) {
    const bool isNative = options.mTiming == "native";
    const auto sheet =
        ReadHarmonies(score, isNative ? TLeadSheetTiming::Native : TLeadSheetTiming::Played);
    if (!sheet) return TStatus::BadInput;
    if (options.mFormat.Format() == TFormat::Chords) return ChordText(*sheet, score.mName);
    const bool isJson = options.mFormat.Format() == TFormat::Json;
    return isJson ? HarmoniesJson(*sheet) : HarmoniesText(*sheet, PaintOfOutput());
}

// What is wrong with options that are fine one by one.
std::optional<std::string> Contradiction(const CHarmoniesOptions& options) {
    const bool isOfNotes = !options.mKey.empty() || options.mEvery != "change";
    if (isOfNotes && !options.mIsFromNotes) return "--key and --every go with --from-notes";
    if (options.mIsFromNotes && options.mFormat.Format() == TFormat::Chords) {
        return "--from-notes has no --format chords";
    }
    return options.mScores.Contradiction(options.mFormat.Format());
}

TStatus Harmonies(const CHarmoniesOptions& options) {
    if (const auto contradiction = Contradiction(options)) {
        return Fail(TStatus::BadUsage, *contradiction);
    }
    CChordsFromNotesOptions how;
    how.mEvery = EveryOf(options.mEvery);
    const auto key = ReadKeyIfTold(options.mKey);
    if (!key) return TStatus::BadUsage;
    how.mKey = *key;
    const TFormat format = options.mFormat.Format();
    return options.mScores.Print(format, [&](const CTypedSong& score) {
        return options.mIsFromNotes ? ShowChordsFromNotes(score, how, format == TFormat::Json)
                                    : HarmoniesOf(score, options);
    });
}

}  // namespace

void AddHarmonies(CCommand& program) {
    CCommand& command = program.AddCommand(kHarmoniesHelp);
    const auto options = std::make_shared<CHarmoniesOptions>();
    options->mScores.AddFilesTo(command);
    command.AddChoice("--timing", options->mTiming, {"played", "native"},
                      "How the chords of a score follow each other");
    command.AddFlag("--from-notes", options->mIsFromNotes,
                    "Name the chords from the notes of the score");
    command.AddChoice("--every", options->mEvery, {"bar", "beat", "change"},
                      "Where chords from notes may stand");
    command.AddOption("--key", "KEY", options->mKey,
                      "The key for chords from notes; without it, it is found");
    options->mFormat.AddTo(command, {"text", "json", "chords"});
    command.OnCall([options] { return Harmonies(*options); });
}

}  // namespace brindle::cli
