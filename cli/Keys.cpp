// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"
#include "cli/KeyText.h"
#include "cli/Message.h"
#include "cli/TypedChords.h"
#include "cli/TypedSongs.h"

#include "brindle/present/CChordSymbols.h"
#include "brindle/present/KeysJson.h"
#include "brindle/present/KeysSvg.h"
#include "brindle/present/MakeSongKeys.h"
#include "brindle/present/ReadingText.h"
#include "brindle/present/ShowSong.h"
#include "brindle/song/AnalyseSong.h"
#include "brindle/song/ReadSongHarmony.h"

#include <memory>
#include <optional>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kKeysHelp{
    "keys",
    "Find the key of a song and the keys that it passes through, with Roman numerals",
    "  brindle keys \"Dm7 G7 | Cmaj7 . | Fm7 Bb7 | Ebmaj7 .\" --beats-per-chord 2\n"
    "  brindle keys song.txt --beats-per-bar 3 --format svg >keys.svg\n"
    "  brindle keys song.musicxml --nashville\n"
    "  cat song.txt | brindle keys - --json\n"
    "\n"
    "A chord text has chord symbols between white space; | goes on to the next bar\n"
    "line, and . holds the chord before it for one more step. A score in MusicXML\n"
    "(.musicxml, .xml, .mxl) is played through its repeats, endings and jumps.\n",
};

// More points than this are a slip of the finger.
constexpr double kMostPoints = 1000.0;

struct CKeysOptions {
    CTypedSongs mSongs;
    std::string mKey;
    CKeyOptions mKeys;
    CNumeralOptions mNumerals;
    CTypedChords mReading;
    CFormatOptions mFormat;
};

// What is wrong with options that are fine one by one.
std::optional<std::string> Contradiction(const CKeysOptions& options) {
    if (auto songs = options.mSongs.Contradiction(options.mFormat.Format())) return songs;
    if (auto beats = options.mReading.BeatsContradiction()) return beats;
    for (const double points : {options.mKeys.mHomeBonus, options.mKeys.mChangeCost}) {
        if (points >= 0.0 && points <= kMostPoints) continue;
        return Message("--home-bonus and --change-cost take 0 to 1000 points");
    }
    return std::nullopt;
}

// Nothing when it cannot be read; then the error has been printed.
std::optional<CSong> SongOf(const CTypedSong& typed, const CSignKeyLite& key,
                            const CKeysOptions& options) {
    CTypedChords reading = options.mReading;
    reading.UseKey(key);
    return reading.ReadSongOrFail(typed);
}

std::string AsJson(const CSong& song, const CSongReading& reading, const CKeysOptions& options) {
    CKeyOptions keys = options.mKeys;
    keys.mBeatsPerBar = song.mBeatsPerBar;
    const CReadSong read{song, reading};
    const CChordSymbols symbols(song.mSymbols, song.mChords);
    return KeysJson(MakeSongKeys(song.mChords, symbols, keys, options.mNumerals), &read);
}

std::string Present(const CSong& song, const CSongReading& reading, const CKeysOptions& options) {
    const TFormat format = options.mFormat.Format();
    if (format == TFormat::Json) return AsJson(song, reading, options);
    // The numerals of a reading are those of theory text. Others are asked for by options.
    const CSongReading styled = WithNumerals(reading, song.mChords, options.mNumerals);
    if (format == TFormat::Svg) return KeysSvg(ShowKeys(song, styled));
    return RegionsText(song, styled, {.mWidth = WidthOfOutput()}, PaintOfOutput());
}

TSongOutput KeysOf(const CTypedSong& typed, const CReadingOptions& readingOptions,
                   const CKeysOptions& options) {
    auto song = SongOf(typed, readingOptions.mStatedKey, options);
    if (!song) return TStatus::BadInput;
    StateKey(readingOptions.mStatedKey, *song);
    return Present(*song, ReadSongHarmony(*song, readingOptions), options);
}

TStatus Keys(const CKeysOptions& options) {
    if (const auto contradiction = Contradiction(options)) {
        return Fail(TStatus::BadUsage, *contradiction);
    }
    CReadingOptions readingOptions;
    readingOptions.mKeys = options.mKeys;
    readingOptions.mKeys.mBeatsPerBar = options.mReading.BeatsPerBar();
    const auto key = ReadKeyIfTold(options.mKey);
    if (!key) return TStatus::BadUsage;
    readingOptions.mStatedKey = *key;
    return options.mSongs.Print(options.mFormat.Format(), [&](const CTypedSong& song) {
        return KeysOf(song, readingOptions, options);
    });
}

}  // namespace

void AddKeys(CCommand& program) {
    CCommand& command = program.AddCommand(kKeysHelp);
    const auto options = std::make_shared<CKeysOptions>();
    options->mSongs.AddTo(command);
    command.AddOption("--key", "KEY", options->mKey, "The stated key, as in \"A minor\" or Bb");
    options->mReading.AddBeatsTo(command);
    command.AddOption("--home-bonus", "POINTS", options->mKeys.mHomeBonus,
                      "What a chord gains in the key of the song (default: 0.4)");
    command.AddOption("--change-cost", "POINTS", options->mKeys.mChangeCost,
                      "What the nearest change of key costs (default: 4)");
    AddNumeralOptions(command, options->mNumerals);
    options->mReading.AddTo(command, "In what form the chord text is written");
    options->mFormat.AddTo(command, {"text", "json", "svg"});
    command.OnCall([options] { return Keys(*options); });
}

}  // namespace brindle::cli
