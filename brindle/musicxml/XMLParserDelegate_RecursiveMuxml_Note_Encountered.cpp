// SPDX-License-Identifier: MIT
// What becomes of a note when its element has been read.

#include "brindle/musicxml/XMLParserDelegate_RecursiveMuxml_Note.h"
#include "brindle/musicxml/internal/CScoreIndex.h"
#include "brindle/musicxml/internal/ReadMuxml.h"
#include "brindle/theory/CNote.h"

#include <algorithm>
#include <utility>

namespace brindle {

namespace {

using TNote = XMLParserDelegate_RecursiveMuxml_Note;

constexpr float kNoDynamics = -1.0F;
constexpr std::uint8_t kVelocityOfAccent = 105;
constexpr std::uint8_t kNoVelocity = 255;

bool Holds(const std::vector<TMuxmlEnum_StartStop>& ties, TMuxmlEnum_StartStop tie) {
    return std::find(ties.begin(), ties.end(), tie) != ties.end();
}

}  // namespace

void TNote::encounteredNote() {
    if (EncounteredNote.mNoteType == TMuxmlEnum_NoteType_Undefined) return;
    SetElements();
    std::int32_t ticks =
        Context().ConvertMuxmlDurationToMidiTicks(EncounteredNote.mLengthAsDuration);
    TDeliver deliver = TDeliver_No;
    if (!EncounteredNote.mIsChordNote) {
        Context().WrittenChordPosAsMidiTicks = Context().CurrentPosAsMidiTicks;
    }
    if (EncounteredNote.mNoteType != TMuxmlEnum_NoteType_Rest) {
        EncounteredNote.mMidiChannel = Context().CurrentMidiChannel;
        SetNoteNr();
        SetVelocities();
        if (!EncounteredNote.mIsGraceNote) PlayAsWritten(ticks);
        deliver = SetPlaceAndJoinTies(ticks);
    }
    GatherInfo();
    if (deliver == TDeliver_Yes) {
        TellHost<&brindle::MusicXmlParserDelegate::didEncounterNote>(EncounteredNote);
    }
    AdvancePosition(ticks);
}

void TNote::SetElements() {
    EncounteredNote.mNoteXML = Context().CurrentPartMeasureNoteXMLs();
    EncounteredNote.mLyricXMLs = EncounteredNote.mNoteXML.descendants("lyric");
}

void TNote::SetNoteNr() {
    std::int64_t noteNr = EncounteredNote.ConvertToNoteNrLarge(Context().CurrentSignKey);
    if (noteNr >= 0) {
        const CMuxmlTranspose& transpose = Context().CurrentTranspose;
        noteNr =
            muxml::TruncatedToLargeInteger(transpose.mChromatic + static_cast<float>(noteNr) +
                                           static_cast<float>(transpose.mOctaveChange) * 12.0F);
    }
    // Kept: what comes out as -1 counts as no note, while -2 becomes note 0.
    if (noteNr != kNoteNrUndef) noteNr = std::clamp<std::int64_t>(noteNr, 0, 127);
    EncounteredNote.mNoteNr = noteNr;
}

void TNote::SetVelocities() {
    CMuxmlNote& note = EncounteredNote;
    std::uint8_t velocity = kNoVelocity;
    if (note.mVelocityAsDynamics != kNoDynamics) {
        velocity = MusicXmlContext::ConvertMuxmlDynamicsToMidiVelocity(
            muxml::TruncatedToInteger(note.mVelocityAsDynamics));
    }
    if (velocity == kNoVelocity) {
        const bool hasAccent = note.mAccent.mExists || note.mStrongAccent.mExists;
        velocity =
            hasAccent ? kVelocityOfAccent : Context().VelocityFromDynamics.VelocityForNote(note);
    }
    note.mVelocity = velocity;
    if (note.mRelVelocityAsEndDynamics != kNoDynamics) {
        note.mRelVelocity = MusicXmlContext::ConvertMuxmlDynamicsToMidiRelVelocity(
            muxml::TruncatedToInteger(note.mRelVelocityAsEndDynamics));
    }
}

// Each note has the ties that are written at it. Its place and length are those of the event import
// again behind this.
void TNote::PlayAsWritten(std::int32_t ticks) {
    CMuxmlNote& note = EncounteredNote;
    note.mPositionAsMidiTicks = Context().WrittenChordPosAsMidiTicks;
    note.mLengthAsMidiTicks = ticks;
    if (note.mNoteTies.empty()) {
        TellHost<&brindle::MusicXmlParserDelegate::didPlayNote>(note);
    } else if (const auto played = Context().PlayedTies.Take(note)) {
        TellHost<&brindle::MusicXmlParserDelegate::didPlayNote>(*played);
    }
    note.mPositionAsMidiTicks = kMuxmlUndef;
    note.mLengthAsMidiTicks = kMuxmlUndef;
}

// A chain of tied notes reaches the host once, when it closes, as one note with the length of all.
TNote::TDeliver TNote::SetPlaceAndJoinTies(std::int32_t& ticks) {
    MusicXmlContext& context = Context();
    CMuxmlNote& note = EncounteredNote;
    const std::int32_t position =
        note.mIsChordNote ? context.LastPosAsMidiTicks : context.CurrentPosAsMidiTicks;
    if (note.mIsGraceNote) return SetPlaceOfGraceNote(position, ticks);

    // A chord whose first note is tied ties all its notes.
    const bool inheritsTies = note.mIsChordNote && note.mNoteTies.empty();
    const auto& ties = inheritsTies ? context.CurrentFirstChordNote.mNoteTies : note.mNoteTies;
    const bool starts = Holds(ties, TMuxmlEnum_StartStop_Start);
    const bool stops = Holds(ties, TMuxmlEnum_StartStop_Stop);
    if (stops && !starts) return CloseChain(position, ticks);
    note.mPositionAsMidiTicks = position;
    if (starts && stops) context.TiePendingInfos.ContinueEncounteredFor(note, ticks);
    if (starts && !stops) context.TiePendingInfos.StartEncounteredFor(note, ticks);
    if (!ties.empty()) return TDeliver_No;
    note.mLengthAsMidiTicks = ticks;
    return TDeliver_Yes;
}

// Grace notes steal the time before the beat. Ties on them are not looked at.
TNote::TDeliver TNote::SetPlaceOfGraceNote(std::int32_t position, std::int32_t& ticks) {
    ticks = Context().TicksPerQuarter / 8;
    EncounteredNote.mLengthAsMidiTicks = ticks;
    EncounteredNote.mPositionAsMidiTicks = std::max(0, muxml::WrappedDifference(position, ticks));
    TellHost<&brindle::MusicXmlParserDelegate::didPlayNote>(EncounteredNote);
    return TDeliver_Yes;
}

TNote::TDeliver TNote::CloseChain(std::int32_t position, std::int32_t& ticks) {
    MusicXmlContext& context = Context();
    CMuxmlNote& note = EncounteredNote;
    if (const CTiePendingInfo* const chain = context.TiePendingInfos.PendingDurationFor(note)) {
        const std::int32_t chainTicks = chain->mPendingLengthAsMidiTicks;
        const std::int32_t chainDuration = chain->mPendingLengthAsDuration;
        note.mLengthAsDuration = muxml::WrappedSum(note.mLengthAsDuration, chainDuration);
        ticks = muxml::WrappedSum(ticks, chainTicks);
        note.mLengthAsMidiTicks = ticks;
        chain->TransferRelevantObjectsToLastNote(note, Index().mLyricRoom);
        // Kept: the record is that of the chain's first note by now, and so is its chord flag.
        if (!note.mIsChordNote) {
            position = muxml::WrappedDifference(position, chainTicks);
            context.AdvanceCurrentPosEvenBeforeBarStartByMidiTicks(
                muxml::WrappedDifference(0, chainTicks),
                muxml::WrappedDifference(0, chainDuration));
        }
    }
    context.TiePendingInfos.StopEncounteredFor(note);
    note.mPositionAsMidiTicks = position;
    return TDeliver_Yes;
}

void TNote::GatherInfo() const {
    const MusicXmlContext& context = Context();
    const CMuxmlNote& note = EncounteredNote;
    CMuxmlPartGatheredInfo& info = *Context().CurrentPartGatheredInfo();
    info.mFoundVoices.insert(note.mVoice);
    if (!note.mTimeModification.Exists() || note.mTimeModification.IsPlainTriplet()) {
        // Negative numbers are widened with their sign before they wrap around.
        const auto fraction = [&context](std::int64_t duration) {
            return CMuxmlPartGatheredInfo::TAsDurDiv(
                static_cast<unsigned long>(duration),
                static_cast<unsigned long>(4 * context.CurrentDivisionsPQN));
        };
        info.mFoundBinaryAndTripletNotePosInBarAsDurDiv.insert(
            fraction(context.CurrentPosInBarAsDuration));
        info.mFoundBinaryAndTripletNoteLengthsAsDurDiv.insert(fraction(note.mLengthAsDuration));
    }
    info.mFoundTransposeNoteCounts.Add(context.CurrentTranspose, 1);
    if (info.mLowestNoteNr == kNoteNrUndef || info.mLowestNoteNr > note.mNoteNr) {
        info.mLowestNoteNr = note.mNoteNr;
    }
    if (info.mHighestNoteNr == kNoteNrUndef || info.mHighestNoteNr < note.mNoteNr) {
        info.mHighestNoteNr = note.mNoteNr;
    }
}

void TNote::AdvancePosition(std::int32_t ticks) {
    if (EncounteredNote.mIsChordNote) return;
    const bool advances = !EncounteredNote.mIsCueNote && !EncounteredNote.mIsGraceNote;
    const std::int32_t duration = EncounteredNote.mLengthAsDuration;
    Context().CurrentFirstChordNote = std::move(EncounteredNote);
    if (advances) Context().AdvanceCurrentPosByMidiTicks(ticks, duration);
}

}  // namespace brindle
