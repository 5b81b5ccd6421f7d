// SPDX-License-Identifier: MIT
#include "brindle/musicxml/internal/MeasureReader.h"

#include "brindle/musicxml/internal/ScoreWords.h"
#include "brindle/platform/ReadNumber.h"
#include "brindle/platform/XmlStreamParser.h"

#include <algorithm>
#include <cmath>

namespace brindle {

namespace {

using enum TScoreElement;

constexpr std::int32_t kMostBeats = 10'000;

TTicks RoundedTicks(double ticks) {
    const auto most = static_cast<double>(kMostTicks);
    return std::isnan(ticks) ? 0
                             : static_cast<TTicks>(std::llround(std::clamp(ticks, -most, most)));
}

// "3+2" is five beats.
std::int32_t SumOfBeats(std::string_view text) {
    std::int32_t sum = 0;
    while (true) {
        sum += std::clamp(ReadInteger(text), 0, kMostBeats);
        const std::size_t plus = text.find('+');
        if (plus == text.npos || sum >= kMostBeats) return std::min(sum, kMostBeats);
        text.remove_prefix(plus + 1);
    }
}

TSignKeyType ModeOf(std::string_view text) {
    if (text == "major" || text == "ionian") return TSignKeyType_Major;
    if (text == "minor" || text == "aeolian") return TSignKeyType_Minor;
    return TSignKeyType_Undef;
}

bool IsYes(std::string_view text) {
    return text == "yes";
}

void SetMark(TJumpMark& mark, const XmlAttributes& attributes, std::string_view name) {
    if (const auto value = attributes.Find(name)) mark.Set(*value);
}

}  // namespace

TTicks CMeasureReader::TicksOf(double duration) const {
    const double divisions = mPart.mDivisions > 0.0 ? mPart.mDivisions : 1.0;
    return RoundedTicks(duration * (static_cast<double>(kTicksPerQuarter) / divisions));
}

void CMeasureReader::Started(TScoreElement element, TScoreElement parent,
                             const XmlAttributes& attributes) {
    switch (element) {
        case Note:
        case Backup:
        case Forward:
            mDuration = 0.0;
            mIsChordNote = mIsGraceNote = false;
            break;
        case Chord:
            mIsChordNote = true;
            break;
        case Grace:
            mIsGraceNote = true;
            break;
        case Harmony:
            mHarmony = CHarmonyReader(attributes);
            mHarmonyOffset = 0.0;
            break;
        case Key:
            mKey = {};
            mHasFifths = false;
            mIsOtherStaffKey = ReadInteger(attributes.Value("number")) > 1;
            break;
        case Time:
            mTime = {};
            mBeats = 0;
            break;
        case Direction:
            mWords.clear();
            mHasCodaSign = false;
            break;
        case Segno:
            Marks().mSegno.Set();
            break;
        case Coda:
            mHasCodaSign = true;
            if (parent == Barline) Marks().mCoda.Set();
            break;
        case Rehearsal:
            Measure().mHasRehearsal = true;
            break;
        case Sound:
            StartedSound(attributes);
            break;
        case Barline:
            mIsAtLeft = attributes.Value("location") == "left";
            mIsAtRight = attributes.Value("location") == "right";
            break;
        case Repeat:
            StartedRepeat(attributes);
            break;
        case Ending:
            StartedEnding(attributes);
            break;
        default:
            mHarmony.Started(element, attributes);
    }
}

// A sign to begin that stands behind a measure is meant for the next one, and a sign to go back
// that stands in front of it is meant for the one before.
void CMeasureReader::StartedRepeat(const XmlAttributes& attributes) {
    TPlayMarks* marks = &Marks();
    const std::string_view direction = attributes.Value("direction");
    if (direction == "forward") {
        if (mIsAtRight) {
            mPart.mRepeatBeginsNext = true;
        } else {
            marks->mRepeatForward = true;
        }
        return;
    }
    if (direction != "backward") return;
    const std::size_t count = mPart.mMeasures.size();
    if (mIsAtLeft && count > 1) marks = &mPart.mMeasures[count - 2].mMarks;
    marks->mRepeatBackward = true;
    if (IsYes(attributes.Value("after-jump"))) marks->mRepeatAfterJump = true;
    const std::int32_t times = ReadInteger(attributes.Value("times"));
    if (times > 0) marks->mRepeatTimes = times;
}

void CMeasureReader::StartedEnding(const XmlAttributes& attributes) {
    TPlayMarks& marks = Marks();
    if (attributes.Value("type") == "start") {
        marks.mEndingStarts = true;
        marks.mEndingNumbers = ReadEndingNumbers(attributes.Value("number"));
    } else {
        marks.mEndingStops = true;
    }
}

void CMeasureReader::StartedSound(const XmlAttributes& attributes) {
    TPlayMarks& marks = Marks();
    if (IsYes(attributes.Value("dacapo"))) marks.mDaCapo = true;
    if (IsYes(attributes.Value("forward-repeat"))) marks.mRepeatForward = true;
    SetMark(marks.mDalSegno, attributes, "dalsegno");
    SetMark(marks.mSegno, attributes, "segno");
    SetMark(marks.mCoda, attributes, "coda");
    SetMark(marks.mToCoda, attributes, "tocoda");
    if (const auto fine = attributes.Find("fine")) marks.mFine = *fine != "no";
}

void CMeasureReader::Ended(TScoreElement element, TScoreElement parent, std::string_view text) {
    switch (element) {
        case Duration:
            if (parent == Note || parent == Backup || parent == Forward) {
                mDuration = ReadDecimal(text);
            }
            break;
        case Note:
            EndedNote();
            break;
        case Backup:
            Move(-TicksOf(mDuration));
            break;
        case Forward:
            Move(TicksOf(mDuration));
            break;
        case Divisions:
            EndedDivisions(text);
            break;
        case Beats:
            if (parent == Time) mBeats = SumOfBeats(text);
            break;
        case BeatType:
            if (parent == Time) EndedBeatType(ReadInteger(text));
            break;
        case Time:
            if (mTime.BarLength() > 0) Measure().mTime = mTime;
            break;
        case Fifths:
            mKey.mFifths = ReadInteger(text);
            mHasFifths = true;
            break;
        case Mode:
            mKey.mType = ModeOf(text);
            break;
        case Key:
            if (mHasFifths && !mIsOtherStaffKey) Measure().mKey = mKey;
            break;
        case Ending:
            if (Marks().mEndingStarts && Marks().mEndingNumbers.empty()) {
                Marks().mEndingNumbers = ReadEndingNumbers(text);
            }
            break;
        case Words:
            EndedWords(text);
            break;
        case Direction:
            EndedDirection();
            break;
        case Offset:
            if (parent == Harmony) mHarmonyOffset = ReadDecimal(text);
            break;
        case Harmony:
            EndedHarmony();
            break;
        default:
            mHarmony.Ended(element, text);
    }
}

void CMeasureReader::EndedNote() {
    if (!mIsChordNote && !mIsGraceNote) Move(TicksOf(mDuration));
}

void CMeasureReader::Move(TTicks ticks) {
    mCursor = std::max(TTicks{0}, AddTicks(mCursor, ticks));
    Measure().mLength = std::max(Measure().mLength, mCursor);
}

// Scores exist that tell their divisions only behind the first notes; these are measured anew.
void CMeasureReader::EndedDivisions(std::string_view text) {
    const double divisions = ReadDecimal(text);
    if (!(divisions > 0.0)) return;
    const bool isFirst = mPart.mDivisions <= 0.0;
    mPart.mDivisions = divisions;
    if (!isFirst) return;
    const auto measureAnew = [&](TTicks& ticks) {
        ticks = RoundedTicks(static_cast<double>(ticks) / divisions);
    };
    measureAnew(mCursor);
    for (TScoreMeasure& measure : mPart.mMeasures) {
        measureAnew(measure.mLength);
        for (TWrittenHarmony& harmony : measure.mHarmonies) measureAnew(harmony.mOffset);
    }
}

// Several pairs of numbers stand for times that are added, "3/8 + 2/4".
void CMeasureReader::EndedBeatType(std::int32_t beatType) {
    if (beatType <= 0 || beatType > kMostBeats || mBeats <= 0) return;
    if (mTime.mBeatType == 0) {
        mTime = {mBeats, beatType};
    } else if (beatType % mTime.mBeatType == 0) {
        mTime = {mTime.mBeats * (beatType / mTime.mBeatType) + mBeats, beatType};
    } else if (mTime.mBeatType % beatType == 0) {
        mTime.mBeats += mBeats * (mTime.mBeatType / beatType);
    }
    mTime.mBeats = std::min(mTime.mBeats, kMostBeats);
    mBeats = 0;
}

void CMeasureReader::EndedWords(std::string_view text) {
    if (text == "/") Measure().mHasSlash = true;
    mWords += ' ';
    mWords += text;
}

// The words of one direction belong together: "D.S." and "al Coda" may be set apart.
void CMeasureReader::EndedDirection() {
    TPlayMarks found;
    ReadPlayWords(mWords, mHasCodaSign, found);
    if (mHasCodaSign && !found.mToCoda.mIsSet) found.mCoda.Set();
    Marks().Add(found);
}

void CMeasureReader::EndedHarmony() {
    auto harmony = mHarmony.Take();
    if (!harmony) return;
    mPart.mHasHarmonies = true;
    Measure().mHarmonies.push_back(
        {AddTicks(mCursor, TicksOf(mHarmonyOffset)), std::move(*harmony)});
}

void CMeasureReader::Finish() {
    TPlayMarks& marks = Marks();
    // Where a sign or a name of the coda stands with the instruction to go there, it is not the
    // coda itself.
    if (marks.mToCoda.mIsSet) marks.mCoda = {};
    auto& harmonies = Measure().mHarmonies;
    std::stable_sort(harmonies.begin(), harmonies.end(),
                     [](const auto& a, const auto& b) { return a.mOffset < b.mOffset; });
}

}  // namespace brindle
