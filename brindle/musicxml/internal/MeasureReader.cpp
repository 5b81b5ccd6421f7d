// SPDX-License-Identifier: MIT
#include "brindle/musicxml/internal/MeasureReader.h"

#include "brindle/platform/ReadNumber.h"

#include <algorithm>
#include <utility>

namespace brindle {

namespace {

using enum TScoreElement;

enum class TSubject { Cursor, Signatures, Marks, Harmony };

constexpr TSubject SubjectOf(TScoreElement element) {
    switch (element) {
        case Note:
        case Backup:
        case Forward:
        case Chord:
        case Grace:
        case Duration:
        case Divisions:
            return TSubject::Cursor;
        case Key:
        case Fifths:
        case Mode:
        case Time:
        case Beats:
        case BeatType:
            return TSubject::Signatures;
        case Direction:
        case Words:
        case Rehearsal:
        case Segno:
        case Coda:
        case Sound:
        case Barline:
        case Repeat:
        case Ending:
            return TSubject::Marks;
        default:
            return TSubject::Harmony;
    }
}

}  // namespace

void CMeasureReader::Started(TScoreElement element, TScoreElement parent,
                             const XmlAttributes& attributes) {
    switch (SubjectOf(element)) {
        case TSubject::Cursor:
            return mCursor.Started(element);
        case TSubject::Signatures:
            return mSignatures.Started(element, attributes);
        case TSubject::Marks:
            return mMarks.Started(element, parent, attributes);
        case TSubject::Harmony:
            return StartedHarmony(element, attributes);
    }
}

void CMeasureReader::StartedHarmony(TScoreElement element, const XmlAttributes& attributes) {
    if (element != Harmony) return mHarmony.Started(element, attributes);
    mHarmony = CHarmonyReader(attributes);
    mHarmonyOffset = 0.0;
}

void CMeasureReader::Ended(TScoreElement element, TScoreElement parent, std::string_view text) {
    switch (SubjectOf(element)) {
        case TSubject::Cursor:
            return mCursor.Ended(element, parent, text);
        case TSubject::Signatures:
            return mSignatures.Ended(element, parent, text);
        case TSubject::Marks:
            return mMarks.Ended(element, text);
        case TSubject::Harmony:
            return EndedHarmony(element, parent, text);
    }
}

void CMeasureReader::EndedHarmony(TScoreElement element, TScoreElement parent,
                                  std::string_view text) {
    if (element == Offset) {
        if (parent == Harmony) mHarmonyOffset = ReadDecimal(text);
        return;
    }
    if (element != Harmony) return mHarmony.Ended(element, text);
    auto harmony = mHarmony.Take();
    if (!harmony) return;
    mPart.mHasHarmonies = true;
    mPart.mMeasures.back().mHarmonies.push_back(
        {AddTicks(mCursor.Cursor(), mCursor.TicksOf(mHarmonyOffset)), std::move(*harmony)});
}

void CMeasureReader::Finish() {
    mMarks.Finish();
    auto& harmonies = mPart.mMeasures.back().mHarmonies;
    std::stable_sort(harmonies.begin(), harmonies.end(),
                     [](const auto& a, const auto& b) { return a.mOffset < b.mOffset; });
}

}  // namespace brindle
