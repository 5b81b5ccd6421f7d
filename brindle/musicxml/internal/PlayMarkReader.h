// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/internal/ScoreElements.h"
#include "brindle/musicxml/internal/WrittenScore.h"

#include <string>
#include <string_view>

namespace brindle {

class XmlAttributes;

/// Reads what steers the playing of a measure: bar lines, words, signs and sound instructions.
class CPlayMarkReader {
public:
    /// Reads into the last measure of the part, which is there already.
    explicit CPlayMarkReader(CScorePart& part) : mPart(part) {}

    void Started(TScoreElement element, TScoreElement parent, const XmlAttributes& attributes);
    void Ended(TScoreElement element, std::string_view text);
    /// To be called at the end of the measure.
    void Finish();

private:
    [[nodiscard]] CScoreMeasure& Measure() { return mPart.mMeasures.back(); }
    [[nodiscard]] CPlayMarks& Marks() { return mPart.mMarks.back(); }

    void StartedRepeat(const XmlAttributes& attributes);
    void StartedEnding(const XmlAttributes& attributes);
    void StartedSound(const XmlAttributes& attributes);
    void EndedEnding(std::string_view text);
    void EndedWords(std::string_view text);
    void EndedDirection();

    CScorePart& mPart;
    std::string mWords;  // of the direction that is being read
    bool mHasCodaSign = false;
    bool mIsAtLeft = false;  // of the bar line that is being read
    bool mIsAtRight = false;
};

}  // namespace brindle
