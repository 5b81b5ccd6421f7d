// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/internal/CursorReader.h"
#include "brindle/musicxml/internal/HarmonyReader.h"
#include "brindle/musicxml/internal/PlayMarkReader.h"
#include "brindle/musicxml/internal/ScoreElements.h"
#include "brindle/musicxml/internal/SignatureReader.h"
#include "brindle/musicxml/internal/WrittenScore.h"

#include <string_view>

namespace brindle {

class XmlAttributes;

/// Reads one measure of one part: how long it is, where its harmonies stand, and what steers the
/// playing. Each subject has a reader of its own, and each element one of these readers.
class CMeasureReader {
public:
    /// Reads into the last measure of the part, which is there already.
    explicit CMeasureReader(CScorePart& part)
        : mPart(part), mCursor(part), mSignatures(part), mMarks(part) {}

    void Started(TScoreElement element, TScoreElement parent, const XmlAttributes& attributes);
    /// `text` is what stands in the element, without white space around it.
    void Ended(TScoreElement element, TScoreElement parent, std::string_view text);
    /// To be called at the end of the measure.
    void Finish();

private:
    void StartedHarmony(TScoreElement element, const XmlAttributes& attributes);
    void EndedHarmony(TScoreElement element, TScoreElement parent, std::string_view text);

    CScorePart& mPart;
    CCursorReader mCursor;
    CSignatureReader mSignatures;
    CPlayMarkReader mMarks;
    CHarmonyReader mHarmony;
    double mHarmonyOffset = 0.0;
};

}  // namespace brindle
