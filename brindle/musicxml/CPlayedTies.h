// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/CMuxmlNote.h"
#include "brindle/musicxml/CTiePendingInfos.h"

#include <cstdint>
#include <map>
#include <optional>
#include <utility>
#include <vector>

namespace brindle {

/// The tied notes of a part as they are heard: a tie leads from a note to one of the same staff,
/// voice and written pitch that begins where it ends. A tie to a note that begins elsewhere leads
/// nowhere, and both notes are played as they are written.
class CPlayedTies {
public:
    /// Takes a note that has ties, with its place and length in ticks as written. Gives the note
    /// that is played when none can follow: the first one of its chain with the length of all.
    /// A tie that is left open counts as none while kMuxmlMaxPendingNotes others wait.
    [[nodiscard]] std::optional<CMuxmlNote> Take(const CMuxmlNote& note);

    /// The notes whose ties lead nowhere, with the length of what is tied to them, by position.
    [[nodiscard]] std::vector<CMuxmlNote> NotesLeftOpen() const;

private:
    using TPitchAndEnd = std::pair<CTiedPitch, std::int32_t>;

    std::multimap<TPitchAndEnd, CMuxmlNote> mOpen;
};

}  // namespace brindle
