// SPDX-License-Identifier: MIT
#include "brindle/musicxml/internal/PlayMarkReader.h"

#include "brindle/musicxml/internal/ScoreWords.h"
#include "brindle/platform/ReadNumber.h"
#include "brindle/platform/XmlStreamParser.h"

namespace brindle {

namespace {

using enum TScoreElement;

bool IsYes(std::string_view text) {
    return text == "yes";
}

void SetMark(CJumpMark& mark, const XmlAttributes& attributes, std::string_view name) {
    if (const auto value = attributes.Find(name)) mark.Set(*value);
}

}  // namespace

void CPlayMarkReader::Started(TScoreElement element, TScoreElement parent,
                              const XmlAttributes& attributes) {
    switch (element) {
        case Direction:
            mWords.clear();
            mHasCodaSign = false;
            return;
        case Segno:
            return Marks().mSegno.Set();
        case Coda:
            mHasCodaSign = true;
            if (parent == Barline) Marks().mCoda.Set();
            return;
        case Rehearsal:
            Measure().mHasRehearsal = true;
            return;
        case Sound:
            return StartedSound(attributes);
        case Barline:
            mIsAtLeft = attributes.Value("location") == "left";
            mIsAtRight = attributes.Value("location") == "right";
            return;
        case Repeat:
            return StartedRepeat(attributes);
        case Ending:
            return StartedEnding(attributes);
        default:
            return;
    }
}

// A sign to begin that stands behind a measure is meant for the next one, and a sign to go back
// that stands in front of it is meant for the one before.
void CPlayMarkReader::StartedRepeat(const XmlAttributes& attributes) {
    CPlayMarks* marks = &Marks();
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
    const std::size_t count = mPart.mMarks.size();
    if (mIsAtLeft && count > 1) marks = &mPart.mMarks[count - 2];
    marks->mRepeatBackward = true;
    if (IsYes(attributes.Value("after-jump"))) marks->mRepeatAfterJump = true;
    const std::int32_t times = ReadInteger(attributes.Value("times"));
    if (times > 0) marks->mRepeatTimes = times;
}

void CPlayMarkReader::StartedEnding(const XmlAttributes& attributes) {
    CPlayMarks& marks = Marks();
    if (attributes.Value("type") == "start") {
        marks.mEndingStarts = true;
        marks.mEndingNumbers = ReadEndingNumbers(attributes.Value("number"));
    } else {
        marks.mEndingStops = true;
    }
}

void CPlayMarkReader::StartedSound(const XmlAttributes& attributes) {
    CPlayMarks& marks = Marks();
    if (IsYes(attributes.Value("dacapo"))) marks.mDaCapo = true;
    if (IsYes(attributes.Value("forward-repeat"))) marks.mRepeatForward = true;
    SetMark(marks.mDalSegno, attributes, "dalsegno");
    SetMark(marks.mSegno, attributes, "segno");
    SetMark(marks.mCoda, attributes, "coda");
    SetMark(marks.mToCoda, attributes, "tocoda");
    if (const auto fine = attributes.Find("fine")) marks.mFine = *fine != "no";
}

void CPlayMarkReader::Ended(TScoreElement element, std::string_view text) {
    switch (element) {
        case Ending:
            return EndedEnding(text);
        case Rehearsal:
            if (Measure().mRehearsal.empty()) Measure().mRehearsal = text;
            return;
        case Words:
            return EndedWords(text);
        case Direction:
            return EndedDirection();
        default:
            return;
    }
}

void CPlayMarkReader::EndedEnding(std::string_view text) {
    CPlayMarks& marks = Marks();
    if (!marks.mEndingStarts || !marks.mEndingNumbers.empty()) return;
    marks.mEndingNumbers = ReadEndingNumbers(text);
}

void CPlayMarkReader::EndedWords(std::string_view text) {
    if (text == "/") Measure().mHasSlash = true;
    mWords += ' ';
    mWords += text;
}

// The words of one direction belong together: "D.S." and "al Coda" may be set apart.
void CPlayMarkReader::EndedDirection() {
    CPlayMarks found;
    ReadPlayWords(mWords, mHasCodaSign, found);
    if (mHasCodaSign && !found.mToCoda.mIsSet) found.mCoda.Set();
    Marks().Add(found);
}

// Where a sign or a name of the coda stands with the instruction to go there, it is not the coda
// itself.
void CPlayMarkReader::Finish() {
    if (Marks().mToCoda.mIsSet) Marks().mCoda = {};
}

}  // namespace brindle
