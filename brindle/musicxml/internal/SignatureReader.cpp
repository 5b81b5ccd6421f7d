// SPDX-License-Identifier: MIT
#include "brindle/musicxml/internal/SignatureReader.h"

#include "brindle/platform/ReadNumber.h"
#include "brindle/platform/XmlStreamParser.h"

#include <algorithm>

namespace brindle {

namespace {

using enum TScoreElement;

constexpr std::int32_t kMostBeatsRead = 10'000;

// "3+2" is five beats.
std::int32_t SumOfBeats(std::string_view text) {
    std::int32_t sum = 0;
    while (true) {
        sum += std::clamp(ReadInteger(text), 0, kMostBeatsRead);
        const std::size_t plus = text.find('+');
        if (plus == text.npos || sum >= kMostBeatsRead) return std::min(sum, kMostBeatsRead);
        text.remove_prefix(plus + 1);
    }
}

TSignKeyType ModeOf(std::string_view text) {
    if (text == "major" || text == "ionian") return TSignKeyType_Major;
    if (text == "minor" || text == "aeolian") return TSignKeyType_Minor;
    return TSignKeyType_Undef;
}

}  // namespace

void CSignatureReader::Started(TScoreElement element, const XmlAttributes& attributes) {
    if (element == Key) {
        mKey = {};
        mHasFifths = false;
        mIsOtherStaffKey = ReadInteger(attributes.Value("number")) > 1;
    } else if (element == Time) {
        mTime = {};
        mBeats = 0;
    }
}

void CSignatureReader::Ended(TScoreElement element, TScoreElement parent, std::string_view text) {
    CScoreMeasure& measure = mPart.mMeasures.back();
    if (element == Key) {
        if (mHasFifths && !mIsOtherStaffKey) measure.mKey = mKey;
    } else if (element == Time) {
        if (mTime.BarLength() > 0) measure.mTime = mTime;
    } else if (parent == Time) {
        EndedInTime(element, text);
    } else {
        EndedInKey(element, text);
    }
}

void CSignatureReader::EndedInKey(TScoreElement element, std::string_view text) {
    if (element == Fifths) {
        mKey.mFifths = ReadInteger(text);
        mHasFifths = true;
    } else if (element == Mode) {
        mKey.mType = ModeOf(text);
    }
}

void CSignatureReader::EndedInTime(TScoreElement element, std::string_view text) {
    if (element == Beats) {
        mBeats = SumOfBeats(text);
    } else if (element == BeatType) {
        AddTime(ReadInteger(text));
    }
}

// Several pairs of numbers stand for times that are added, "3/8 + 2/4".
void CSignatureReader::AddTime(std::int32_t beatType) {
    if (beatType <= 0 || beatType > kMostBeatsRead || mBeats <= 0) return;
    if (mTime.mBeatType == 0) {
        mTime = {mBeats, beatType};
    } else if (beatType % mTime.mBeatType == 0) {
        mTime = {mTime.mBeats * (beatType / mTime.mBeatType) + mBeats, beatType};
    } else if (mTime.mBeatType % beatType == 0) {
        mTime.mBeats += mBeats * (mTime.mBeatType / beatType);
    }
    mTime.mBeats = std::min(mTime.mBeats, kMostBeatsRead);
    mBeats = 0;
}

}  // namespace brindle
