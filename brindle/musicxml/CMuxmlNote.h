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
    std::int32_t mPositionAsMidiTicks = kMuxmlUndef;
    std::int32_t mLengthAsMidiTicks = kMuxmlUndef;
    std::int32_t mLengthAsDuration = kMuxmlUndef;  ///< in units of the file
    std::int32_t mPositionDisplayOffsetAsMidiTicks = kMuxmlUndef;
    std::int32_t mLengthDisplayOffsetAsMidiTicks = kMuxmlUndef;
    std::uint8_t mMidiChannel = 255;
    std::int64_t mNoteNr = -1;  ///< as it sounds, 0 to 127
    CMuxmlPitch mPitch;         ///< as it is written
    CMuxmlUnpitched mUnpitched;
    CMuxmlAccidental mAccidental;
    std::uint8_t mVelocity = 255;       ///< 1 to 127
    float mVelocityAsDynamics = -1.0F;  ///< percent of the velocity 90
    std::uint8_t mRelVelocity = 255;    ///< of the release, 0 to 129
    float mRelVelocityAsEndDynamics = -1.0F;
    std::int32_t mStaff = 0;
    std::int32_t mVoice = 0;
    bool mIsGraceNote = false;
    bool mIsCueNote = false;
    bool mIsChordNote = false;  ///< starts with the note before it
    TMuxmlEnum_NoteType mNoteType = TMuxmlEnum_NoteType_Undefined;
    CMuxmlGraphicalNoteType mGraphicalNoteType;
    std::int32_t mDots = 0;
    CMuxmlTimeModification mTimeModification;
    CMuxmlFermata mFermata;
    CMuxmlTuplet mTuplet;
    CMuxmlStem mStem;
    std::vector<TMuxmlEnum_StartStop> mNoteTies;
    CMuxmlAccent mAccent;
    CMuxmlBreathMark mBreathMark;
    CMuxmlCeasura mCaesura;
    CMuxmlDetachedLegato mDetachedLegato;
    CMuxmlDoit mDoit;
    CMuxmlFallOff mFallOff;
    CMuxmlPlop mPlop;
    CMuxmlScoop mScoop;
    CMuxmlStrongAccent mStrongAccent;
    CMuxmlTenuto mTenuto;
    CMuxmlStaccato mStaccato;
    CMuxmlStaccatissimo mStaccatissimo;
    XmlNode mNoteXML;
    std::vector<XmlNode> mLyricXMLs;
    std::vector<XmlNode> mNotationsXMLs;
    XmlNode mNoteheadXML;
    XmlNode mNoteheadTextXML;

    /// The note number as it is written; for unpitched notes and rests the one of their place on
    /// the staff, -1 where there is none.
    [[nodiscard]] std::int64_t ConvertToNoteNrLarge(const CMuxmlSignKey& signKey) const;

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
