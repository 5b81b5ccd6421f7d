// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/internal/ScoreElements.h"
#include "brindle/musicxml/internal/WrittenScore.h"

#include <cstdint>
#include <string_view>

namespace brindle {

class XmlAttributes;

/// Reads the keys and times of a measure.
class CSignatureReader {
public:
    /// Reads into the last measure of the part, which is there already.
    explicit CSignatureReader(CScorePart& part) : mPart(part) {}

    void Started(TScoreElement element, const XmlAttributes& attributes);
    void Ended(TScoreElement element, TScoreElement parent, std::string_view text);

private:
    void EndedInKey(TScoreElement element, std::string_view text);
    void EndedInTime(TScoreElement element, std::string_view text);
    void AddTime(std::int32_t beatType);

    CScorePart& mPart;
    CScoreTime mTime;
    std::int32_t mBeats = 0;
    bool mHasFifths = false;
    bool mIsOtherStaffKey = false;
    CScoreKey mKey;
};

}  // namespace brindle
