// SPDX-License-Identifier: MIT
#include "brindle/present/internal/SheetLinks.h"

#include "brindle/theory/KeyIntervals.h"

#include <algorithm>

namespace brindle::LeadSheet {
namespace {

enum class TLink { None, Arrow, DottedArrow, Bracket, DottedBracket };

bool StandsForDominant(TChordRelation relation) {
    return relation == TChordRelation_SubstituteDominant ||
           relation == TChordRelation_AugmentedSixth || relation == TChordRelation_Backdoor;
}

// Whether a chord is the one that a dominant serves, or the six-four chord that delays it.
bool IsServedBy(const CChordReading& dominant, const CChordLite& chord) {
    const int served =
        FoldIntoOctave(dominant.mKey.mRootKeyEnh.mKeyNr + dominant.mServes.mSemitones);
    return chord.mRootKeyEnh.mKeyNr == served ||
           (chord.HasBassNote() && chord.mBassKeyEnh.mKeyNr == served);
}

TLink LinkOf(const CChordReading& chord, const CChordReading& target,
             const CChordLite& targetChord) {
    if (chord.mDeceptive) return TLink::None;
    const bool targetStands = StandsForDominant(target.mRelation);
    if (chord.mRelation == TChordRelation_RelatedSecond) {
        return targetStands ? TLink::DottedBracket : TLink::Bracket;
    }
    // A dominant that goes on sounding in another form does not resolve: G7sus4 G7, C/G G7.
    const bool isSameGoal = chord.mKey == target.mKey && chord.mServes == target.mServes;
    const bool isStillDominant = isSameGoal && target.mFunction == THarmFunction_Dominant &&
                                 (targetStands || target.mRelation == TChordRelation_Dominant ||
                                  target.mRelation == TChordRelation_LeadingDiminished);
    if (chord.mRelation == TChordRelation_Backdoor && target.mRelation == TChordRelation_Backdoor) {
        return TLink::DottedBracket;
    }
    if (isStillDominant) return TLink::None;
    if (chord.mRelation == TChordRelation_SubstituteDominant) return TLink::DottedArrow;
    const bool isDominant = chord.mRelation == TChordRelation_Dominant ||
                            chord.mRelation == TChordRelation_LeadingDiminished;
    return isDominant && IsServedBy(chord, targetChord) ? TLink::Arrow : TLink::None;
}

// Whether the chord is written once more directly behind.
bool GoesOn(const CSong& song, const CSongReading& reading, std::size_t chord) {
    return chord + 1 < reading.mChords.size() && chord + 1 < CountChords(song) &&
           static_cast<const CChordLite&>(song.mChords[chord]) == song.mChords[chord + 1] &&
           reading.mChords[chord] == reading.mChords[chord + 1];
}

}  // namespace

CSheetLinks MakeLinks(const CSong& song, const CSongReading& reading, const CSheet& sheet) {
    const std::size_t count = std::min(sheet.mDrawnAs.size(), reading.mChords.size());
    std::vector<CSheetLink> links(count);
    std::vector<TLink> kinds(count, TLink::None);
    for (std::size_t i = 0; i < count; ++i) {
        const CChordReading& chord = reading.mChords[i];
        const bool leads =
            chord.mResolvesTo >= 0 && static_cast<std::size_t>(chord.mResolvesTo) < count;
        if (!leads) continue;
        const auto target = static_cast<std::size_t>(chord.mResolvesTo);
        const TLink kind = LinkOf(chord, reading.mChords[target], song.mChords[target]);
        const bool isBracket = kind == TLink::Bracket || kind == TLink::DottedBracket;
        // A bracket begins with the first of equal chords, an arrow with the last.
        if (kind == TLink::None || (!isBracket && GoesOn(song, reading, i))) continue;
        if (isBracket && i > 0 && GoesOn(song, reading, i - 1)) continue;
        const std::size_t from = sheet.mDrawnAs[i];
        const std::size_t to = sheet.mDrawnAs[target];
        if (kinds[from] != TLink::None && links[from].mTo != kNone) continue;
        kinds[from] = kind;
        const bool isDotted = kind == TLink::DottedArrow || kind == TLink::DottedBracket;
        links[from] = {from, to > from ? to : kNone, isDotted};
    }
    CSheetLinks drawn;
    std::vector<std::size_t> lastSource(count, kNone);
    const auto isArrow = [&](std::size_t chord) {
        return kinds[chord] == TLink::Arrow || kinds[chord] == TLink::DottedArrow;
    };
    for (std::size_t i = 0; i < count; ++i) {
        if (isArrow(i) && links[i].mTo != kNone) lastSource[links[i].mTo] = i;
    }
    for (std::size_t i = 0; i < count; ++i) {
        if (isArrow(i)) {
            const bool isLast = links[i].mTo == kNone || lastSource[links[i].mTo] == i;
            if (isLast) drawn.mArrows.push_back(links[i]);
        } else if (kinds[i] != TLink::None && links[i].mTo != kNone) {
            drawn.mBrackets.push_back(links[i]);
        }
    }
    return drawn;
}

}  // namespace brindle::LeadSheet
