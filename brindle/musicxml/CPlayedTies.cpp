// SPDX-License-Identifier: MIT
#include "brindle/musicxml/CPlayedTies.h"

#include "brindle/musicxml/MuxmlLimits.h"
#include "brindle/musicxml/internal/ReadMuxml.h"
#include "brindle/platform/SortByNumber.h"

#include <algorithm>

namespace brindle {

namespace {

bool HasTie(const CMuxmlNote& note, TMuxmlEnum_StartStop tie) {
    return std::find(note.mNoteTies.begin(), note.mNoteTies.end(), tie) != note.mNoteTies.end();
}

}  // namespace

std::optional<CMuxmlNote> CPlayedTies::Take(const CMuxmlNote& note) {
    const CTiedPitch pitch = CTiedPitch::Of(note);
    const std::int32_t begin = note.mPositionAsMidiTicks;
    const std::int32_t end = muxml::WrappedSum(begin, note.mLengthAsMidiTicks);
    CMuxmlNote played = note;
    if (HasTie(note, TMuxmlEnum_StartStop_Stop)) {
        if (const auto open = mOpen.find({pitch, begin}); open != mOpen.end()) {
            played = std::move(open->second);
            mOpen.erase(open);
            played.mLengthAsMidiTicks =
                muxml::WrappedSum(played.mLengthAsMidiTicks, note.mLengthAsMidiTicks);
        }
    }
    const bool leadsOn = HasTie(note, TMuxmlEnum_StartStop_Start) &&
                         note.mLengthAsMidiTicks != kMuxmlUndef &&
                         mOpen.size() < kMuxmlMaxPendingNotes;
    if (!leadsOn) return played;
    mOpen.emplace(TPitchAndEnd(pitch, end), std::move(played));
    return std::nullopt;
}

std::vector<CMuxmlNote> CPlayedTies::NotesLeftOpen() const {
    std::vector<CMuxmlNote> notes;
    for (const auto& [where, note] : mOpen) notes.push_back(note);
    SortByNumber(notes, [](const CMuxmlNote& note) { return note.mPositionAsMidiTicks; });
    return notes;
}

}  // namespace brindle
