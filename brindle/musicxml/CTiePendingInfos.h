// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/CMuxmlNote.h"

#include <compare>
#include <cstddef>
#include <list>
#include <map>
#include <vector>

namespace brindle {

/// A chain of tied notes that has not ended yet.
struct CTiePendingInfo {
    std::int32_t mStaff = 0;  ///< of all its notes, as the next two
    std::int32_t mVoice = 0;  ///< as the file numbers it
    CMuxmlPitch mPitch;       ///< as it is written: C sharp does not go on as D flat
    /// Of its notes so far together, in units of the file.
    std::int32_t mPendingLengthAsDuration = 0;
    std::int32_t mPendingLengthAsMidiTicks = 0;  ///< the same in ticks
    std::vector<XmlNode> mNoteXMLs;              ///< the elements of its notes
    std::vector<CMuxmlNote> mNotes;              ///< the first one first

    /// Makes the closing note of the chain stand for the whole: it becomes the first note, but
    /// keeps its own place and length, and the longer of both graphical types. The lyrics of the
    /// chain are copied below the element of the note, as long as there is `room` for them, which
    /// is used up.
    void TransferRelevantObjectsToLastNote(CMuxmlNote& note, std::size_t& room) const;
};

/// What the notes of a tie have in common: their pitch as it is written, on one staff in one voice.
struct CTiedPitch {
    std::int32_t mStaff = 0;                        ///< from 0, the highest one
    std::int32_t mVoice = 0;                        ///< as the file numbers it
    TMuxmlEnum_Step mStep = TMuxmlEnum_Step_Undef;  ///< undefined for an unpitched note
    float mAlteration = 0.0F;                       ///< in semitones
    std::int32_t mOctave = 0;                       ///< as it is written

    /// What a note would be tied by.
    [[nodiscard]] static CTiedPitch Of(const CMuxmlNote& note);

    friend auto operator<=>(const CTiedPitch&, const CTiedPitch&) = default;
};

/// The chains of tied notes that are open while a part is read. Notes belong to one chain when
/// staff, voice and written pitch are the same.
///
/// Several chains may be open on one pitch; only the one that was opened first is ever asked for.
/// They are therefore kept by pitch, in their order of opening, so that a file in which no tie ends
/// does not become slow.
class CTiePendingInfos {
public:
    /// Opens a chain, unless kMuxmlMaxPendingNotes notes wait already.
    void StartEncounteredFor(const CMuxmlNote& note, std::int32_t ticks);
    /// Adds the note to its chain, if there is one.
    void ContinueEncounteredFor(const CMuxmlNote& note, std::int32_t ticks);
    /// The chain of the note; null when there is none.
    [[nodiscard]] const CTiePendingInfo* PendingDurationFor(const CMuxmlNote& note) const;
    /// To be changed in place.
    [[nodiscard]] CTiePendingInfo* PendingDurationFor(const CMuxmlNote& note);
    /// Forgets the chain of the note, if there is one.
    void StopEncounteredFor(const CMuxmlNote& note);

    /// Open chains, several on one pitch each for itself.
    [[nodiscard]] std::size_t size() const { return mCount; }
    [[nodiscard]] bool empty() const { return mCount == 0; }  ///< whether no chain is open

private:
    std::map<CTiedPitch, std::list<CTiePendingInfo>> mInfos;  ///< no list is empty
    std::size_t mCount = 0;
    std::size_t mNoteCount = 0;  ///< of all chains together
};

}  // namespace brindle
