// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/internal/HarmonyReader.h"
#include "brindle/musicxml/internal/ScoreElements.h"
#include "brindle/musicxml/internal/WrittenScore.h"

#include <string>
#include <string_view>

namespace brindle {

class XmlAttributes;

/// Reads one measure of one part: how long it is, where its harmonies stand, and what steers the
/// playing.
class CMeasureReader {
public:
    /// Reads into the last measure of the part, which is there already.
    explicit CMeasureReader(TScorePart& part) : mPart(part) {}

    void Started(TScoreElement element, TScoreElement parent, const XmlAttributes& attributes);
    /// `text` is what stands in the element, without white space around it.
    void Ended(TScoreElement element, TScoreElement parent, std::string_view text);
    /// To be called at the end of the measure.
    void Finish();

private:
    [[nodiscard]] TScoreMeasure& Measure() { return mPart.mMeasures.back(); }
    [[nodiscard]] TPlayMarks& Marks() { return Measure().mMarks; }
    [[nodiscard]] TTicks TicksOf(double duration) const;

    void StartedRepeat(const XmlAttributes& attributes);
    void StartedEnding(const XmlAttributes& attributes);
    void StartedSound(const XmlAttributes& attributes);
    void EndedNote();
    void Move(TTicks ticks);
    void EndedDivisions(std::string_view text);
    void EndedBeatType(std::int32_t beatType);
    void EndedWords(std::string_view text);
    void EndedDirection();
    void EndedHarmony();

    TScorePart& mPart;
    TTicks mCursor = 0;

    double mDuration = 0.0;  // of the note or the move that is being read
    bool mIsChordNote = false;
    bool mIsGraceNote = false;

    CHarmonyReader mHarmony;
    double mHarmonyOffset = 0.0;

    TScoreTime mTime;
    std::int32_t mBeats = 0;
    bool mHasFifths = false;
    bool mIsOtherStaffKey = false;
    TScoreKey mKey;

    std::string mWords;  // of the direction that is being read
    bool mHasCodaSign = false;
    bool mIsAtLeft = false;  // of the bar line that is being read
    bool mIsAtRight = false;
};

}  // namespace brindle
