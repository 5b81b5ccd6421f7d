// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"
#include "cli/KeyText.h"
#include "cli/SheetPicture.h"
#include "cli/TypedChords.h"
#include "cli/TypedSong.h"
#include "cli/TypedSongs.h"

#include "brindle/present/AnalysisJson.h"
#include "brindle/present/AnalysisSvg.h"
#include "brindle/present/CentersText.h"
#include "brindle/present/Explain.h"
#include "brindle/present/MakeSongKeys.h"
#include "brindle/present/ReadingText.h"
#include "brindle/present/ShowSong.h"
#include "brindle/present/SongGrids.h"
#include "brindle/song/AnalyseSong.h"
#include "brindle/song/ReadSongHarmony.h"
#include "brindle/song/SheetTimes.h"

#include <fmt/format.h>

#include <memory>
#include <optional>
#include <sstream>
#include <utility>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kAnalyseHelp{
    "analyse",
    "Read a song as a teacher does: keys, numerals, what each chord is and leads to",
    "  brindle analyse \"Dm7 G7 | C\"\n"
    "  brindle analyse --long --explain \"C E7 | Am D7 | G7 C\"\n"
    "  brindle analyse --key \"A minor\" --centers \"Am Dm | E7 Am\"\n"
    "  brindle analyse song.txt --beats-per-bar 3 --format svg >song.svg\n"
    "  brindle analyse song.musicxml --format svg >song.svg\n"
    "  brindle analyse --beats-per-chord 4 song.cho\n"
    "  brindle analyse songs/*.txt --json >songs.ndjson\n"
    "  cat song.txt | brindle analyse - --json\n"
    "\n"
    "A chord text has chord symbols between white space; | goes on to the next bar\n"
    "line, . holds the chord before it for one more step, and what stands between |:\n"
    "and :| is played twice. A score in MusicXML (.musicxml, .xml, .mxl) is played\n"
    "through its repeats, endings and jumps.\n",
};

constexpr int kHighestCapo = 12;

struct CAnalyseOptions {
    CTypedSongs mSongs;
    std::string mRoute = "tonic";
    std::string mKey;
    std::string mTiming = "played";
    CTypedChords mReading;
    bool mReadings = false;
    bool mCenters = false;
    bool mLong = false;
    bool mExplain = false;
    bool mGrids = false;
    int mCapo = 0;
    bool mIsLeftHanded = false;
    CNumeralOptions mNumerals;
    CSheetPicture mSheetPicture;
    CFormatOptions mFormat;
};

TAnalyse RouteOf(const std::string& name) {
    if (name == "tonic") return TAnalyse_TonicProgressions;
    if (name == "cadence") return TAnalyse_CadenceProgressions;
    return name == "weights" ? TAnalyse_CenterWeights : TAnalyse_None;
}

// Readings and grids are drawn over the time axis alone.
bool IsSheetWanted(const CAnalyseOptions& options) {
    return !options.mSheetPicture.IsAxis() && !options.mReadings && !options.mGrids;
}

// What is wrong with options that are fine one by one.
std::optional<std::string> Contradiction(const CAnalyseOptions& options) {
    if (auto songs = options.mSongs.Contradiction(options.mFormat.Format())) return songs;
    if (auto beats = options.mReading.BeatsContradiction()) return beats;
    const bool isText = options.mFormat.Format() == TFormat::Text;
    if ((options.mLong || options.mCenters) && !isText) {
        return "--long and --centers are for text, --format text";
    }
    if (options.mExplain && !isText && options.mFormat.Format() != TFormat::Json) {
        return "--explain has words for --format text and json";
    }
    const bool isNative = options.mFormat.Format() == TFormat::Native;
    if (options.mReadings && isNative) {
        return "--readings has no native form; --format json shows them";
    }
    if (options.mNumerals != CNumeralOptions{} && isNative)
        return "the native form has no numerals";
    if (options.mGrids && options.mFormat.Format() != TFormat::Svg) {
        return "--grids belong into a picture, --format svg";
    }
    if ((options.mGrids || options.mReadings) && options.mSheetPicture.IsSheetTold()) {
        return "--grids and --readings are drawn over a time axis, --picture axis";
    }
    if ((options.mCapo > 0 || options.mIsLeftHanded) && !options.mGrids) {
        return "--capo and --left are for --grids";
    }
    const bool isPicture = options.mFormat.Format() == TFormat::Svg;
    return options.mSheetPicture.Contradiction(isPicture, !IsSheetWanted(options));
}

/// A song that has been read, and what its presentations need beside that.
struct CAnalysedSong {
    /// As it is played.
    CSong mSong;
    CSongReading mReading;
    /// Empty if they were not asked for.
    std::vector<std::string> mExplanations;
    /// A score in the timing for hosts, if that was asked for; its centers are found in it.
    std::optional<TMusicXMLDoc> mSheet;
};

CSongAnalysis FindAll(const CAnalysedSong& analysed, const CAnalyseOptions& options) {
    const CAnalyseSongOptions asked{RouteOf(options.mRoute), options.mReadings,
                                    options.mFormat.Format() == TFormat::Svg, options.mNumerals};
    return analysed.mSheet ? AnalyseSheet(*analysed.mSheet, asked)
                           : AnalyseSong(analysed.mSong, asked);
}

CShownSong Show(const CAnalysedSong& analysed, const CSongAnalysis& found) {
    return analysed.mSheet ? ShowSong(*analysed.mSheet, found) : ShowSong(analysed.mSong, found);
}

std::string Picture(const CAnalysedSong& analysed, const CAnalyseOptions& options) {
    CShownSong shown = Show(analysed, FindAll(analysed, options));
    if (!analysed.mSong.mChords.empty()) {
        shown.mKeys = MakeSongKeys(analysed.mSong, analysed.mReading);
    }
    if (!options.mGrids) return AnalysisSvg(shown);
    CSongFingeringOptions choice;
    choice.mFingering.mCapo = options.mCapo;
    const TChordGrids grids =
        GridsBySymbol(MakeSongGrids(analysed.mSong, kGChStandardGuitar, choice, TSongCapo::Told));
    return AnalysisSvg(shown, &grids, {.mLeftHanded = options.mIsLeftHanded});
}

bool IsLeadSheet(const CAnalyseOptions& options) {
    return options.mFormat.Format() == TFormat::Svg && IsSheetWanted(options);
}

/// Another route than the usual one is asked for to see its centers.
bool WantsCenters(const CAnalyseOptions& options) {
    return options.mCenters || options.mReadings || options.mRoute != "tonic";
}

std::string Text(const CAnalysedSong& analysed, const CAnalyseOptions& options) {
    const CPaint paint = PaintOfOutput();
    std::string text = ReadingText(analysed.mSong, analysed.mReading,
                                   {.mWidth = WidthOfOutput(), .mIsLong = options.mLong}, paint);
    text += ExplanationsText(analysed.mSong, analysed.mExplanations, paint);
    if (!WantsCenters(options)) return text;
    return text + '\n' + CentersText(Show(analysed, FindAll(analysed, options)), paint);
}

std::string JsonOf(const CAnalysedSong& analysed, const CAnalyseOptions& options) {
    const CSongAnalysis found = FindAll(analysed, options);
    if (analysed.mSheet) return AnalysisJson(*analysed.mSheet, found);
    return AnalysisJson(analysed.mSong, found, analysed.mReading, analysed.mExplanations);
}

std::string Native(const CAnalysedSong& analysed, const CAnalyseOptions& options) {
    std::ostringstream native;
    FindAll(analysed, options).mAnalyse.AppendJSONString(native);
    return native.str();
}

std::string Present(const CAnalysedSong& analysed, const CAnalyseOptions& options) {
    switch (options.mFormat.Format()) {
        case TFormat::Json:
            return JsonOf(analysed, options);
        case TFormat::Native:
            return Native(analysed, options);
        case TFormat::Svg:
            return Picture(analysed, options);
        case TFormat::Text:
        case TFormat::Chords:
            break;
    }
    return Text(analysed, options);
}

std::optional<CSong> ReadText(const CTypedSong& typed, const CSignKeyLite& key,
                              const CAnalyseOptions& options) {
    CTypedChords reading = options.mReading;
    if (options.mFormat.Format() == TFormat::Native) reading.UseNative();
    reading.UseKey(key);
    return reading.ReadSongOrFail(typed);
}

/// JSON and the native form show chords without a place in time, too.
bool HasTimesFor(TFormat format, const CAnalysedSong& analysed) {
    if (format == TFormat::Json || format == TFormat::Native) return true;
    return analysed.mSheet ? HasTimes(*analysed.mSheet) : HasTimes(analysed.mSong);
}

/// Reads a score in the timing that is asked for. Nothing after an error, which has been printed.
std::optional<CAnalysedSong> ReadScoreInTiming(const CTypedSong& typed,
                                               const CAnalyseOptions& options) {
    CAnalysedSong analysed;
    if (options.mTiming == "native") {
        analysed.mSheet = ReadHarmonies(typed, TLeadSheetTiming::Native);
        if (!analysed.mSheet) return std::nullopt;
        analysed.mSong = options.mReading.ReadSource(typed.mText);
    } else {
        auto song = ReadScore(typed);
        if (!song) return std::nullopt;
        analysed.mSong = std::move(*song);
    }
    if (!HasTimesFor(options.mFormat.Format(), analysed)) {
        Fail(TStatus::BadInput,
             fmt::format("{}: in this timing some chords have no length; --format json shows them",
                         Printable(typed.mName)));
        return std::nullopt;
    }
    if (analysed.mSheet || analysed.mSong.mChords.size() >= 2) return analysed;
    FailWithoutChords(typed);
    return std::nullopt;
}

std::optional<CAnalysedSong> ReadAnySong(const CTypedSong& typed, const CSignKeyLite& key,
                                         const CAnalyseOptions& options) {
    if (typed.mIsScore) return ReadScoreInTiming(typed, options);
    auto song = ReadText(typed, key, options);
    if (!song) return std::nullopt;
    CAnalysedSong analysed;
    analysed.mSong = std::move(*song);
    return analysed;
}

void ReadHarmonyOf(CAnalysedSong& analysed, const CSignKeyLite& key,
                   const CAnalyseOptions& options) {
    analysed.mReading = ReadSongHarmony(analysed.mSong, {.mStatedKey = key});
    if (options.mExplain) analysed.mExplanations = Explain(analysed.mSong, analysed.mReading);
    // In JSON the keys have other numerals, and the reading stays as it is described.
    if (options.mFormat.Format() == TFormat::Json) return;
    analysed.mReading =
        WithNumerals(std::move(analysed.mReading), analysed.mSong.mChords, options.mNumerals);
}

TSongOutput AnalysisOf(const CTypedSong& typed, const CSignKeyLite& key,
                       const CAnalyseOptions& options) {
    auto analysed = ReadAnySong(typed, key, options);
    if (!analysed) return TStatus::BadInput;
    StateKey(key, analysed->mSong);
    if (analysed->mSheet) StateKey(key, *analysed->mSheet);
    ReadHarmonyOf(*analysed, key, options);
    if (IsLeadSheet(options)) {
        return options.mSheetPicture.Draw(analysed->mSong, analysed->mReading);
    }
    return Present(*analysed, options);
}

TStatus Analyse(const CAnalyseOptions& options) {
    if (const auto contradiction = Contradiction(options)) {
        return Fail(TStatus::BadUsage, *contradiction);
    }
    const auto key = ReadKeyIfTold(options.mKey);
    if (!key) return TStatus::BadUsage;
    return options.mSongs.Print(options.mFormat.Format(), [&](const CTypedSong& song) {
        return AnalysisOf(song, *key, options);
    });
}

}  // namespace

void AddAnalyse(CCommand& program) {
    CCommand& command = program.AddCommand(kAnalyseHelp);
    const auto options = std::make_shared<CAnalyseOptions>();
    command.AlsoCalled("analyze");
    options->mSongs.AddTo(command);
    command.AddChoice("--route", options->mRoute, {"tonic", "cadence", "weights", "none"},
                      "How centers are searched");
    command.AddOption("--key", "KEY", options->mKey, "The stated key, as in \"A minor\" or Bb");
    options->mReading.AddBeatsTo(command);
    command.AddChoice("--timing", options->mTiming, {"played", "native"},
                      "How the chords of a score follow each other");
    command.AddFlag("--long", options->mLong,
                    "A line for each chord, with what it is and leads to");
    command.AddFlag("--explain", options->mExplain, "A sentence for each chord");
    command.AddFlag("--centers", options->mCenters,
                    "Show the centers that stated progressions lead to, too");
    command.AddFlag("--readings", options->mReadings,
                    "Show all readings that progressions to a tonic allow");
    AddNumeralOptions(command, options->mNumerals);
    options->mReading.AddTo(command, "In what form the chord text is written");
    command.AddFlag("--grids", options->mGrids,
                    "Draw a guitar fingering under each chord of the picture");
    command
        .AddOption("--capo", "N", options->mCapo, "Fret of a capodaster for --grids (default: 0)")
        .InRange(0, kHighestCapo);
    command.AddFlag("--left", options->mIsLeftHanded, "Draw the grids for the left hand");
    options->mSheetPicture.AddTo(command);
    options->mFormat.AddTo(command, {"text", "json", "native", "svg"});
    command.OnCall([options] { return Analyse(*options); });
}

}  // namespace brindle::cli
