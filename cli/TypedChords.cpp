// SPDX-License-Identifier: MIT
#include "cli/TypedChords.h"

#include "cli/CommandLine.h"
#include "cli/FaultMessage.h"
#include "cli/Input.h"
#include "cli/Message.h"
#include "cli/Output.h"
#include "cli/TypedSong.h"

#include "brindle/analysis/TChordStringParse.h"
#include "brindle/present/ShownNames.h"
#include "brindle/song/ParseSong.h"
#include "brindle/song/SongBeats.h"

#include <algorithm>
#include <array>
#include <utility>

namespace brindle::cli {
namespace {

/// Nobody reads more warnings.
constexpr std::size_t kMostWarnings = 20;

/// The forms that --from names.
struct CFormRow {
    std::string_view mName;
    TSongFormat mFormat;
};

constexpr auto kForms = std::to_array<CFormRow>({
    {"auto", TSongFormat_Auto},
    {"plain", TSongFormat_ChordText},
    {"lyrics", TSongFormat_ChordsAboveLyrics},
    {"chordpro", TSongFormat_ChordPro},
    {"ireal", TSongFormat_Chart},
    {"strings", TSongFormat_ChordStrings},
    {"romantext", TSongFormat_RomanText},
});

/// A chart may stand in a link or in a page of links; all of these are named alike.
TSongFormat FormatOf(std::string_view name, std::string_view text) {
    const auto* const row = std::find_if(kForms.begin(), kForms.end(),
                                         [&](const CFormRow& form) { return form.mName == name; });
    const TSongFormat format = row == kForms.end() ? TSongFormat_Auto : row->mFormat;
    if (format != TSongFormat_Chart) return format;
    const TSongFormat found = SongFormatOf(text);
    const bool isLink = found == TSongFormat_ChartLink || found == TSongFormat_ChartPage;
    return isLink ? found : format;
}

std::string_view Line(std::string_view text, std::size_t number) {
    for (; number > 1; --number) text.remove_prefix(std::min(text.find('\n'), text.size() - 1) + 1);
    return text.substr(0, text.find('\n'));
}

/// Prints a fault with its line and a caret under the place.
void PrintFault(std::string_view text, const CSongFault& fault, bool isWarning,
                std::string_view name = {}) {
    std::string message = name.empty() ? "" : Printable(name) + ": ";
    if (isWarning || fault.mIsNote) message += Message("warning: ");
    const std::string told = Printable(FaultMessage(fault.mText));
    if (fault.mLine == 0) {
        Fail(TStatus::BadInput, message + told);
        return;
    }
    if (text.find('\n') != text.npos) {
        message += Message("line {number}: ", {{"number", std::to_string(fault.mLine)}});
    }
    FailAtCharacter(TStatus::BadInput, message + told, Line(text, fault.mLine), fault.mColumn);
}

}  // namespace

void PrintFaults(std::string_view text, std::span<const CTextFault> faults, bool areWarnings,
                 std::string_view name) {
    const std::size_t count = std::min(faults.size(), kMostWarnings);
    for (const CTextFault& fault : faults.first(count)) {
        PrintFault(text, fault, areWarnings, name);
    }
    if (faults.size() > count) {
        Fail(TStatus::BadInput, Message("warning: and {count} more like these",
                                        {{"count", std::to_string(faults.size() - count)}}));
    }
}

void CTypedChords::AddTo(CCommand& command) {
    command.AddChoice("--symbols", mReader, {"all", "native"},
                      "Read all spellings of chords, or as the parser for hosts does");
    command.AddFlag("--lenient", mIsLenient,
                    "Go on with no chord where a symbol is not understood");
}

void CTypedChords::AddTo(CCommand& command, const std::string& fromPurpose) {
    AddTo(command);
    command.AddChoice("--from", mForm,
                      {"auto", "plain", "lyrics", "chordpro", "ireal", "strings", "romantext"},
                      fromPurpose);
    command.AddFlag("--even", mIsEven, "The chords of a bar without holds share it evenly");
}

void CTypedChords::AddBeatsTo(CCommand& command) {
    command.AddOption("--beats-per-bar", "BEATS", mBeatsPerBar,
                      "Length of a bar in beats (default: 4)");
    command.AddOption("--beats-per-chord", "BEATS", mBeatsPerChord,
                      "Length of a chord in beats (default: 1)");
}

std::optional<std::string> CTypedChords::BeatsContradiction() const {
    if (AreSongBeats(mBeatsPerBar) && AreSongBeats(mBeatsPerChord)) return std::nullopt;
    return Message("--beats-per-bar and --beats-per-chord take 1/1024 to 1024 beats");
}

std::optional<std::vector<CChordLite>> CTypedChords::ReadSymbols(
    const std::vector<std::string>& symbols) const {
    std::vector<CChordLite> chords;
    if (IsNative()) {
        for (const std::string& symbol : symbols) {
            chords.emplace_back(FoldAccidentals(symbol), NamePrefs());
        }
        return chords;
    }
    CChordTextOptions prefs;
    prefs.mBIsBFlat = mIsBBFlat;
    for (const std::string& symbol : symbols) {
        prefs.mBIsBFlat = prefs.mBIsBFlat || ReadChordText(symbol).mHasH;
    }
    for (const std::string& symbol : symbols) {
        if (!TakeReading(symbol, ReadChordText(symbol, prefs), chords)) return std::nullopt;
    }
    return chords;
}

bool CTypedChords::TakeReading(const std::string& symbol, const CChordTextReading& reading,
                               std::vector<CChordLite>& chords) const {
    chords.push_back(reading.mChord);
    std::string fault = reading.mFault;
    auto pos = static_cast<std::size_t>(std::max(1, reading.mFaultPos));
    if (reading.mKind == TChordText_Repeat) {
        fault = "this repeats a chord and is none by itself";
        pos = 1;
    }
    if (fault.empty()) return true;
    chords.back() = CChordLite_NoChordYield;
    PrintFault(symbol, {.mLine = 1, .mColumn = pos, .mText = fault}, mIsLenient);
    return mIsLenient;
}

std::optional<CChordLite> CTypedChords::ReadSymbol(const std::string& symbol) const {
    const auto chords = ReadSymbols({symbol});
    if (!chords) return std::nullopt;
    return chords->front();
}

CSong CTypedChords::ReadNative(std::string_view text) const {
    TChordStringParse parse;
    parse.mBeatsPerBar = mBeatsPerBar;
    parse.mBeatsPerChord = mBeatsPerChord;
    parse.mChordNamePrefs = NamePrefs();
    return ParseSong(text, parse);
}

CSong CTypedChords::ReadSource(std::string_view bytes) const {
    if (IsNative() && !HasScoreBytes(bytes)) return ReadNative(bytes);
    CSongOptions prefs;
    prefs.mFormat = HasScoreBytes(bytes) ? TSongFormat_Auto : FormatOf(mForm, bytes);
    prefs.mBeatsPerBar = mBeatsPerBar;
    prefs.mBeatsPerChord = mBeatsPerChord;
    prefs.mEven = mIsEven;
    prefs.mLenient = mIsLenient;
    prefs.mKey = mKey;
    return brindle::ReadSong(bytes, prefs);
}

std::optional<CSong> CTypedChords::ReadText(const CTypedSong& typed) const {
    CSong song = ReadSource(typed.mText);
    PrintFaults(typed.mText, song.mFaults, mIsLenient, typed.mName);
    if (song.HasFault() && !mIsLenient) return std::nullopt;
    return song;
}

std::optional<CSong> CTypedChords::ReadSongOrFail(const CTypedSong& typed) const {
    auto song = typed.mIsScore ? ReadScore(typed) : ReadText(typed);
    if (!song || song->mChords.size() > 1) return song;
    FailWithoutChords(typed);
    return std::nullopt;
}

}  // namespace brindle::cli
