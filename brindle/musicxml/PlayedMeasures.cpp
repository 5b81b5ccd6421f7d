// SPDX-License-Identifier: MIT
#include "brindle/musicxml/PlayedMeasures.h"

#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/platform/ReadNumber.h"
#include "brindle/platform/Utf8.h"

#include <algorithm>

namespace brindle {

namespace {

/// The walk in playing order. A repeat is played in passes, counted from 1; an ending with a number
/// is played in the pass of that number. After "D.S. al Coda" the next measure with a coda sign
/// jumps to the coda that belongs to it.
class CWalk {
public:
    CWalk(const CWrittenMeasures& written, TMusicXMLDoc& doc) : mWritten(written), mDoc(doc) {}

    bool Run() {
        CPlayExtent written{.mMeasures = mWritten.mMeasures.size()};
        for (const TMusicXMLMeasure& measure : mWritten.mMeasures) {
            for (const TMusicXMLHarmony& harmony : measure.mHarmonies) written.Add(harmony);
        }
        mDoc.Harmonies.reserve(written.mHarmonies);
        mLimits = PlayLimitsOf(written);
        for (; IsInside(mIx); ++mPlayed.mMeasures) {
            if (mPlayed.mMeasures == mLimits.mMeasures || !mPlayed.HasRoomIn(mLimits)) return false;
            PlayMeasure();
            ++mIx;
        }
        return mPlayed.HasRoomIn(mLimits);
    }

private:
    void PlayMeasure() {
        mMeasure = &At(mIx);
        AppendSection();
        SkipFinishedEnding();
        AppendTimeSignature();
        AppendSignKey();
        StartRepeat();
        if (mMeasure->mEndingNumber == 0 || mMeasure->mEndingNumber == mPass) AppendHarmonies();
        if (mMeasure->mRepeatBackward) JumpToRepeatStart();
        if (mMeasure->mCoda) ArriveAtCoda();
        if (mMeasure->mDalSegnoAlCoda && !mToCoda && !mInRepeat) JumpToSegno();
    }

    [[nodiscard]] bool IsInside(std::int64_t ix) const {
        return ix < static_cast<std::int64_t>(mWritten.mMeasures.size());
    }
    [[nodiscard]] const TMusicXMLMeasure& At(std::int64_t ix) const {
        return mWritten.mMeasures[static_cast<std::size_t>(ix)];
    }

    void AppendSection() {
        if (mMeasure->mRehearsal != 1) return;
        mDoc.HarmSections.push_back({.mPosition = mDistance, .mIsFirst = mFirstSection});
        mFirstSection = false;
    }

    // Kept: what is appended on the way is the measure at which the skip began.
    void SkipFinishedEnding() {
        const std::int32_t ending = mMeasure->mEndingNumber;
        if (ending < 1 || ending >= mPass || !mInRepeat) return;
        while (IsInside(mIx) && !At(mIx).mRepeatBackward) {
            if (At(mIx).mEndingNumber == mPass) AppendHarmonies();
            ++mIx;
        }
        ++mIx;
        if (IsInside(mIx)) mMeasure = &At(mIx);
        mInRepeat = false;
    }

    void AppendTimeSignature() {
        const TMusicXMLMeasure& measure = *mMeasure;
        if (measure.mBeats == -1 || measure.mBeatType == -1) return;
        auto& all = mDoc.TimeSignatures;
        if (!all.empty() && all.back().mNumerator == measure.mBeats &&
            all.back().mDenominator == measure.mBeatType) {
            return;
        }
        all.push_back({mDistance, measure.mBeats, measure.mBeatType});
    }

    // Kept: the comparison is with the last key of the whole list, which at first is the last one
    // that was read, so that a song in one key has no placed entry.
    void AppendSignKey() {
        if (mMeasure->mHarmSignKeyIndex == -1) return;
        auto& all = mDoc.HarmSignKeys;
        CHarmAnlsSignKey signKey = all[static_cast<std::size_t>(mMeasure->mHarmSignKeyIndex)];
        if (all.back().mSignKey == signKey.mSignKey) return;
        signKey.mPosition = mDistance;
        all.push_back(signKey);
    }

    void StartRepeat() {
        if (!mMeasure->mRepeatForward || mInRepeat) return;
        mRepeatTimes = mMeasure->mRepeatTimes;
        mPass = 1;
        mRepeatStartIx = mIx;
        mInRepeat = true;
    }

    /// `appendHarmoniesToDoc:distToSongStart:barIndex:`
    void AppendHarmonies() {
        if (mMeasure->mSlash) mDoc.ChordSequences.push_back(mDoc.Harmonies.size());
        bool isFirst = true;
        for (const TMusicXMLHarmony& written : mMeasure->mHarmonies) {
            mPlayed.Add(written);
            if (!mPlayed.HasRoomIn(mLimits)) return;
            TMusicXMLHarmony& harmony = mDoc.Harmonies.emplace_back(written);
            harmony.mPosition = mDistance;
            if (harmony.mKind.empty()) harmony.mKind = "major";
            if (harmony.mKind == "none" && !isFirst) harmony.mRoot = {"N.C.", 0};
            mDistance += harmony.mDuration;
            isFirst = false;
        }
    }

    void JumpToRepeatStart() {
        if (!mMeasure->mRepeatWords.empty()) {
            mRepeatTimes = ReadInteger(mMeasure->mRepeatWords.back());
        }
        if (mPass >= mRepeatTimes || (mMeasure->mCoda && mToCoda)) {
            mInRepeat = false;
            return;
        }
        AppendCopy(mIx - mRepeatStartIx + 1);
        mIx = mRepeatStartIx - 1;
        ++mPass;
    }

    void ArriveAtCoda() {
        mLastCodaIx = mIx;
        if (!mToCoda || mCodaPairIx >= mWritten.mCodaPairs.size()) return;
        mIx = mWritten.mCodaPairs[mCodaPairIx].second - 1;
        ++mCodaPairIx;
        mInRepeat = false;
        mToCoda = false;
    }

    void JumpToSegno() {
        const auto& pairs = mWritten.mSegnoPairs;
        const std::int64_t segno = mSegnoPairIx < pairs.size() ? pairs[mSegnoPairIx].second : 0;
        AppendCopy(mLastCodaIx - segno + 1);
        ++mSegnoPairIx;
        mIx = segno - 1;
        mToCoda = true;
    }

    void AppendCopy(std::int64_t bars) {
        mDoc.HarmCopies.push_back({.mTargetPos = mDistance,
                                   .mSourceOffsetBars = static_cast<std::int32_t>(bars),
                                   .mLengthBars = static_cast<std::uint64_t>(bars)});
    }

    const CWrittenMeasures& mWritten;
    TMusicXMLDoc& mDoc;
    const TMusicXMLMeasure* mMeasure = nullptr;
    std::int64_t mIx = 0;
    std::int64_t mPass = 0;
    bool mInRepeat = false;
    std::int64_t mRepeatStartIx = 0;
    std::int32_t mRepeatTimes = 0;
    std::int64_t mLastCodaIx = 0;
    bool mToCoda = false;
    std::size_t mCodaPairIx = 0;
    std::size_t mSegnoPairIx = 0;
    double mDistance = 0.0;
    CPlayExtent mPlayed;
    CPlayExtent mLimits;
    bool mFirstSection = true;
};

std::size_t BytesOf(const TMusicXMLHarmony& harmony) {
    std::size_t bytes = sizeof harmony + harmony.mRoot.mStep.size() + harmony.mKind.size() +
                        harmony.mBass.mStep.size() +
                        harmony.mDegrees.size() * sizeof(TMusicXMLDegree);
    for (const TMusicXMLDegree& degree : harmony.mDegrees) {
        bytes += degree.mValue.size() + degree.mType.size();
    }
    return bytes;
}

}  // namespace

void CPlayExtent::Add(const TMusicXMLHarmony& harmony) {
    ++mHarmonies;
    mBytes += BytesOf(harmony);
}

CPlayExtent PlayLimitsOf(const CPlayExtent& written) {
    const auto limit = [](std::size_t count, std::size_t least, std::size_t most) {
        return std::max(count, std::clamp(kMaxTimesPlayed * count, least, most));
    };
    return {.mMeasures = limit(written.mMeasures, kMinPlayedMeasures, kMaxPlayedMeasures),
            .mHarmonies = limit(written.mHarmonies, kMinPlayedHarmonies, kMaxPlayedHarmonies),
            .mBytes = limit(written.mBytes, kMinPlayedBytes, kMaxPlayedBytes)};
}

bool PlayMeasures(const CWrittenMeasures& written, TMusicXMLDoc& doc) {
    return CWalk(written, doc).Run();
}

bool IsRepeatWord(std::string_view text) {
    const std::size_t length = CountUtf8Characters(text);
    return length >= 2 && length <= 4 && text.find('x') != std::string_view::npos;
}

}  // namespace brindle
