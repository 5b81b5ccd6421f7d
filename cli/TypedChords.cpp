// SPDX-License-Identifier: MIT
#include "cli/TypedChords.h"

#include "cli/CommandLine.h"
#include "cli/Input.h"
#include "cli/Output.h"

#include "brindle/analysis/TChordStringParse.h"
#include "brindle/present/ShownNames.h"

#include <fmt/format.h>

#include <algorithm>

namespace brindle::cli {
namespace {

/// Nobody reads more warnings.
constexpr std::size_t kMostWarnings = 20;

TChordSheetForm FormOf(const std::string& name) {
    if (name == "chordpro") return TChordSheet_ChordPro;
    if (name == "ireal") return TChordSheet_IReal;
    return name == "auto" ? TChordSheet_Auto : TChordSheet_Plain;
}

std::string_view Line(std::string_view text, std::size_t number) {
    for (; number > 1; --number) text.remove_prefix(std::min(text.find('\n'), text.size() - 1) + 1);
    return text.substr(0, text.find('\n'));
}

/// Prints a fault with its line and a caret under the place.
void PrintFault(std::string_view text, const CChordSheetFault& fault, bool isWarning) {
    std::string message = isWarning ? "warning: " : "";
    if (text.find('\n') != text.npos) message += fmt::format("line {}: ", fault.mLine);
    FailAtCharacter(TStatus::BadInput, message + Printable(fault.mText), Line(text, fault.mLine),
                    fault.mColumn);
}

}  // namespace

void PrintFaults(std::string_view text, std::span<const CChordSheetFault> faults,
                 bool areWarnings) {
    const std::size_t count = std::min(faults.size(), kMostWarnings);
    for (const CChordSheetFault& fault : faults.first(count)) {
        PrintFault(text, fault, areWarnings);
    }
    if (faults.size() > count) {
        Fail(TStatus::BadInput,
             fmt::format("warning: and {} more like these", faults.size() - count));
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
    command.AddChoice("--from", mForm, {"plain", "chordpro", "ireal", "auto"}, fromPurpose);
    command.AddFlag("--even", mIsEven, "The chords of a bar without holds share it evenly");
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
    CChordTextPrefs prefs;
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
    PrintFault(symbol, {1, pos, fault}, mIsLenient);
    return mIsLenient;
}

std::optional<CChordLite> CTypedChords::ReadSymbol(const std::string& symbol) const {
    const auto chords = ReadSymbols({symbol});
    if (!chords) return std::nullopt;
    return chords->front();
}

TChordSong CTypedChords::ReadSong(std::string_view text, const TChordStringParse& parse) const {
    TChordSong song;
    if (IsNative()) {
        song.mChords.ParseStringIntoChords(FoldAccidentals(text), parse);
        song.mSymbols = CChordSymbols(text, parse, song.mChords);
        song.mBeatsPerBar = parse.mBeatsPerBar;
        return song;
    }
    CChordSheetPrefs prefs;
    prefs.mForm = FormOf(mForm);
    prefs.mBeatsPerBar = parse.mBeatsPerBar;
    prefs.mBeatsPerChord = parse.mBeatsPerChord;
    prefs.mEven = mIsEven;
    prefs.mLenient = mIsLenient;
    CChordSheetReading reading = ReadChordSheet(text, prefs);
    song.mChords = std::move(reading.mChords);
    song.mSymbols = CChordSymbols(reading.mSymbols, song.mChords);
    song.mBeatsPerBar = reading.mBeatsPerBar;
    song.mKey = std::move(reading.mKey);
    song.mFaults = std::move(reading.mFaults);
    return song;
}

std::optional<TChordSong> CTypedChords::ReadSongOrFail(std::string_view text,
                                                       const TChordStringParse& parse) const {
    TChordSong song = ReadSong(text, parse);
    PrintFaults(text, song.mFaults, mIsLenient);
    if (!song.mFaults.empty() && !mIsLenient) return std::nullopt;
    return song;
}

}  // namespace brindle::cli
