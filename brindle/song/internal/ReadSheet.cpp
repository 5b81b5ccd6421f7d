// SPDX-License-Identifier: MIT
#include "brindle/analysis/ReadChordSheet.h"
#include "brindle/song/internal/SongReaders.h"

namespace brindle::SongReaders {

CSong ReadSheet(std::string_view text, TSongFormat format, const CSongPrefs& prefs) {
    CChordSheetPrefs sheetPrefs;
    sheetPrefs.mForm = format == TSongFormat_ChordPro ? TChordSheet_ChordPro
                       : format == TSongFormat_Chart  ? TChordSheet_IReal
                                                      : TChordSheet_Plain;
    sheetPrefs.mBeatsPerBar = prefs.mBeatsPerBar;
    sheetPrefs.mBeatsPerChord = prefs.mBeatsPerChord;
    sheetPrefs.mEven = prefs.mEven || format == TSongFormat_EvenText;
    sheetPrefs.mLenient = prefs.mLenient;
    sheetPrefs.mChordTextPrefs = prefs.mChordTextPrefs;
    CChordSheetReading reading = ReadChordSheet(text, sheetPrefs);
    CSong song;
    song.mFormat = format;
    song.mTitle = reading.mTitle;
    song.mChords = reading.mChords;
    song.mSymbols = reading.mSymbols;
    song.mBeatsPerBar = reading.mBeatsPerBar;
    for (const auto& section : reading.mSections) {
        song.mSections.push_back({section.mName, section.mPosition});
    }
    for (const auto& fault : reading.mFaults) {
        song.mFaults.push_back({fault.mLine, fault.mColumn, fault.mText});
    }
    return song;
}

std::vector<CSong> ReadChartLinks(std::string_view text, TSongFormat, const CSongPrefs& prefs) {
    return {ReadSheet(text, TSongFormat_Chart, prefs)};
}

}  // namespace brindle::SongReaders
