// SPDX-License-Identifier: MIT
#include "brindle/analysis/ReadRomanText.h"
#include "brindle/analysis/internal/AugmentedSixths.h"
#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/song/internal/SongReaders.h"
#include "brindle/song/internal/StatedKey.h"

#include <algorithm>
#include <string>
#include <tuple>
#include <utility>

namespace brindle::SongReaders {

namespace {

void AppendChord(const CChordLite& chord, double position, CSong& song) {
    song.mChords.emplace_back(chord, position);
    song.mSymbols.push_back(WriteChordSymbol(chord));
}

/// V7 has a minor seventh, and so has Fr43 above its root, the second degree. What stands on the
/// flat sixth has an augmented sixth instead: Ger65, It6.
TSeventhSpelling SeventhOf(const CRomanTextChord& chord) {
    constexpr int seventh = 10;
    if (!chord.mChord.mSemitones.HasIntvl(seventh)) return TSeventhSpelling_Undef;
    const CAugmentedSixth* const sixth = AugmentedSixthOf(chord.mNumeral);
    const bool isSixth = sixth != nullptr && sixth->mRoot.mNumber == 6;
    return isSixth ? TSeventhSpelling_AugmentedSixth : TSeventhSpelling_MinorSeventh;
}

/// Before the first numeral nothing sounds.
void AppendChords(const CRomanTextReading& reading, CSong& song) {
    if (reading.mChords.empty()) return;
    if (reading.mChords.front().mPosition > 0.0) AppendChord(CChordLite_NoChordYield, 0.0, song);
    for (const CRomanTextChord& chord : reading.mChords) {
        AppendChord(chord.mChord, chord.mPosition, song);
        StateSeventh(SeventhOf(chord), song);
    }
    const CRomanTextChord& last = reading.mChords.back();
    song.mChords.emplace_back(CChordLite_Undef, last.mPosition + last.mLength);
}

void AppendBars(const CRomanTextReading& reading, CSong& song) {
    auto time = reading.mTimes.begin();
    CSongTime holding;
    for (const CRomanTextBar& bar : reading.mBars) {
        for (; time != reading.mTimes.end() && time->mPosition <= bar.mPosition; ++time) {
            holding = {time->mBeats, time->mBeatValue};
        }
        song.mBars.push_back({std::to_string(bar.mNumber), bar.mPosition, bar.mLength, holding});
    }
}

void AppendFaults(const CRomanTextReading& reading, CSong& song) {
    song.mFaults = reading.mFaults;
    for (CTextFault note : reading.mNotes) {
        note.mIsNote = true;
        song.mFaults.push_back(std::move(note));
    }
    std::stable_sort(song.mFaults.begin(), song.mFaults.end(),
                     [](const CTextFault& a, const CTextFault& b) {
                         return std::tie(a.mLine, a.mColumn) < std::tie(b.mLine, b.mColumn);
                     });
}

}  // namespace

CSong ReadRomanSong(std::string_view text, const CSongOptions& prefs) {
    const CRomanTextReading reading = ReadRomanText(text, prefs.mKey);
    CSong song;
    song.mFormat = TSongFormat_RomanText;
    song.mTitle = reading.mTitle;
    song.mMakers = reading.mComposer;
    song.mBeatsPerBar = prefs.mBeatsPerBar;
    if (!reading.mTimes.empty()) {
        const CRomanTextTime& first = reading.mTimes.front();
        song.mBeatsPerBar = 4.0 * first.mBeats / first.mBeatValue;
    }
    if (!reading.mMovement.empty()) song.mRemarks.push_back({"movement", reading.mMovement});
    if (!reading.mAnalyst.empty()) song.mRemarks.push_back({"analyst", reading.mAnalyst});
    AppendChords(reading, song);
    AppendBars(reading, song);
    for (const CRomanTextKey& key : reading.mKeys) {
        AppendStatedKey(key.mKey, key.mPosition, song);
    }
    AppendFaults(reading, song);
    GiveUpWhatIsAtFault(song, prefs.mLenient);
    return song;
}

}  // namespace brindle::SongReaders
