// SPDX-License-Identifier: MIT
#include "cli/FaultMessage.h"
#include "cli/Input.h"
#include "cli/KeyText.h"
#include "cli/MarkovSongs.h"

#include "brindle/platform/AtomicFile.h"
#include "brindle/platform/Random.h"
#include "brindle/present/LeadSheetSvg.h"
#include "brindle/present/WrittenSongText.h"
#include "brindle/song/ReadSongHarmony.h"
#include "brindle/song/SongRequest.h"

#include <algorithm>

namespace brindle::cli {
namespace {

/// What was asked for. Nothing if it cannot be read; then the error has been printed.
std::optional<CSongRequestReading> ReadRequest(const CWriteOptions& written,
                                               const CWriteSettings& settings) {
    const auto key = ReadKeyOption(written.mKey);
    if (!key) return std::nullopt;
    CSongRequestReading reading = ReadSongRequest(
        {*key, written.mForm, written.mBars, settings.mBeatsPerBar, FoldAccidentals(written.mSheet),
         FoldAccidentals(written.mBegins), FoldAccidentals(written.mEnds),
         FoldAccidentals(written.mContains), FoldAccidentals(written.mNever)});
    if (!reading.mFault.empty()) {
        // Its parts are called as the options are.
        Fail(TStatus::BadUsage, "--" + Printable(FaultMessage(reading.mFault)));
        return std::nullopt;
    }
    if (!written.mStyle.empty()) reading.mStyle.clear();
    reading.mOptions.mMostQuotedBars = written.mMostQuoted;
    reading.mOptions.mOrder = std::min<std::uint64_t>(settings.mOrder, CSongModel::kLongestHistory);
    reading.mOptions.mSeed = settings.mSeed ? *settings.mSeed : RandomBits();
    return reading;
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
        .AddOption(
            "--form", "FORM", mForm,
            "A letter for each part, such as AABA, or blues, after songs of that style (default: "
            "AABA for 32 bars)")
        .InGroup(group);
    command
        .AddOption("--bars", "N", mBars,
                   "Bars of the song (default: 32, those of --sheet, 12 of a blues)")
        .InRange(std::uint64_t{1}, std::uint64_t{kMostWrittenBars})
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
        .InRange(0.0, kLongestQuoteLimit)
        .InGroup(group);
    command.AddFlag("--show-quotes", mShowQuotes, "Tell the longest passage that does, and where")
        .InGroup(group);
}

TStatus MarkovWrite(const CWriteOptions& written, const CWriteSettings& settings) {
    const auto request = ReadRequest(written, settings);
    if (!request) return TStatus::BadUsage;
    const auto model = ReadSongModelFile(written.mModel, written.mStyle);
    if (!model) return TStatus::BadInput;
    const CWrittenSong song = WriteRequestedSong(*model, *request);
    if (!song.mFault.empty()) {
        return Fail(TStatus::BadUsage, FaultMessage(WrittenSongFault(song, "--")));
    }
    if (settings.mMidi &&
        !WriteFileAtomically(*settings.mMidi,
                             MidiFileBytes(MidiPieceOfSong(song.mSong, settings.mTempo)))) {
        return FailToWrite(*settings.mMidi);
    }
    return Print(SongText(song, written, request->mOptions, settings.mFormat));
}

}  // namespace brindle::cli
