// SPDX-License-Identifier: MIT
#include "brindle/platform/internal/CTextPlaces.h"
#include "brindle/song/internal/SongReaders.h"
#include "brindle/song/internal/SongTokens.h"

#include <algorithm>
#include <cmath>
#include <utility>

namespace brindle::SongReaders {

using namespace SongText;

namespace {

bool IsLength(double beats) {
    return std::isfinite(beats) && beats > 0.0;
}

void Cut(TSongFormat format, CTokenList& list) {
    switch (format) {
        case TSongFormat_ChordPro:
            return CutChordPro(list);
        case TSongFormat_ChordsAboveLyrics:
            return CutChordsAboveLyrics(list);
        case TSongFormat_Chart:
            return CutChart(list);
        case TSongFormat_ChordStrings:
            return CutChordStrings(list);
        default:
            list.mIsEven = format == TSongFormat_EvenText;
            return CutChordText(list);
    }
}

/// The names of C and F in Romance languages are chords, too.
void TellNamesOfNotes(CTokenList& list) {
    const CToken* first = nullptr;
    bool hasDo = false;
    bool hasFa = false;
    for (const CToken& token : list.mTokens) {
        if (token.mKind != TTokenKind::Chord || token.mText == "N.C.") continue;
        hasDo |= token.mText == "Do";
        hasFa |= token.mText == "Fa";
        if (token.mText != "Do" && token.mText != "Fa") return;
        if (first == nullptr) first = &token;
    }
    if (!hasDo || !hasFa) return;
    list.AddNote(first->mText, "Do and Fa are D diminished and F augmented, not C and F");
}

/// By their places; without a lenient reading the first one that is no note is the last.
void TakeFaults(const CTokenList& list, CSong& song) {
    std::vector<CTokenFault> faults = list.Faults();
    std::stable_sort(faults.begin(), faults.end(), [](const CTokenFault& a, const CTokenFault& b) {
        return a.mOffset < b.mOffset;
    });
    CTextPlaces places(list.Text());
    for (const CTokenFault& fault : faults) {
        places.GoToByte(fault.mOffset);
        song.mFaults.push_back({places.Line(), places.Column(), fault.mText, fault.mIsNote});
        if (!fault.mIsNote && !list.Prefs().mLenient) break;
    }
    GiveUpWhatIsAtFault(song, list.Prefs().mLenient);
}

}  // namespace

void GiveUpWhatIsAtFault(CSong& song, bool isLenient) {
    if (isLenient || !song.HasFault()) return;
    CSong left;
    left.mTitle = std::move(song.mTitle);
    left.mMakers = std::move(song.mMakers);
    left.mStyle = std::move(song.mStyle);
    left.mBeatsPerBar = song.mBeatsPerBar;
    left.mFormat = song.mFormat;
    left.mFaults = std::move(song.mFaults);
    song = std::move(left);
}

CSong ReadSheet(std::string_view text, TSongFormat format, const CSongOptions& prefs) {
    constexpr std::string_view kByteOrderMark = "\xEF\xBB\xBF";
    if (text.starts_with(kByteOrderMark)) text.remove_prefix(kByteOrderMark.size());
    CSong song;
    song.mFormat = format;
    song.mBeatsPerBar = prefs.mBeatsPerBar;
    CTokenList list(text, prefs, song);
    if (!IsLength(prefs.mBeatsPerBar) || !IsLength(prefs.mBeatsPerChord)) {
        list.AddFault(text, "bars and chords have a length above 0");
        TakeFaults(list, song);
        song.mChords.clear();
        return song;
    }
    Cut(format, list);
    if (list.mHasH) list.MakeGerman();
    const auto time =
        std::find_if(list.mTokens.begin(), list.mTokens.end(),
                     [](const CToken& token) { return token.mKind == TTokenKind::Time; });
    if (time != list.mTokens.end()) song.mBeatsPerBar = time->mTime.mNumerator;
    if (format != TSongFormat_Chart) TellNamesOfNotes(list);
    if (!list.IsGivenUp()) PlaySheet(list);
    TakeFaults(list, song);
    return song;
}

}  // namespace brindle::SongReaders
