// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"
#include "cli/HarmoniesFromNotes.h"
#include "cli/Json.h"
#include "cli/KeyText.h"
#include "cli/LeadSheet.h"

#include "brindle/present/CBars.h"
#include "brindle/present/CTable.h"
#include "brindle/present/ShownNames.h"
#include "brindle/song/HarmonySymbols.h"
#include "brindle/song/SheetTimes.h"
#include "brindle/song/WriteChordText.h"

#include <fmt/format.h>

#include <iostream>
#include <memory>

namespace brindle::cli {
namespace {

constexpr TCommandHelp kHelp{
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

struct THarmoniesOptions {
    std::string mFile;
    std::string mTiming = "played";
    bool mIsFromNotes = false;
    std::string mEvery = "change";
    std::string mKey;
    CFormatOptions mFormat;
};

std::string DegreesText(const TMusicXMLHarmony& harmony) {
    std::string text;
    for (const TMusicXMLDegree& degree : harmony.mDegrees) {
        if (!text.empty()) text += ", ";
        text += Printable(degree.mType) + ' ';
        if (degree.mAlter != 0) text += degree.mAlter < 0 ? 'b' : '#';
        text += Printable(degree.mValue);
    }
    return text;
}

// A score read as the library does may have chords without a place in time.
std::string TimeText(double time) {
    return time > -1e9 && time < 1e9 ? ShortNumber(time) : "-";
}

std::string HarmoniesText(const TMusicXMLDoc& sheet) {
    std::vector<double> starts;
    for (const CHarmBarline& barline : sheet.HarmBarlines) starts.push_back(barline.mPosition);
    const bool hasBars = !starts.empty();
    const CBars bars(1.0, std::move(starts));
    CTable table(
        hasBars ? std::vector<std::string>{" bar", " beat", " position", " length", "chord", "kind",
                                           "degrees"}
                : std::vector<std::string>{" position", " length", "chord", "kind", "degrees"});
    long barBefore = 0;
    for (const TMusicXMLHarmony& harmony : sheet.Harmonies) {
        std::vector<std::string> cells;
        if (hasBars) {
            const long bar = bars.BarOf(harmony.mPosition);
            cells = {bar == barBefore ? "" : fmt::format("{}", bar),
                     ShortNumber(bars.BeatOf(harmony.mPosition))};
            barBefore = bar;
        }
        cells.insert(cells.end(),
                     {TimeText(harmony.mPosition), TimeText(harmony.mDuration),
                      HarmonySymbol(harmony), Printable(harmony.mKind), DegreesText(harmony)});
        table.AddRow(std::move(cells));
    }
    const CPaint paint = PaintOfOutput();
    std::string text;
    if (!sheet.Title.empty()) text = paint.Strong(Printable(sheet.Title)) + "\n\n";
    return text + table.Text(paint);
}

std::string HarmoniesJson(const TMusicXMLDoc& sheet) {
    Json list = Json::array();
    for (const TMusicXMLHarmony& harmony : sheet.Harmonies) {
        Json degrees = Json::array();
        for (const TMusicXMLDegree& degree : harmony.mDegrees) {
            degrees.push_back({{"Value", Printable(degree.mValue)},
                               {"Alter", degree.mAlter},
                               {"Type", Printable(degree.mType)}});
        }
        list.push_back({{"Position", NumberToJson(harmony.mPosition)},
                        {"Duration", NumberToJson(harmony.mDuration)},
                        {"Symbol", HarmonySymbol(harmony)},
                        {"RootKeyEnh", KeyEnhToJson(harmony.mRoot.ToKeyEnh(NamePrefs()))},
                        {"BassKeyEnh", KeyEnhToJson(harmony.mBass.ToKeyEnh(NamePrefs()))},
                        {"Kind", Printable(harmony.mKind)},
                        {"Degrees", degrees}});
    }
    return JsonText({{"Title", Printable(sheet.Title)}, {"Harmonies", list}});
}

TStatus PrintChordText(const TMusicXMLDoc& sheet, const std::string& name) {
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
    return Print(chords->mText);
}

TChordEvery EveryOf(const std::string& word) {
    if (word == "bar") return TChordEvery::Bar;
    return word == "beat" ? TChordEvery::Beat : TChordEvery::Change;
}

TStatus FromNotes(const TTypedSong& song, const THarmoniesOptions& options) {
    const TFormat format = options.mFormat.Format();
    if (format == TFormat::Chords) {
        return Fail(TStatus::BadUsage, "--from-notes has no --format chords");
    }
    CChordsFromNotesOptions how;
    how.mEvery = EveryOf(options.mEvery);
    if (!options.mKey.empty()) {
        const auto key = ReadKeyOption(options.mKey);
        if (!key) return TStatus::BadUsage;
        how.mKey = *key;
    }
    return PrintChordsFromNotes(song, how, format == TFormat::Json);
}

TStatus Harmonies(const THarmoniesOptions& options) {
    const auto typed = ReadTypedSong({}, options.mFile);
    if (!typed) return TStatus::BadInput;
    if (options.mIsFromNotes) return FromNotes(*typed, options);
    const TTiming timing = options.mTiming == "native" ? TTiming::Native : TTiming::Played;
    const auto sheet = ReadLeadSheet(*typed, timing);
    if (!sheet) return TStatus::BadInput;
    if (options.mFormat.Format() == TFormat::Chords) return PrintChordText(*sheet, typed->mName);
    const bool isJson = options.mFormat.Format() == TFormat::Json;
    return Print(isJson ? HarmoniesJson(*sheet) : HarmoniesText(*sheet));
}

}  // namespace

void AddHarmonies(CCommand& program) {
    CCommand& command = program.AddCommand(kHelp);
    const auto options = std::make_shared<THarmoniesOptions>();
    command.AddArgument("FILE", options->mFile, "A score in MusicXML; - reads standard input")
        .Required();
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
