// SPDX-License-Identifier: MIT
#include "brindle/musicxml/CTiePendingInfos.h"

#include "brindle/musicxml/MuxmlLimits.h"
#include "brindle/musicxml/internal/ReadMuxml.h"

#include <algorithm>
#include <utility>

namespace brindle {

namespace {

void CopyLyrics(const XmlNode& from, CMuxmlNote& note, std::size_t& room) {
    if (room == 0) return;
    for (const XmlNode& lyric : from.descendants("lyric")) {
        if (const XmlNode copy = note.mNoteXML.addCopyOf(lyric, room)) {
            note.mLyricXMLs.push_back(copy);
        }
    }
}

void BecomeFirstNote(CMuxmlNote& note, const CMuxmlNote& first) {
    const std::int32_t position = note.mPositionAsMidiTicks;
    const std::int32_t length = note.mLengthAsMidiTicks;
    const std::int32_t duration = note.mLengthAsDuration;
    const TMuxmlEnum_NoteTypeValue type = note.mGraphicalNoteType.mValue;
    note = first;
    note.mPositionAsMidiTicks = position;
    note.mLengthAsMidiTicks = length;
    // Kept: the duration goes through a float and may lose its last digits.
    note.mLengthAsDuration = muxml::TruncatedToInteger(static_cast<float>(duration));
    note.mGraphicalNoteType.mValue = std::max(type, note.mGraphicalNoteType.mValue);
}

}  // namespace

void CTiePendingInfo::TransferRelevantObjectsToLastNote(CMuxmlNote& note, std::size_t& room) const {
    bool isFirstNote = false;
    for (const XmlNode& element : mNoteXMLs) {
        CopyLyrics(element, note, room);
        if (mNotes.empty()) continue;
        // Kept: from the second round on, the element of the note is that of the first note, and
        // the lyrics that a round has added to the list are dropped again.
        const CMuxmlNote& first = mNotes.front();
        if (!std::exchange(isFirstNote, true)) BecomeFirstNote(note, first);
        note.mLyricXMLs.resize(first.mLyricXMLs.size());
    }
}

CTiedPitch CTiedPitch::Of(const CMuxmlNote& note) {
    return {note.mStaff, note.mVoice, note.mPitch.mStep, note.mPitch.mAlteration,
            note.mPitch.mOctave};
}

void CTiePendingInfos::StartEncounteredFor(const CMuxmlNote& note, std::int32_t ticks) {
    if (mNoteCount >= kMuxmlMaxPendingNotes) return;
    CTiePendingInfo& info = mInfos[CTiedPitch::Of(note)].emplace_back();
    ++mCount;
    ++mNoteCount;
    info.mStaff = note.mStaff;
    info.mVoice = note.mVoice;
    info.mPitch = note.mPitch;
    info.mPendingLengthAsDuration = note.mLengthAsDuration;
    info.mPendingLengthAsMidiTicks = ticks;
    if (note.mNoteXML) info.mNoteXMLs.push_back(note.mNoteXML);
    info.mNotes.push_back(note);
}

void CTiePendingInfos::ContinueEncounteredFor(const CMuxmlNote& note, std::int32_t ticks) {
    CTiePendingInfo* const info = PendingDurationFor(note);
    if (info == nullptr) return;
    info->mPendingLengthAsDuration =
        muxml::WrappedSum(info->mPendingLengthAsDuration, note.mLengthAsDuration);
    info->mPendingLengthAsMidiTicks = muxml::WrappedSum(info->mPendingLengthAsMidiTicks, ticks);
    if (mNoteCount >= kMuxmlMaxPendingNotes) return;
    ++mNoteCount;
    if (note.mNoteXML) info->mNoteXMLs.push_back(note.mNoteXML);
    info->mNotes.push_back(note);
}

const CTiePendingInfo* CTiePendingInfos::PendingDurationFor(const CMuxmlNote& note) const {
    const auto it = mInfos.find(CTiedPitch::Of(note));
    return it == mInfos.end() ? nullptr : &it->second.front();
}

CTiePendingInfo* CTiePendingInfos::PendingDurationFor(const CMuxmlNote& note) {
    const auto it = mInfos.find(CTiedPitch::Of(note));
    return it == mInfos.end() ? nullptr : &it->second.front();
}

void CTiePendingInfos::StopEncounteredFor(const CMuxmlNote& note) {
    const auto it = mInfos.find(CTiedPitch::Of(note));
    if (it == mInfos.end()) return;
    mNoteCount -= std::min(mNoteCount, it->second.front().mNotes.size());
    it->second.pop_front();
    --mCount;
    if (it->second.empty()) mInfos.erase(it);
}

}  // namespace brindle
