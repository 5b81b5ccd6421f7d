// SPDX-License-Identifier: MIT
#include "brindle/musicxml/internal/PlayedScore.h"

#include "brindle/musicxml/PlayedMeasures.h"
#include "brindle/platform/SortByNumber.h"
#include "brindle/theory/CSignKeyHeavy.h"

#include <algorithm>
#include <optional>

namespace brindle {

namespace {

CSignKeyLite SignKeyOf(const CScoreKey& key) {
    CSignKeyHeavy signKey;
    signKey.SetFromSignsCountAndType(key.mFifths, key.mType == TSignKeyType_Minor
                                                      ? TSignKeyTypeNoUndef_Minor
                                                      : TSignKeyTypeNoUndef_Major);
    CSignKeyLite lite(signKey);
    lite.mSignKeyType = key.mType;
    return lite;
}

/// Lays the measures out in playing order.
class CLayout {
public:
    explicit CLayout(CPlayedScore& score)
        : mScore(score.mWritten), mOrder(score.mOrder), mDoc(score.mDoc), mEnd(score.mEnd) {}

    /// False when the song was cut.
    bool Run() {
        FindWhatHolds();
        mOrder = PlayInOrder(mScore.mMarks);
        const bool hasRoom = MakeRoom();
        for (std::size_t i = 0; i < mPlayedMeasures; ++i) Play(mOrder.mMeasures[i]);
        SetDurations();
        AppendCopies();
        return !mOrder.mWasCut && hasRoom;
    }

private:
    // The time and the key of a measure may be told in an earlier one.
    void FindWhatHolds() {
        std::optional<CScoreTime> time;
        std::optional<CScoreKey> key;
        for (const CScoreMeasure& measure : mScore.mMeasures) {
            if (measure.mTime) time = measure.mTime;
            if (measure.mKey) key = measure.mKey;
            mTimes.push_back(time);
            mKeys.push_back(key);
        }
    }

    // A long song takes much room; it is taken once, for the measures that are played whole. False
    // when these are not all.
    bool MakeRoom() {
        std::vector<CPlayExtent> measures;
        CPlayExtent written{.mMeasures = mScore.mMeasures.size()};
        for (const CScoreMeasure& measure : mScore.mMeasures) {
            CPlayExtent& extent = measures.emplace_back();
            for (const CWrittenHarmony& harmony : measure.mHarmonies) extent.Add(harmony.mHarmony);
            written.mHarmonies += extent.mHarmonies;
            written.mBytes += extent.mBytes;
        }
        const CPlayExtent limits = PlayLimitsOf(written);
        CPlayExtent played;
        std::size_t harmonies = 0;
        for (const std::uint32_t ix : mOrder.mMeasures) {
            played.mHarmonies += measures[ix].mHarmonies;
            played.mBytes += measures[ix].mBytes;
            if (!played.HasRoomIn(limits)) break;
            harmonies = played.mHarmonies;
            ++mPlayedMeasures;
        }
        mDoc.Harmonies.reserve(harmonies);
        mDoc.HarmBarlines.reserve(mPlayedMeasures);
        return mPlayedMeasures == mOrder.mMeasures.size();
    }

    void Play(std::size_t ix) {
        const CScoreMeasure& measure = mScore.mMeasures[ix];
        mDoc.HarmBarlines.push_back({QuartersOf(mPosition)});
        if (measure.mHasRehearsal) {
            mDoc.HarmSections.push_back(
                {.mPosition = QuartersOf(mPosition), .mIsFirst = mDoc.HarmSections.empty()});
        }
        AppendTime(mTimes[ix]);
        AppendKey(mKeys[ix]);
        if (measure.mHasSlash) mDoc.ChordSequences.push_back(mDoc.Harmonies.size());
        for (const CWrittenHarmony& written : measure.mHarmonies) {
            TMusicXMLHarmony& harmony = mDoc.Harmonies.emplace_back(written.mHarmony);
            harmony.mPosition =
                QuartersOf(std::max(TTicks{0}, AddTicks(mPosition, written.mOffset)));
        }
        mPosition = AddTicks(mPosition, measure.mLength);
    }

    void AppendTime(const std::optional<CScoreTime>& time) {
        if (!time || time == mTime) return;
        mTime = time;
        mDoc.TimeSignatures.push_back({QuartersOf(mPosition), time->mBeats, time->mBeatType});
    }

    // A key that begins later than the song leaves the beginning without one.
    void AppendKey(const std::optional<CScoreKey>& key) {
        if (!key || key == mKey) return;
        mKey = key;
        if (mDoc.HarmSignKeys.empty() && mPosition > 0) {
            mDoc.HarmSignKeys.emplace_back().mPosition = 0.0;
        }
        CHarmAnlsSignKey& signKey = mDoc.HarmSignKeys.emplace_back();
        signKey.mPosition = QuartersOf(mPosition);
        signKey.mSignKey = SignKeyOf(*key);
    }

    // An offset may move a harmony across a bar line, past harmonies of other measures.
    void SetDurations() {
        auto& harmonies = mDoc.Harmonies;
        SortByNumber(harmonies, [](const TMusicXMLHarmony& harmony) { return harmony.mPosition; });
        mEnd = QuartersOf(mPosition);
        double next = mEnd;
        for (std::size_t i = harmonies.size(); i-- > 0;) {
            harmonies[i].mDuration = std::max(0.0, next - harmonies[i].mPosition);
            next = harmonies[i].mPosition;
        }
    }

    void AppendCopies() {
        const std::size_t count = mDoc.HarmBarlines.size();
        for (const CJumpBack& jump : mOrder.mJumpsBack) {
            if (jump.mTo >= count) break;
            const auto back = static_cast<std::int32_t>(jump.mTo - jump.mFrom);
            mDoc.HarmCopies.push_back({.mTargetPos = mDoc.HarmBarlines[jump.mTo].mPosition,
                                       .mSourceOffsetBars = -back,
                                       .mLengthBars = std::min(jump.mLength, count - jump.mTo)});
        }
    }

    const CWrittenScore& mScore;
    CPlayingOrder& mOrder;
    TMusicXMLDoc& mDoc;
    double& mEnd;
    std::vector<std::optional<CScoreTime>> mTimes;  // that hold in each measure
    std::vector<std::optional<CScoreKey>> mKeys;
    TTicks mPosition = 0;
    std::optional<CScoreTime> mTime;
    std::optional<CScoreKey> mKey;
    std::size_t mPlayedMeasures = 0;  // up to the limits
};

}  // namespace

bool LayOutAsPlayed(CPlayedScore& score) {
    return CLayout(score).Run();
}

}  // namespace brindle
