// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/CMuxmlPitch.h"
#include "brindle/musicxml/CMuxmlTuplet.h"
#include "brindle/musicxml/CMuxmlUnpitched.h"
#include "brindle/musicxml/MuxmlNotations.h"
#include "brindle/platform/XmlDocument.h"

#include <vector>

namespace brindle {

/// One note as it sounds: its place and length in time, its pitch and loudness, and how it is
/// written. Positions are ticks from the start of the part.
struct CMuxmlNote {
    /// Of a tied note, where the first of the chain begins.
    std::int32_t mPositionAsMidiTicks = kMuxmlUndef;
    /// Of a tied note, of the whole chain.
    std::int32_t mLengthAsMidiTicks = kMuxmlUndef;
    std::int32_t mLengthAsDuration = kMuxmlUndef;  ///< in units of the file
    /// How much later than written the note is played. Kept: read from an element `attack`, while
    /// MusicXML has an attribute of that name, so that its files leave it undefined.
    std::int32_t mPositionDisplayOffsetAsMidiTicks = kMuxmlUndef;
    /// How much longer than written it is played; likewise from an element `release`.
    std::int32_t mLengthDisplayOffsetAsMidiTicks = kMuxmlUndef;
    /// 0 for each note that sounds, 255 for rests.
    std::uint8_t mMidiChannel = 255;
    std::int64_t mNoteNr = -1;  ///< as it sounds, 0 to 127
    CMuxmlPitch mPitch;         ///< as it is written
    /// Of a note without pitch, its place on the staff.
    CMuxmlUnpitched mUnpitched;
    /// The accidental that is printed.
    CMuxmlAccidental mAccidental;
    std::uint8_t mVelocity = 255;       ///< 1 to 127
    float mVelocityAsDynamics = -1.0F;  ///< percent of the velocity 90
    std::uint8_t mRelVelocity = 255;    ///< of the release, 0 to 129
    /// The same of the release; -1 where the file tells none.
    float mRelVelocityAsEndDynamics = -1.0F;
    /// The staff of its part, from 1; 0 where the file tells none.
    std::int32_t mStaff = 0;
    /// The voice, as the file numbers it; 0 where it tells none.
    std::int32_t mVoice = 0;
    /// It takes its time from a neighbour.
    bool mIsGraceNote = false;
    /// It is printed small and not played.
    bool mIsCueNote = false;
    bool mIsChordNote = false;  ///< starts with the note before it
    /// A note with pitch, one without, or a rest.
    TMuxmlEnum_NoteType mNoteType = TMuxmlEnum_NoteType_Undefined;
    /// The note value that is printed.
    CMuxmlGraphicalNoteType mGraphicalNoteType;
    /// Behind the note, each half of what is before it.
    std::int32_t mDots = 0;
    /// How many notes are played in the time of how many.
    CMuxmlTimeModification mTimeModification;
    /// The note is held.
    CMuxmlFermata mFermata;
    /// The sign over a group of notes that begins or ends here.
    CMuxmlTuplet mTuplet;
    /// The way its stem points.
    CMuxmlStem mStem;
    /// Ties to the next note and from the one before it.
    std::vector<TMuxmlEnum_StartStop> mNoteTies;
    /// A wedge: louder.
    CMuxmlAccent mAccent;
    /// A comma: breathe behind the note.
    CMuxmlBreathMark mBreathMark;
    /// Two strokes: a short silence behind the note.
    CMuxmlCeasura mCaesura;
    /// A line with a dot: long and yet apart.
    CMuxmlDetachedLegato mDetachedLegato;
    /// It slides up when it ends.
    CMuxmlDoit mDoit;
    /// It slides down when it ends.
    CMuxmlFallOff mFallOff;
    /// It is reached from above.
    CMuxmlPlop mPlop;
    /// It is reached from below.
    CMuxmlScoop mScoop;
    /// A steep wedge: much louder.
    CMuxmlStrongAccent mStrongAccent;
    /// A line: held for its whole length.
    CMuxmlTenuto mTenuto;
    /// A dot: short.
    CMuxmlStaccato mStaccato;
    /// A drop: very short.
    CMuxmlStaccatissimo mStaccatissimo;
    /// The element of the note in the file.
    XmlNode mNoteXML;
    /// The elements of its syllables.
    std::vector<XmlNode> mLyricXMLs;
    /// The elements of the signs at it.
    std::vector<XmlNode> mNotationsXMLs;
    /// The element of an unusual head.
    XmlNode mNoteheadXML;
    /// The element of a text within the head.
    XmlNode mNoteheadTextXML;

    /// The note number as it is written; for unpitched notes and rests the one of their place on
    /// the staff, -1 where there is none.
    [[nodiscard]] std::int64_t ConvertToNoteNrLarge(const CMuxmlSignKey& signKey) const;

    /// By name, see CMuxmlField.
    static constexpr auto Fields() {
        return std::tuple(
            MuxmlField("mPositionAsMidiTicks", &CMuxmlNote::mPositionAsMidiTicks),
            MuxmlField("mLengthAsMidiTicks", &CMuxmlNote::mLengthAsMidiTicks),
            MuxmlField("mLengthAsDuration", &CMuxmlNote::mLengthAsDuration),
            MuxmlField("mPositionDisplayOffsetAsMidiTicks",
                       &CMuxmlNote::mPositionDisplayOffsetAsMidiTicks),
            MuxmlField("mLengthDisplayOffsetAsMidiTicks",
                       &CMuxmlNote::mLengthDisplayOffsetAsMidiTicks),
            MuxmlField("mMidiChannel", &CMuxmlNote::mMidiChannel),
            MuxmlField("mNoteNr", &CMuxmlNote::mNoteNr), MuxmlField("mPitch", &CMuxmlNote::mPitch),
            MuxmlField("mUnpitched", &CMuxmlNote::mUnpitched),
            MuxmlField("mAccidental", &CMuxmlNote::mAccidental),
            MuxmlField("mVelocity", &CMuxmlNote::mVelocity),
            MuxmlField("mVelocityAsDynamics", &CMuxmlNote::mVelocityAsDynamics),
            MuxmlField("mRelVelocity", &CMuxmlNote::mRelVelocity),
            MuxmlField("mRelVelocityAsEndDynamics", &CMuxmlNote::mRelVelocityAsEndDynamics),
            MuxmlField("mStaff", &CMuxmlNote::mStaff), MuxmlField("mVoice", &CMuxmlNote::mVoice),
            MuxmlField("mIsGraceNote", &CMuxmlNote::mIsGraceNote),
            MuxmlField("mIsCueNote", &CMuxmlNote::mIsCueNote),
            MuxmlField("mIsChordNote", &CMuxmlNote::mIsChordNote),
            MuxmlField("mNoteType", &CMuxmlNote::mNoteType),
            MuxmlField("mGraphicalNoteType", &CMuxmlNote::mGraphicalNoteType),
            MuxmlField("mDots", &CMuxmlNote::mDots),
            MuxmlField("mTimeModification", &CMuxmlNote::mTimeModification),
            MuxmlField("mFermata", &CMuxmlNote::mFermata),
            MuxmlField("mTuplet", &CMuxmlNote::mTuplet), MuxmlField("mStem", &CMuxmlNote::mStem),
            MuxmlField("mNoteTies", &CMuxmlNote::mNoteTies),
            MuxmlField("mAccent", &CMuxmlNote::mAccent),
            MuxmlField("mBreathMark", &CMuxmlNote::mBreathMark),
            MuxmlField("mCaesura", &CMuxmlNote::mCaesura),
            MuxmlField("mDetachedLegato", &CMuxmlNote::mDetachedLegato),
            MuxmlField("mDoit", &CMuxmlNote::mDoit), MuxmlField("mFallOff", &CMuxmlNote::mFallOff),
            MuxmlField("mPlop", &CMuxmlNote::mPlop), MuxmlField("mScoop", &CMuxmlNote::mScoop),
            MuxmlField("mStrongAccent", &CMuxmlNote::mStrongAccent),
            MuxmlField("mTenuto", &CMuxmlNote::mTenuto),
            MuxmlField("mStaccato", &CMuxmlNote::mStaccato),
            MuxmlField("mStaccatissimo", &CMuxmlNote::mStaccatissimo),
            MuxmlField("mNoteXML", &CMuxmlNote::mNoteXML),
            MuxmlField("mLyricXMLs", &CMuxmlNote::mLyricXMLs),
            MuxmlField("mNotationsXMLs", &CMuxmlNote::mNotationsXMLs),
            MuxmlField("mNoteheadXML", &CMuxmlNote::mNoteheadXML),
            MuxmlField("mNoteheadTextXML", &CMuxmlNote::mNoteheadTextXML));
    }
};

}  // namespace brindle
