// SPDX-License-Identifier: MIT
#include "brindle/analysis/ReadChordSheet.h"

#include "brindle/analysis/internal/ChordSheetTokens.h"

#include <algorithm>
#include <cmath>

namespace brindle {

using namespace ChordSheet;

namespace {

/// Turns bytes into lines and columns, counted on from one place to the next.
class CLineCount {
public:
    explicit CLineCount(std::string_view text) : mText(text) {}

    /// Offsets must ascend.
    CChordSheetFault Place(const TSheetFault& fault) {
        for (; mOffset < fault.mOffset && mOffset < mText.size(); ++mOffset) {
            const char c = mText[mOffset];
            if (c == '\n') {
                ++mLine;
                mColumn = 1;
            } else if ((static_cast<unsigned char>(c) & 0xC0) != 0x80) {
                ++mColumn;
            }
        }
        return {mLine, mColumn, fault.mText};
    }

private:
    std::string_view mText;
    std::size_t mOffset = 0;
    std::size_t mLine = 1;
    std::size_t mColumn = 1;
};

bool IsLength(double beats) {
    return std::isfinite(beats) && beats > 0.0;
}

void Cut(TChordSheetForm form, CTokenList& list) {
    switch (form) {
        case TChordSheet_Plain:
            return CutPlain(list);
        case TChordSheet_ChordPro:
            return CutChordPro(list);
        case TChordSheet_IReal:
            return CutIReal(list);
        case TChordSheet_Auto:
            return Cut(LikeliestForm(list.Text()), list);
    }
}

void TakeFaults(const CTokenList& list, bool isLenient, CChordSheetReading& reading) {
    std::vector<TSheetFault> faults = list.Faults();
    std::stable_sort(faults.begin(), faults.end(), [](const TSheetFault& a, const TSheetFault& b) {
        return a.mOffset < b.mOffset;
    });
    if (!isLenient && !faults.empty()) {
        faults.resize(1);
        reading.mChords.clear();
        reading.mSymbols.clear();
        reading.mSections.clear();
    }
    CLineCount lines(list.Text());
    for (const TSheetFault& fault : faults) reading.mFaults.push_back(lines.Place(fault));
}

}  // namespace

CChordSheetReading ReadChordSheet(std::string_view text, const CChordSheetPrefs& prefs) {
    CChordSheetReading reading;
    reading.mBeatsPerBar = prefs.mBeatsPerBar;
    CTokenList list(text, prefs);
    if (!IsLength(prefs.mBeatsPerBar) || !IsLength(prefs.mBeatsPerChord)) {
        list.AddFault(text, "bars and chords have a length above 0");
        TakeFaults(list, false, reading);
        return reading;
    }
    Cut(prefs.mForm, list);
    reading.mTitle = list.mTitle;
    reading.mKey = list.mKey;
    reading.mIsGerman = list.mHasH || prefs.mChordTextPrefs.mBIsBFlat;
    if (reading.mIsGerman) list.MakeGerman();
    const auto beats =
        std::find_if(list.mTokens.begin(), list.mTokens.end(),
                     [](const TToken& token) { return token.mKind == TTokenKind::Beats; });
    if (beats != list.mTokens.end()) reading.mBeatsPerBar = beats->mBeats;
    if (!list.IsGivenUp()) Play(list, reading);
    TakeFaults(list, prefs.mLenient, reading);
    return reading;
}

}  // namespace brindle
