// SPDX-License-Identifier: MIT
#include "brindle/musicxml/internal/PlayedScore.h"
#include "brindle/song/HarmonySymbols.h"
#include "brindle/song/internal/SongReaders.h"
#include "brindle/song/internal/StatedKey.h"
#include "brindle/song/internal/WrittenSigns.h"

#include <algorithm>
#include <map>
#include <utility>

namespace brindle {

namespace SongReaders {

namespace {

/// The length that most bars have, 0 without bars.
double CommonLength(const std::vector<CSongBar>& bars) {
    std::map<double, std::size_t> counts;
    for (const CSongBar& bar : bars) ++counts[bar.mLength];
    const auto most = std::max_element(
        counts.begin(), counts.end(),
        [](const auto& one, const auto& other) { return one.second < other.second; });
    return most == counts.end() ? 0.0 : most->first;
}

double BeatsPerBarOf(const CSong& song) {
    constexpr double kUsual = 4.0;
    double length = CommonLength(song.mBars);
    const auto timed = std::find_if(song.mBars.begin(), song.mBars.end(),
                                    [](const CSongBar& bar) { return !bar.mTime.IsUndef(); });
    if (timed != song.mBars.end()) {
        length = 4.0 * timed->mTime.mNumerator / timed->mTime.mDenominator;
    }
    return length >= 1.0 / 64 && length <= 1024.0 ? length : kUsual;
}

void AppendChords(const CPlayedScore& score, CSong& song) {
    for (const TMusicXMLHarmony& harmony : score.mDoc.Harmonies) {
        song.mChords.emplace_back(ChordOfHarmony(harmony), harmony.mPosition);
        song.mSymbols.push_back(HarmonySymbol(harmony));
        if (harmony.mHasAugmentedSixth) StateSeventh(TSeventhSpelling_AugmentedSixth, song);
    }
    if (song.mChords.empty()) return;
    // An offset may move the last chord behind the last bar line.
    const double end = std::max(score.mEnd, song.mChords.back().mPosition);
    song.mChords.emplace_back(CChordLite_Undef, end);
}

void AppendBars(const CPlayedScore& score, CSong& song) {
    const auto& lines = score.mDoc.HarmBarlines;
    std::size_t time = 0;
    const auto& times = score.mDoc.TimeSignatures;
    for (std::size_t i = 0; i < lines.size(); ++i) {
        const CScoreMeasure& measure = score.mWritten.mMeasures[score.mOrder.mMeasures[i]];
        const double begin = lines[i].mPosition;
        const double end = i + 1 < lines.size() ? lines[i + 1].mPosition : score.mEnd;
        while (time < times.size() && times[time].mPosition <= begin) ++time;
        CSongBar& bar = song.mBars.emplace_back();
        bar.mNumber = measure.mNumber;
        bar.mPosition = begin;
        bar.mLength = end - begin;
        const std::size_t written = score.mOrder.mMeasures[i];
        SetWritten(written, score.mWritten.mMarks[written], bar);
        if (time > 0) bar.mTime = {times[time - 1].mNumerator, times[time - 1].mDenominator};
        if (measure.mHasRehearsal) song.mSections.push_back({measure.mRehearsal, begin});
    }
}

void AppendRepeats(const CPlayedScore& score, CSong& song) {
    const auto& lines = score.mDoc.HarmBarlines;
    for (const CJumpBack& jump : score.mOrder.mJumpsBack) {
        if (jump.mTo >= lines.size()) return;
        song.mRepeats.push_back(
            {lines[jump.mTo].mPosition, lines[jump.mFrom].mPosition, jump.mLength});
    }
}

CSong SongOf(const CPlayedScore& score, TSongFormat format) {
    CSong song;
    song.mFormat = format;
    song.mTitle = score.mWritten.mTitle;
    song.mMakers = score.mWritten.mMakers;
    if (score.mFault) {
        song.mFaults.push_back(
            {score.mFault->mLine, score.mFault->mColumn, score.mFault->mError.description});
        return song;
    }
    song.mTempo = score.mWritten.mTempo;
    AppendChords(score, song);
    AppendBars(score, song);
    AppendRepeats(score, song);
    for (const CHarmAnlsSignKey& key : score.mDoc.HarmSignKeys) {
        AppendStatedKey(key.mSignKey, key.mPosition, song);
    }
    song.mBeatsPerBar = BeatsPerBarOf(song);
    return song;
}

}  // namespace

CSong ReadScoreSong(std::string_view bytes, TSongFormat format) {
    return SongOf(PlayScoreBytes(bytes), format);
}

}  // namespace SongReaders

}  // namespace brindle
