// SPDX-License-Identifier: MIT
#include "brindle/platform/Utf8.h"
#include "brindle/song/internal/SongReaders.h"
#include "brindle/song/internal/SongTokens.h"

#include <algorithm>
#include <cmath>
#include <utility>

namespace brindle::SongReaders {

using namespace SongText;

namespace {

/// Turns bytes into lines and columns, counted on from one place to the next.
class CLineCount {
public:
    explicit CLineCount(std::string_view text) : mText(text) {}

    /// Offsets must ascend.
    CSongFault Place(const CTokenFault& fault) {
        for (; mOffset < fault.mOffset && mOffset < mText.size(); ++mOffset) {
            const char c = mText[mOffset];
            if (c == '\n') {
                ++mLine;
                mColumn = 1;
            } else if (BeginsUtf8Character(c)) {
                ++mColumn;
            }
        }
        return {mLine, mColumn, fault.mText, fault.mIsNote};
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

/// By their places; without a lenient reading the first one that is no note is the last.
void TakeFaults(const CTokenList& list, CSong& song) {
    std::vector<CTokenFault> faults = list.Faults();
    std::stable_sort(faults.begin(), faults.end(), [](const CTokenFault& a, const CTokenFault& b) {
        return a.mOffset < b.mOffset;
    });
    CLineCount lines(list.Text());
    for (const CTokenFault& fault : faults) {
        song.mFaults.push_back(lines.Place(fault));
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
    if (!list.IsGivenUp()) PlaySheet(list);
    TakeFaults(list, song);
    return song;
}

}  // namespace brindle::SongReaders
