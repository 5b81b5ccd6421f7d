// SPDX-License-Identifier: MIT
#include "cli/Input.h"
#include "cli/KeyText.h"
#include "cli/MarkovSongs.h"

#include "brindle/platform/AtomicFile.h"
#include "brindle/platform/Random.h"
#include "brindle/present/LeadSheetSvg.h"
#include "brindle/present/WrittenSongText.h"
#include "brindle/song/ReadSongHarmony.h"
#include "brindle/song/WriteSong.h"

#include <fmt/format.h>

#include <algorithm>

namespace brindle::cli {
namespace {

constexpr const char* kBluesForm = "blues";
constexpr std::uint64_t kUsualBars = 32;
constexpr std::uint64_t kBluesBars = 12;
constexpr std::uint64_t kMostWrittenBars = 256;

/// Puts the wishes of an option to the others. False if it cannot be read; then the error has been
/// printed.
bool TakeWishes(const char* option, CSongWishReading reading, CWriteSongOptions& options) {
    if (!reading.mFault.empty()) {
        Fail(TStatus::BadUsage, fmt::format("{}: {}", option, Printable(reading.mFault)));
        return false;
    }
    for (CSongWish& wish : reading.mWishes) {
        wish.mText = fmt::format("{} {}", option, Printable(wish.mText));
        options.mWishes.push_back(std::move(wish));
    }
    return true;
}

bool TakeChords(const char* option, TSongWishKind kind, const std::string& typed,
                CWriteSongOptions& options) {
    const std::string text = FoldAccidentals(typed);
    for (std::size_t at = 0; at < text.size();) {
        const std::size_t end = std::min(text.find(';', at), text.size());
        const std::string one = text.substr(at, end - at);
        if (!TakeWishes(option, ReadChordsWish(kind, one, options.mKey), options)) return false;
        at = end + 1;
    }
    return true;
}

bool TakeSheet(const CWriteOptions& written, CWriteSongOptions& options) {
    if (written.mSheet.empty()) return true;
    CSongWishReading sheet = ReadSheetWishes(FoldAccidentals(written.mSheet), options.mBeatsPerBar);
    if (sheet.mBars > options.mBars && sheet.mFault.empty()) {
        sheet.mFault =
            fmt::format("{} bars are more than the {} of the song", sheet.mBars, options.mBars);
    }
    return TakeWishes("--sheet", std::move(sheet), options);
}

/// The bars that were asked for, or those of the sheet, or the usual ones.
std::uint64_t BarsOf(const CWriteOptions& written, int beatsPerBar) {
    if (written.mBars > 0) return written.mBars;
    if (written.mForm == kBluesForm) return kBluesBars;
    const CSongWishReading sheet = ReadSheetWishes(written.mSheet, beatsPerBar);
    return sheet.mBars > 0 && written.mForm.empty() ? sheet.mBars : kUsualBars;
}

std::string FormOf(const CWriteOptions& written, std::uint64_t bars) {
    if (written.mForm == kBluesForm) return {};
    if (!written.mForm.empty() || !written.mSheet.empty()) return written.mForm;
    return bars == kUsualBars ? "AABA" : "";
}

std::optional<CWriteSongOptions> WriteOptionsOf(const CWriteOptions& written,
                                                const CWriteSettings& settings) {
    CWriteSongOptions options;
    const auto key = ReadKeyOption(written.mKey);
    if (!key) return std::nullopt;
    options.mKey = *key;
    options.mBeatsPerBar = settings.mBeatsPerBar;
    options.mBars = BarsOf(written, settings.mBeatsPerBar);
    options.mForm = FormOf(written, options.mBars);
    options.mMostQuotedBars = written.mMostQuoted;
    options.mOrder = std::min<std::uint64_t>(settings.mOrder, CSongModel::kLongestHistory);
    options.mSeed = settings.mSeed ? *settings.mSeed : RandomBits();
    if (written.mForm == kBluesForm) {
        if (options.mBars != kBluesBars) {
            Fail(TStatus::BadUsage, "--form blues has 12 bars");
            return std::nullopt;
        }
        for (CSongWish& wish : BluesWishes(*key, settings.mBeatsPerBar)) {
            wish.mText = "--form blues: " + wish.mText;
            options.mWishes.push_back(std::move(wish));
        }
    }
    const bool isTaken = TakeSheet(written, options) &&
                         TakeChords("--begins", TSongWish_Begin, written.mBegins, options) &&
                         TakeChords("--ends", TSongWish_End, written.mEnds, options) &&
                         TakeChords("--contains", TSongWish_Contains, written.mContains, options) &&
                         TakeChords("--never", TSongWish_Never, written.mNever, options);
    return isTaken ? std::optional(options) : std::nullopt;
}

std::string FaultText(const CWrittenSong& song) {
    if (song.mContradiction.empty()) return song.mFault;
    return fmt::format("{}: {}",
                       song.mContradiction.size() == 1 ? "this wish cannot be met"
                                                       : "these wishes cannot be met together",
                       fmt::join(song.mContradiction, "; "));
}

std::string SongText(const CWrittenSong& song, const CWriteOptions& written,
                     const CWriteSongOptions& options, TFormat format) {
    if (format == TFormat::Json) return WrittenSongJson(song, options.mForm, options.mSeed);
    if (format == TFormat::Svg) return LeadSheetSvg(song.mSong, ReadSongHarmony(song.mSong));
    std::string text = WrittenSongText(song.mSong);
    const std::string quote = QuoteText(song.mLongestQuote);
    if (written.mShowQuotes) text += "\n" + (quote.empty() ? "no quotes" : quote) + "\n";
    return text;
}

}  // namespace

bool CWriteOptions::AreTold() const {
    const CWriteOptions none;
    return mStyle != none.mStyle || mKey != none.mKey || mForm != none.mForm ||
           mBars != none.mBars || mSheet != none.mSheet || mBegins != none.mBegins ||
           mEnds != none.mEnds || mContains != none.mContains || mNever != none.mNever ||
           mMostQuoted != none.mMostQuoted || mShowQuotes;
}

void CWriteOptions::AddTo(CCommand& command) {
    const std::string group = "Options for songs";
    command
        .AddOption("--style", "STYLE", mStyle,
                   "Only from songs of this style; built in are blues, early jazz, folk, hymn, "
                   "ragtime")
        .InGroup(group);
    command.AddOption("--key", "KEY", mKey, "Key of the song (default: C major)").InGroup(group);
    command
        .AddOption("--form", "FORM", mForm,
                   "A letter for each part, such as AABA, or blues (default: AABA for 32 bars)")
        .InGroup(group);
    command.AddOption("--bars", "N", mBars, "Bars of the song (default: 32, those of --sheet)")
        .InRange(std::uint64_t{1}, kMostWrittenBars)
        .InGroup(group);
    command
        .AddOption("--sheet", "BARS", mSheet,
                   "Chords that are fixed, and _ for gaps: \"C . Am . | _ | G7 | C\"")
        .InGroup(group);
    command.AddOption("--begins", "CHORD", mBegins, "First chord").InGroup(group);
    command.AddOption("--ends", "CHORD", mEnds, "Last chord (default: a chord on the tonic)")
        .InGroup(group);
    command
        .AddOption("--contains", "CHORDS", mContains,
                   "Chords that stand somewhere in a row, such as \"ii-V-I of F\"; several rows "
                   "between ;")
        .InGroup(group);
    command.AddOption("--never", "CHORDS", mNever, "Chords that are not used").InGroup(group);
    command
        .AddOption("--max-quote", "BARS", mMostQuoted,
                   "Longest passage that may stand just so in a song; 0 for any (default: 4)")
        .InRange(0.0, 1000.0)
        .InGroup(group);
    command.AddFlag("--show-quotes", mShowQuotes, "Tell the longest passage that does, and where")
        .InGroup(group);
}

TStatus MarkovWrite(const CWriteOptions& written, const CWriteSettings& settings) {
    const auto options = WriteOptionsOf(written, settings);
    if (!options) return TStatus::BadUsage;
    const auto model = ReadSongModelFile(written.mModel, written.mStyle);
    if (!model) return TStatus::BadInput;
    const CWrittenSong song = WriteSong(*model, *options);
    if (!song.mFault.empty()) return Fail(TStatus::BadUsage, FaultText(song));
    if (settings.mMidi &&
        !WriteFileAtomically(*settings.mMidi,
                             MidiFileBytes(MidiPieceOfSong(song.mSong, settings.mTempo)))) {
        return FailToWrite(*settings.mMidi);
    }
    return Print(SongText(song, written, *options, settings.mFormat));
}

}  // namespace brindle::cli
