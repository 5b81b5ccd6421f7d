// SPDX-License-Identifier: MIT
#include "brindle/present/internal/CChordsAround.h"

#include "brindle/analysis/internal/NumeralDegree.h"
#include "brindle/analysis/internal/NumeralText.h"
#include "brindle/theory/KeyIntervals.h"

#include <algorithm>

namespace brindle {

CChordsAround::CChordsAround(const CSong& song, const CSongReading& reading)
    : mSong(&song), mReading(&reading), mChords(KeyChordsOf(song.mChords)) {
    mNumbers.reserve(song.mChords.size());
    std::size_t begun = 0;
    for (std::size_t ix = 0; ix < song.mChords.size(); ++ix) {
        if (begun < mChords.size() && mChords[begun].mBegin == ix) ++begun;
        mNumbers.push_back(static_cast<std::ptrdiff_t>(begun) - 1);
    }
}

bool CChordsAround::HasChord(std::size_t ix) const {
    return ix < mReading->mChords.size() && !mReading->mChords[ix].mKey.IsUndef();
}

bool CChordsAround::IsRepeated(std::size_t ix) const {
    const std::ptrdiff_t number = mNumbers[ix];
    return number >= 0 && mChords[static_cast<std::size_t>(number)].mBegin != ix;
}

std::ptrdiff_t CChordsAround::Beside(std::size_t ix, std::ptrdiff_t step) const {
    const std::ptrdiff_t number = mNumbers[ix] + step;
    if (number < 0 || number >= static_cast<std::ptrdiff_t>(mChords.size())) return kNoneAround;
    return static_cast<std::ptrdiff_t>(mChords[static_cast<std::size_t>(number)].mBegin);
}

std::string CChordsAround::Symbol(std::ptrdiff_t ix) const {
    if (ix < 0 || static_cast<std::size_t>(ix) >= mSong->mSymbols.size()) return {};
    return mSong->mSymbols[static_cast<std::size_t>(ix)];
}

const CKeyChord* CChordsAround::ChordAt(std::ptrdiff_t ix) const {
    if (ix < 0 || static_cast<std::size_t>(ix) >= mNumbers.size()) return nullptr;
    const std::ptrdiff_t number = mNumbers[static_cast<std::size_t>(ix)];
    return number < 0 ? nullptr : &mChords[static_cast<std::size_t>(number)];
}

int CChordsAround::Root(std::ptrdiff_t ix) const {
    const CKeyChord* chord = ChordAt(ix);
    return chord == nullptr ? kKeyNrUndef : chord->mRoot;
}

int CChordsAround::Bass(std::ptrdiff_t ix) const {
    const CKeyChord* chord = ChordAt(ix);
    return chord == nullptr ? kKeyNrUndef : chord->mBass;
}

bool CChordsAround::HasOtherThird(std::ptrdiff_t ix, const CSignKeyLite& key) const {
    const CKeyChord* chord = ChordAt(ix);
    if (chord == nullptr || chord->mClass == TKeyChordClass_Open) return false;
    return IsSmallNumeral(chord->mClass) != (key.mSignKeyType == TSignKeyType_Minor);
}

TSixthChord CChordsAround::SixthChord(std::size_t ix) const {
    const CKeyChord* chord = ChordAt(static_cast<std::ptrdiff_t>(ix));
    if (chord == nullptr) return TSixthChord_German;
    constexpr int secondDegree = 2;
    constexpr int fifth = 7;
    const int served = ServedKey(Reading(ix)).mRootKeyEnh.mKeyNr;
    if (FoldIntoOctave(chord->mRoot - served) == secondDegree) return TSixthChord_French;
    return chord->Has(fifth) ? TSixthChord_German : TSixthChord_Italian;
}

bool CChordsAround::IsNeapolitanSixth(std::size_t ix) const {
    constexpr int third = 4;
    const auto place = static_cast<std::ptrdiff_t>(ix);
    return FoldIntoOctave(Bass(place) - Root(place)) == third;
}

CSignKeyLite ServedKey(const CChordReading& reading) {
    const CServedDegree& served = reading.mServes;
    if (served.mSemitones < 0 || reading.mKey.IsUndef()) return {};
    if (served.IsTonic()) return reading.mKey;
    const CKeyEnh root = NoteOfDegree({served.mNumber, served.mAccidental}, reading.mKey);
    return {root, served.mIsMinor ? TSignKeyType_Minor : TSignKeyType_Major};
}

}  // namespace brindle
